#include "platform/ui/day_chooser.h"

#include "platform/ole_date.h"
#include "platform/ui/window_place.h"
#include "platform/user_locale.h"
#include "resources/ui/theme_icon.h"

#include <QCalendarWidget>
#include <QDate>
#include <QMenu>
#include <QScreen>
#include <QTextCharFormat>
#include <QToolButton>
#include <QWidgetAction>

#include <cmath>

namespace mirel {
namespace {

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

QDate DayOf(const QString& text)
{
    const std::optional<double> date = UserLocale::Current().ParseDateTime(text);
    const std::optional<DateParts> parts = date ? PartsOfOleDate(*date) : std::nullopt;
    return parts ? QDate(parts->year, parts->month, parts->day) : QDate::currentDate();
}

// No numbers of weeks, and letters for the days where the screen is small: seven columns fit 240 pixels.
void FitScreen(QCalendarWidget& calendar, const QScreen& screen)
{
    const bool small = IsHandheldSize(screen.availableSize());
    calendar.setVerticalHeaderFormat(QCalendarWidget::NoVerticalHeader);
    calendar.setHorizontalHeaderFormat(small ? QCalendarWidget::SingleLetterDayNames
                                             : QCalendarWidget::ShortDayNames);
    const QTextCharFormat plain; // Saturdays and Sundays are no warning
    calendar.setWeekdayTextFormat(Qt::Saturday, plain);
    calendar.setWeekdayTextFormat(Qt::Sunday, plain);
    // The style's arrows go with no palette of ours.
    for (const auto& [button, icon] :
         {std::pair("qt_calendar_prevmonth", u"go-previous"), std::pair("qt_calendar_nextmonth", u"go-next")}) {
        if (auto* arrow = calendar.findChild<QToolButton*>(QLatin1StringView(button)))
            arrow->setIcon(ThemeIcon(icon).pixmap(arrow->iconSize(), QIcon::Selected));
    }
    constexpr int kAroundPx = 8; // the popup's frame
    calendar.setMaximumSize(screen.availableSize() - QSize(kAroundPx, kAroundPx));
}

} // namespace

std::optional<QString> ChooseDay(const QString& text, QPoint globalPosition, QWidget& parent)
{
    QMenu popup(&parent);
    auto* calendar = new QCalendarWidget(&popup);
    const QLocale& locale = UserLocale::Current().Locale();
    calendar->setLocale(locale);
    calendar->setFirstDayOfWeek(locale.firstDayOfWeek());
    calendar->setMinimumDate(QDate(1, 1, 1));
    calendar->setMaximumDate(QDate(9999, 12, 31));
    calendar->setSelectedDate(DayOf(text));
    FitScreen(*calendar, *parent.screen());
    auto* holder = new QWidgetAction(&popup);
    holder->setDefaultWidget(calendar);
    popup.addAction(holder);
    std::optional<QString> chosen;
    const auto take = [&](QDate day) {
        chosen = TextWithDay(text, day);
        popup.close();
    };
    QObject::connect(calendar, &QCalendarWidget::clicked, &popup, take);
    QObject::connect(calendar, &QCalendarWidget::activated, &popup, take);
    calendar->setFocus();
    popup.exec(globalPosition);
    return chosen;
}

} // namespace mirel
