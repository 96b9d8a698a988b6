#include "tableview/ui/cell_strip.h"

#include "platform/ole_date.h"
#include "platform/ui/hold_popup.h"
#include "platform/user_locale.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

#include <QAction>
#include <QCalendarWidget>
#include <QCheckBox>
#include <QDate>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QStyle>
#include <QToolButton>
#include <QWidgetAction>

#include <cmath>
#include <limits>

namespace mirel {
namespace {

// The calendar changes the day of a value and leaves its time alone.
QString TextWithDay(const QString& text, QDate day)
{
    const UserLocale& locale = UserLocale::Current();
    const std::optional<double> before = locale.ParseDateTime(text);
    const std::optional<double> midnight = OleDate({day.year(), day.month(), day.day()});
    if (!midnight)
        return text;
    const double time = before ? std::abs(*before - std::trunc(*before)) : 0.0;
    return locale.DateTimeText(*midnight < 0 ? *midnight - time : *midnight + time);
}

// The day that the calendar opens on: the value's, else today.
QDate DayOf(const QString& text)
{
    const std::optional<double> date = UserLocale::Current().ParseDateTime(text);
    const std::optional<DateParts> parts = date ? PartsOfOleDate(*date) : std::nullopt;
    return parts ? QDate(parts->year, parts->month, parts->day) : QDate::currentDate();
}

} // namespace

CellStrip::CellStrip(const RecordBrowser& browser, QWidget* parent)
    : QWidget(parent)
    , browser_(browser)
    , label_(new QLabel(this))
    , line_(new QLineEdit(this))
    , lossMark_(line_->addAction(style()->standardIcon(QStyle::SP_MessageBoxWarning), QLineEdit::TrailingPosition))
    , calendarButton_(new QToolButton(this))
    , check_(new QCheckBox(this))
    , zoom_(new QToolButton(this))
{
    line_->setMaxLength(std::numeric_limits<int>::max()); // the longest memo passes through whole
    lossMark_->setToolTip(StringText(Str::EditLosesText));
    lossMark_->setVisible(false);
    calendarButton_->setArrowType(Qt::DownArrow);
    calendarButton_->setToolTip(StringText(Str::CalendarTip));
    calendarButton_->setAccessibleName(calendarButton_->toolTip());
    zoom_->setIcon(ThemeIcon(u"zoom-in"));
    zoom_->setToolTip(StringText(Str::ZoomTip));
    zoom_->setFocusPolicy(Qt::TabFocus);
    line_->installEventFilter(this);
    new HoldPopup(line_, [this] { return browser_.Settings().holdTimeMs; });
    check_->installEventFilter(this);
    connect(line_, &QLineEdit::textEdited, this, &CellStrip::textEdited);
    // Of a box without a value the first tap makes a tick.
    connect(check_, &QCheckBox::clicked, this, [this] { Q_EMIT checkEdited(!browser_.Edit().IsChecked()); });
    connect(calendarButton_, &QToolButton::clicked, this, &CellStrip::ShowCalendar);
    connect(zoom_, &QToolButton::clicked, this, [this] { Q_EMIT commandRequested(TableCommand::Zoom); });
    LayOut();
}

void CellStrip::LayOut()
{
    auto* row = new QHBoxLayout(this);
    const int side = style()->pixelMetric(QStyle::PM_LayoutLeftMargin) / 2;
    row->setContentsMargins(side, 0, side, 0);
    row->setSpacing(side);
    row->addWidget(label_);
    row->addWidget(line_, 1);
    row->addWidget(calendarButton_);
    row->addWidget(check_, 1);
    row->addWidget(zoom_);
}

QWidget* CellStrip::Editor() const
{
    return browser_.Edit().Kind() == EditorKind::Check ? static_cast<QWidget*>(check_) : line_;
}

void CellStrip::ShowState(bool zoomed)
{
    zoomed_ = zoomed;
    const CellEdit& edit = browser_.Edit();
    const bool isCheck = edit.Kind() == EditorKind::Check;
    const bool isText = edit.Kind() == EditorKind::Text;
    const bool hadFocus = HasEditorFocus();
    line_->setVisible(!isCheck && !(zoomed && isText));
    calendarButton_->setVisible(edit.Kind() == EditorKind::Date);
    calendarButton_->setEnabled(browser_.CanEdit());
    check_->setVisible(isCheck);
    check_->setEnabled(browser_.CanEdit());
    check_->setCheckState(edit.IsUnset() ? Qt::PartiallyChecked : edit.IsChecked() ? Qt::Checked : Qt::Unchecked);
    check_->setText(edit.IsUnset() ? StringText(Str::CellHasNoValue) : browser_.SelectedText());
    if (line_->text() != edit.Text())
        line_->setText(edit.Text());
    if (!edit.IsPending() && !line_->hasFocus())
        line_->setCursorPosition(0);
    line_->setReadOnly(!browser_.CanEdit());
    line_->setEnabled(edit.Kind() != EditorKind::None);
    line_->setPlaceholderText(edit.Kind() == EditorKind::Date ? UserLocale::Current().DateFormat() : QString());
    lossMark_->setVisible(edit.IsPending() && !edit.IsKeptWhole());
    zoom_->setText(StringText(zoomed ? Str::ZoomBack : Str::ZoomIn));
    zoom_->setEnabled(zoomed || isText);
    for (QWidget* editor : {static_cast<QWidget*>(line_), static_cast<QWidget*>(check_)})
        editor->setAccessibleName(browser_.FieldLabel());
    ShowLabel();
    if (hadFocus && !HasEditorFocus() && Editor()->isVisible())
        Editor()->setFocus();
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

void CellStrip::ShowCalendar()
{
    QMenu popup(this);
    auto* calendar = new QCalendarWidget(&popup);
    calendar->setLocale(UserLocale::Current().Locale());
    calendar->setFirstDayOfWeek(UserLocale::Current().Locale().firstDayOfWeek());
    calendar->setMinimumDate(QDate(1, 1, 1));
    calendar->setMaximumDate(QDate(9999, 12, 31));
    calendar->setSelectedDate(DayOf(line_->text()));
    auto* holder = new QWidgetAction(&popup);
    holder->setDefaultWidget(calendar);
    popup.addAction(holder);
    const auto take = [&](QDate day) {
        popup.close();
        BeginTyping(TextWithDay(line_->text(), day));
    };
    connect(calendar, &QCalendarWidget::clicked, &popup, take);
    connect(calendar, &QCalendarWidget::activated, &popup, [&](QDate day) {
        if (popup.isVisible())
            take(day);
    });
    calendar->setFocus();
    const QPoint below = calendarButton_->mapToGlobal(calendarButton_->rect().bottomLeft());
    popup.exec(below);
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
    if (!command)
        return QWidget::eventFilter(watched, event);
    Q_EMIT commandRequested(*command);
    return true;
}

} // namespace mirel
