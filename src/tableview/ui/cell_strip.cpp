#include "tableview/ui/cell_strip.h"

#include "platform/ui/date_field.h"
#include "platform/ui/hold_popup.h"
#include "platform/ui/look_roles.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

#include <QAction>
#include <QCheckBox>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QStyle>
#include <QToolButton>

namespace mirel {
namespace {

bool IsTyped(const QKeyEvent& event)
{
    const bool command = event.modifiers() & (Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier);
    return !command && !event.text().isEmpty() && event.text().front().isPrint();
}

} // namespace

CellStrip::CellStrip(const RecordBrowser& browser, QWidget* parent)
    : QWidget(parent)
    , browser_(browser)
    , label_(new QLabel(this))
    , field_(new DateField(this))
    , line_(field_->Line())
    , lossMark_(line_->addAction(style()->standardIcon(QStyle::SP_MessageBoxWarning), QLineEdit::TrailingPosition))
    , check_(new QCheckBox(this))
    , zoom_(new QToolButton(this))
{
    lossMark_->setVisible(false);
    connect(lossMark_, &QAction::triggered, this, &CellStrip::reasonRequested);
    zoom_->setIcon(ThemeIcon(u"zoom-in"));
    zoom_->setToolTip(StringText(Str::ZoomTip));
    zoom_->setFocusPolicy(Qt::TabFocus);
    line_->installEventFilter(this);
    new HoldPopup(line_, [this] { return browser_.Settings().holdTimeMs; });
    check_->installEventFilter(this);
    connect(field_, &DateField::textEdited, this, &CellStrip::textEdited);
    // Of a box without a value the first tap makes a tick.
    connect(check_, &QCheckBox::clicked, this, [this] { Q_EMIT checkEdited(!browser_.Edit().IsChecked()); });
    connect(zoom_, &QToolButton::clicked, this, [this] { Q_EMIT commandRequested(TableCommand::Zoom); });
    LayOut();
}

void CellStrip::LayOut()
{
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(spacing::kGap, spacing::kTight, spacing::kGap, 0);
    row->setSpacing(spacing::kGap);
    row->addWidget(label_);
    row->addWidget(field_, 1);
    row->addWidget(check_, 1);
    row->addWidget(zoom_);
}

bool CellStrip::ShowsTick() const
{
    return browser_.Edit().Kind() == EditorKind::Check && !browser_.ShowsResult();
}

QWidget* CellStrip::Editor() const
{
    return ShowsTick() ? static_cast<QWidget*>(check_) : line_;
}

void CellStrip::ShowState(bool zoomed)
{
    const CellEdit& edit = browser_.Edit();
    const bool result = browser_.ShowsResult();
    const bool isText = edit.Kind() == EditorKind::Text;
    const bool isDate = edit.Kind() == EditorKind::Date && !result;
    const bool hadFocus = HasEditorFocus();
    const bool editable = browser_.CanEdit() && !result;
    field_->setVisible(!ShowsTick() && !(zoomed && isText));
    field_->SetTakesDates(isDate && editable);
    check_->setVisible(ShowsTick());
    check_->setEnabled(editable);
    check_->setCheckState(edit.IsUnset() ? Qt::PartiallyChecked : edit.IsChecked() ? Qt::Checked : Qt::Unchecked);
    check_->setText(edit.IsUnset() ? StringText(Str::CellHasNoValue) : browser_.SelectedText());
    if (const QString& text = result ? browser_.ShownResult() : edit.Text(); line_->text() != text)
        line_->setText(text);
    if (!edit.IsPending() && !line_->hasFocus())
        line_->setCursorPosition(0);
    line_->setReadOnly(!editable);
    line_->setEnabled(edit.Kind() != EditorKind::None);
    const QString why = browser_.WhyNotStored();
    lossMark_->setVisible(!why.isEmpty());
    lossMark_->setToolTip(why.isEmpty() ? why : StringText(Str::ErrorMarkTip, {why}));
    zoom_->setText(StringText(zoomed ? Str::ZoomBack : Str::ZoomIn));
    zoom_->setEnabled(zoomed || isText);
    for (QWidget* editor : {static_cast<QWidget*>(line_), static_cast<QWidget*>(check_)})
        editor->setAccessibleName(browser_.FieldLabel());
    ShowLabel();
    if (hadFocus && !HasEditorFocus() && Editor()->isVisible())
        Editor()->setFocus();
}

void CellStrip::MarkRefused(bool refused)
{
    if (line_->property(kRefusedProperty).toBool() == refused)
        return;
    line_->setProperty(kRefusedProperty, refused);
    line_->update();
}

// A long name gives way to the editor, and can be read as a tool tip.
void CellStrip::ShowLabel()
{
    const QString name = browser_.FieldLabel();
    const int room = width() / 3;
    label_->setText(label_->fontMetrics().elidedText(name, Qt::ElideMiddle, room));
    label_->setToolTip(label_->text() == name ? QString() : name);
    zoom_->setToolButtonStyle(width() < 20 * fontMetrics().height() ? Qt::ToolButtonIconOnly
                                                                    : Qt::ToolButtonTextBesideIcon);
}

void CellStrip::resizeEvent(QResizeEvent*)
{
    ShowLabel();
}

bool CellStrip::HasEditorFocus() const
{
    return line_->hasFocus() || check_->hasFocus();
}

void CellStrip::BeginEdit()
{
    Editor()->setFocus(Qt::OtherFocusReason);
    line_->end(false);
}

void CellStrip::BeginTyping(const QString& text)
{
    line_->setFocus(Qt::OtherFocusReason);
    line_->setText(text);
    line_->end(false);
    Q_EMIT textEdited(text);
}

bool CellStrip::eventFilter(QObject* watched, QEvent* event)
{
    // With nothing of its own to undo the line leaves the key to the window.
    if (event->type() == QEvent::ShortcutOverride && watched == line_ && !line_->isUndoAvailable() &&
        static_cast<QKeyEvent*>(event)->matches(QKeySequence::Undo)) {
        event->ignore();
        return true;
    }
    if (event->type() != QEvent::KeyPress)
        return QWidget::eventFilter(watched, event);
    const auto* key = static_cast<QKeyEvent*>(event);
    const std::optional<TableCommand> command = CommandOfKey(KeyPlace::Editor, key->keyCombination());
    if (!command && browser_.ShowsResult() && IsTyped(*key)) {
        Q_EMIT typedOverResult(key->text());
        return true;
    }
    if (!command)
        return QWidget::eventFilter(watched, event);
    Q_EMIT commandRequested(*command);
    return true;
}

} // namespace mirel
