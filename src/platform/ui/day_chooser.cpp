#include "platform/ui/day_chooser.h"

#include "platform/ole_date.h"
#include "platform/user_locale.h"

#include <QCalendarWidget>
#include <QDate>
#include <QMenu>
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
