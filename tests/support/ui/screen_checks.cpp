#include "support/ui/screen_checks.h"

#include <gtest/gtest.h>

#include <QAbstractButton>
#include <QAbstractItemView>
#include <QAbstractScrollArea>
#include <QAbstractSpinBox>
#include <QAccessible>
#include <QApplication>
#include <QComboBox>
#include <QDir>
#include <QLabel>
#include <QLineEdit>
#include <QPlainTextEdit>
#include <QToolButton>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// What of a widget has a name for those who do not see it: its own, its text, or the label that leads to it.
QString NameOf(QWidget& widget)
{
    const QAccessibleInterface* read = QAccessible::queryAccessibleInterface(&widget);
    return read ? read->text(QAccessible::Name) : widget.accessibleName();
}

bool IsPartOfAnother(const QWidget& widget)
{
    const QWidget* parent = widget.parentWidget();
    return widget.objectName().startsWith(u"qt_") || qobject_cast<const QComboBox*>(parent) ||
           qobject_cast<const QAbstractSpinBox*>(parent) || qobject_cast<const QAbstractItemView*>(parent) ||
           (parent && parent->inherits("QTabBar")) || (parent && parent->inherits("QLineEdit")) ||
           widget.inherits("QTabBar") || widget.inherits("QScrollBar") || widget.inherits("QHeaderView");
}

void ExpectWithin(QWidget& part, QWidget& whole, const std::string& where)
{
    const QRect place(part.mapTo(&whole, QPoint()), part.size());
    EXPECT_GE(place.left(), 0) << where;
    EXPECT_LE(place.right(), whole.width()) << where << ": " << place.right();
    bool scrolls = false;
    for (const QWidget* over = part.parentWidget(); over && over != &whole; over = over->parentWidget())
        scrolls = scrolls || qobject_cast<const QAbstractScrollArea*>(over);
    if (!scrolls) {
        EXPECT_LE(place.bottom(), whole.height()) << where << ": " << place.bottom();
    }
}

void ExpectWholeText(QWidget& part, const QString& text, int widthPx, const std::string& where)
{
    if (text.isEmpty() || text.contains(u'…'))
        return;
    EXPECT_GE(part.width() + 1, widthPx) << where << " cuts \"" << text.toStdString() << "\"";
}

void ExpectReachable(QWidget& part, const std::string& where)
{
    const bool button = qobject_cast<QAbstractButton*>(&part);
    const bool operated = button || qobject_cast<QLineEdit*>(&part) || qobject_cast<QComboBox*>(&part) ||
                          qobject_cast<QAbstractItemView*>(&part) || qobject_cast<QPlainTextEdit*>(&part);
    const auto* line = qobject_cast<QLineEdit*>(&part);
    if (!operated || !part.isEnabled() || (line && line->isReadOnly()))
        return;
    EXPECT_FALSE(NameOf(part).isEmpty()) << where << " has no name";
    const auto* drawn = qobject_cast<const QAbstractButton*>(&part);
    if (drawn && drawn->text().isEmpty() && !drawn->icon().isNull()) {
        EXPECT_FALSE(part.toolTip().isEmpty()) << where << " is an icon that does not say what it does";
    }
    // The button of a date or of a long text has its keys in the box; tool bars and the corner of a menu bar offer
    // what menus do, too.
    const QWidget* parent = part.parentWidget();
    const bool hasKeyElsewhere =
        button && (parent->inherits("mirel::DateField") || part.objectName().endsWith(u".strip"_s) ||
                   parent->inherits("QToolBar") || parent->inherits("QMenuBar"));
    EXPECT_TRUE((part.focusPolicy() & Qt::TabFocus) || hasKeyElsewhere) << where << " is out of Tab's way";
}

} // namespace

void Paint(QWidget& shown, const QString& name)
{
    const QString folder = qEnvironmentVariable("MIREL_PICTURES");
    if (!folder.isEmpty()) {
        EXPECT_TRUE(shown.grab().save(QDir(folder).filePath(name + u".png"_s)));
    }
}

void ExpectFits(QWidget& whole, const QString& name, QSize screen)
{
    QApplication::processEvents();
    Paint(whole, u"%1-%2x%3"_s.arg(name, QString::number(screen.width()), QString::number(screen.height())));
    EXPECT_LE(whole.width(), screen.width()) << name.toStdString();
    EXPECT_LE(whole.height(), screen.height()) << name.toStdString();
    for (QWidget* part : whole.findChildren<QWidget*>()) {
        if (!part->isVisibleTo(&whole) || part->isWindow() || IsPartOfAnother(*part))
            continue;
        const std::string where =
            (name + u": "_s + QString::fromLatin1(part->metaObject()->className()) + u' ' + NameOf(*part))
                .toStdString();
        ExpectWithin(*part, whole, where);
        ExpectReachable(*part, where);
        if (const auto* label = qobject_cast<QLabel*>(part); label && !label->wordWrap())
            ExpectWholeText(*part, label->text(), label->sizeHint().width(), where);
        if (const auto* box = qobject_cast<QAbstractButton*>(part); box && !qobject_cast<QToolButton*>(part))
            ExpectWholeText(*part, box->text(),
                            box->fontMetrics().size(Qt::TextShowMnemonic, box->text()).width() + 8, where);
    }
}

} // namespace mirel
