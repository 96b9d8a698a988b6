#pragma once

#include "platform/value.h"

#include <QLocale>
#include <QString>

#include <optional>

namespace mirel {

// How this user writes dates and times: the only place that formats and parses them for people. Files and
// statements use the C locale and ISO dates instead.
//
// The date text is the locale's short date with a four-digit year, the time text the locale's time with
// seconds; for US English "7/4/2001" and "9:05:00 AM". Under the C and POSIX locales it is US English.
class UserLocale {
public:
    explicit UserLocale(const QLocale& locale);

    // The locale of this process: the system's, unless a test has set another.
    static const UserLocale& Current();
    static void SetCurrent(const QLocale& locale);

    // Omits midnight, and the base date 1899-12-30 (a value that is both shows its time). Empty for a value that
    // is not a date.
    QString DateTimeText(double oleDays) const;
    QString DateText(double oleDays) const;
    QString TimeText(double oleDays) const;
    // Reads the locale's form and always ISO "2001-07-04", each with an optional time after a blank or "T", and a
    // time alone (on the base date). A two-digit year lies between 1930 and 2029.
    std::optional<double> ParseDateTime(QStringView text) const;

    const QLocale& Locale() const { return locale_; }
    // The locale's forms in the letters of QLocale::toString: "M/d/yyyy", "h:mm:ss AP".
    const QString& DateFormat() const { return dateFormat_; }
    const QString& TimeFormat() const { return timeFormat_; }

private:
    QLocale locale_;
    QString dateFormat_;
    QString timeFormat_;
};

// The default text of a value: integers in decimal, a double with up to 15 significant digits
// and "." as its point, a date as the user's date-time text, a bool as "-1" or "0"; the empty text for NULL
// and for binary values.
QString VariantText(const Value& value);
QString NumberText(double number); // the rule for a double

} // namespace mirel
