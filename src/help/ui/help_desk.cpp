#include "help/ui/help_desk.h"

#include "help/help_topics.h"
#include "help/ui/help_window.h"
#include "platform/ui/look_roles.h"
#include "resources/string_table.h"

#include <QAbstractButton>
#include <QApplication>
#include <QDialog>
#include <QDialogButtonBox>
#include <QHelpEvent>
#include <QKeyEvent>
#include <QLabel>
#include <QPushButton>
#include <QWhatsThis>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const QString kButtonName = u"helpOfDialog"_s;

QString ClassOf(const QWidget& widget)
{
    return QString::fromLatin1(widget.metaObject()->className()).section(u"::"_s, -1);
}

// The texts by which a control is known: its own, and those of the labels that lead to it.
QStringList LabelsOf(const QWidget& part, const QWidget& window)
{
    QStringList labels = {part.accessibleName()};
    if (const auto* button = qobject_cast<const QAbstractButton*>(&part))
        labels += button->text();
    for (const QLabel* label : window.findChildren<QLabel*>()) {
        if (label->buddy() == &part)
            labels += label->text();
    }
    return labels;
}

// On a small screen the dialog's own buttons come first; F1 is there in any case.
bool HasRoomForOneMore(const QDialogButtonBox& box, const QDialog& dialog)
{
    const QFontMetrics metrics = dialog.fontMetrics();
    int needed = 2 * metrics.height() + 2 * spacing::kRoom;
    for (const QAbstractButton* button : box.buttons()) {
        const int icon = button->icon().isNull() ? 0 : button->iconSize().width() + spacing::kTight;
        needed +=
            metrics.size(Qt::TextShowMnemonic, button->text()).width() + icon + spacing::kWide + spacing::kTight;
    }
    return needed <= dialog.width();
}

} // namespace

HelpDesk::HelpDesk(QApplication& application)
    : QObject(&application)
{
    application.installEventFilter(this);
}

QString HelpDesk::TextOf(const QWidget& part)
{
    const QWidget& window = *part.window();
    for (const QWidget* each = &part; each && each != &window; each = each->parentWidget()) {
        for (const QString& label : LabelsOf(*each, window)) {
            if (const std::optional<Str> text = HelpOfControl(ClassOf(window), label))
                return StringText(*text);
        }
    }
    for (const QWidget* each = &part; each && each != &window; each = each->parentWidget()) {
        if (!each->toolTip().isEmpty())
            return each->toolTip();
    }
    return {};
}

bool HelpDesk::eventFilter(QObject* watched, QEvent* event)
{
    switch (event->type()) {
    case QEvent::KeyPress:
    case QEvent::QueryWhatsThis:
    case QEvent::WhatsThis:
    case QEvent::Show:
        break;
    default: // nearly all of them
        return false;
    }
    auto* part = qobject_cast<QWidget*>(watched);
    if (!part)
        return false;
    if (event->type() == QEvent::KeyPress)
        return TakeKey(*part, *event);
    if (event->type() == QEvent::Show) {
        if (auto* dialog = qobject_cast<QDialog*>(part))
            OfferButton(*dialog);
        return false;
    }
    event->accept();
    if (event->type() == QEvent::WhatsThis)
        Explain(*part);
    return true;
}

bool HelpDesk::TakeKey(QWidget& part, const QEvent& event)
{
    const auto& key = static_cast<const QKeyEvent&>(event);
    if (key.key() != Qt::Key_F1)
        return false;
    if (key.modifiers() == Qt::ShiftModifier)
        Explain(part);
    else if (key.modifiers() == Qt::NoModifier)
        ShowHelp(part, HelpTopicOf(part));
    else
        return false;
    return true;
}

// Beside the control; where nothing is said of it, the page of its view.
void HelpDesk::Explain(QWidget& part)
{
    const QString text = TextOf(part);
    if (text.isEmpty()) {
        QWhatsThis::leaveWhatsThisMode(); // as showText does
        return ShowHelp(part, HelpTopicOf(part));
    }
    QWhatsThis::showText(part.mapToGlobal(QPoint(0, part.height())), text, &part);
}

void HelpDesk::OfferButton(QDialog& dialog)
{
    auto* buttons = dialog.findChild<QDialogButtonBox*>(QString(), Qt::FindDirectChildrenOnly);
    const bool hasPage = !HelpTopicOfClass(ClassOf(dialog)).isEmpty();
    if (!buttons || !hasPage || dialog.findChild<QWidget*>(kButtonName) || !HasRoomForOneMore(*buttons, dialog))
        return;
    auto* help = new QPushButton(u"?"_s, &dialog);
    help->setObjectName(kButtonName);
    help->setAutoDefault(false);
    help->setToolTip(StringText(Str::TipWithKeys, {StringText(Str::HelpOfDialogTip), u"F1"_s}));
    help->setAccessibleName(StringText(Str::HelpTitle));
    help->setFixedWidth(help->fontMetrics().height() * 2);
    buttons->addButton(help, QDialogButtonBox::HelpRole);
    connect(help, &QPushButton::clicked, &dialog, [&dialog] { ShowHelp(dialog, HelpTopicOf(dialog)); });
}

} // namespace mirel
