#include "platform/user_locale.h"

#include "platform/date_text_reader.h"
#include "platform/number_text.h"
#include "platform/ole_date.h"

#include <QDate>
#include <QRegularExpression>
#include <QTime>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// Calls `take` for each run of one letter outside the quotes of a format, and copies what it gives back.
template <typename Take>
QString MapFormatLetters(const QString& format, Take take)
{
    QString mapped;
    bool quoted = false;
    for (qsizetype i = 0; i < format.size();) {
        const QChar letter = format[i];
        qsizetype end = i + 1;
        if (letter == u'\'')
            quoted = !quoted;
        while (!quoted && letter.isLetter() && end < format.size() && format[end] == letter)
            ++end;
        const QString run = format.mid(i, end - i);
        mapped += quoted || !letter.isLetter() ? run : take(run);
        i = end;
    }
    return mapped;
}

// Newer locale data writes a narrow no-break space before AM and PM; nobody can type it.
QString WithPlainBlanks(QString format)
{
    return format.replace(QChar(0x202F), u' ').replace(QChar(0x00A0), u' ');
}

QString FourDigitYears(const QString& format)
{
    return MapFormatLetters(WithPlainBlanks(format),
                            [](const QString& run) { return run.startsWith(u'y') ? u"yyyy"_s : run; });
}

// The long form of a time has seconds, but also a zone, which our values do not have.
QString WithoutZone(const QString& format)
{
    QString time = MapFormatLetters(WithPlainBlanks(format),
                                    [](const QString& run) { return run.startsWith(u't') ? QString() : run; });
    time.remove(u"()"_s).remove(u"[]"_s);
    time = time.trimmed();
    while (time.endsWith(u',') || time.endsWith(u'-'))
        time = time.chopped(1).trimmed();
    return time;
}

// The short time with seconds, as handhelds write it; where hours and minutes stand apart by words and not by
// a sign ("9 h 05"), the long form's words.
QString TimeWithSeconds(const QLocale& locale)
{
    static const QRegularExpression minutes(u"^([^']*[hH] ?)([:.] ?)mm?(?!.*s)"_s);
    const QString time = WithPlainBlanks(locale.timeFormat(QLocale::ShortFormat));
    const QRegularExpressionMatch match = minutes.match(time);
    if (!match.hasMatch())
        return WithoutZone(locale.timeFormat(QLocale::LongFormat));
    const QString separator = match.captured(2);
    return match.captured(1) + separator + u"mm"_s + separator + u"ss"_s + time.mid(match.capturedEnd());
}

bool IsPosix(const QLocale& locale)
{
    return locale.language() == QLocale::C ||
           locale.dateFormat(QLocale::ShortFormat) == QLocale::c().dateFormat(QLocale::ShortFormat);
}

UserLocale& MutableCurrent()
{
    static UserLocale current{QLocale::system()};
    return current;
}

QDate DateOf(const DateParts& parts)
{
    return {parts.year, parts.month, parts.day};
}

QTime TimeOf(const DateParts& parts)
{
    return {parts.hour, parts.minute, parts.second};
}

bool IsBaseDate(const DateParts& parts)
{
    constexpr DateParts kBase;
    return parts.year == kBase.year && parts.month == kBase.month && parts.day == kBase.day;
}

} // namespace

UserLocale::UserLocale(const QLocale& locale)
    : locale_(IsPosix(locale) ? QLocale(QLocale::English, QLocale::UnitedStates) : locale)
    , dateFormat_(FourDigitYears(locale_.dateFormat(QLocale::ShortFormat)))
    , timeFormat_(TimeWithSeconds(locale_))
{
}

const UserLocale& UserLocale::Current()
{
    return MutableCurrent();
}

void UserLocale::SetCurrent(const QLocale& locale)
{
    MutableCurrent() = UserLocale(locale);
}

QString UserLocale::DateTimeText(double oleDays) const
{
    const std::optional<DateParts> parts = PartsOfOleDate(oleDays);
    if (!parts)
        return {};
    QString time = locale_.toString(TimeOf(*parts), timeFormat_);
    if (IsBaseDate(*parts))
        return time;
    const QString date = locale_.toString(DateOf(*parts), dateFormat_);
    return TimeOf(*parts) == QTime(0, 0) ? date : date + u' ' + time;
}

QString UserLocale::DateText(double oleDays) const
{
    const std::optional<DateParts> parts = PartsOfOleDate(oleDays);
    return parts ? locale_.toString(DateOf(*parts), dateFormat_) : QString();
}

QString UserLocale::TimeText(double oleDays) const
{
    const std::optional<DateParts> parts = PartsOfOleDate(oleDays);
    return parts ? locale_.toString(TimeOf(*parts), timeFormat_) : QString();
}

std::optional<double> UserLocale::ParseDateTime(QStringView text) const
{
    return ReadDateText(locale_, dateFormat_, timeFormat_, text);
}

QString VariantText(const Value& value)
{
    switch (value.Tag()) {
    case ValueTag::Empty:
    case ValueTag::Null:
    case ValueTag::Binary:
        return {};
    case ValueTag::SmallInt:
    case ValueTag::Integer:
    case ValueTag::Double:
        if (const std::optional<qint64> whole = value.WholeNumber())
            return QString::number(*whole);
        return NumberText(value.Number());
    case ValueTag::Date:
        return UserLocale::Current().DateTimeText(value.Number());
    case ValueTag::Text:
        return value.ToText();
    case ValueTag::Bool:
        return value.ToBool() ? u"-1"_s : u"0"_s;
    }
    return {};
}

QString NumberText(double number)
{
    const NumberBuffer buffer(number);
    return QString::fromLatin1(buffer.Text());
}

} // namespace mirel
