#include "platform/date_text_reader.h"

#include "platform/ole_date.h"

#include <QList>

#include <algorithm>
#include <vector>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qsizetype kMaxLength = 100; // no locale's date comes near it

// The one form in which texts and names are compared: digits in ASCII, every blank a plain one, no marks of
// writing direction, lower case.
QString Plain(QStringView text)
{
    QString plain;
    const QList<uint> characters = text.toUcs4();
    for (const uint character : characters) {
        const int digit = QChar::digitValue(character);
        if (digit >= 0)
            plain += QChar(u'0' + digit);
        else if (QChar::isSpace(character))
            plain += u' ';
        else if (QChar::category(character) != QChar::Other_Format)
            plain += QString::fromUcs4(reinterpret_cast<const char32_t*>(&character), 1).toLower();
    }
    return plain.trimmed();
}

enum class PartKind { Year, Month, Day, Weekday, Hour, Minute, Second, Half };

struct Part {
    PartKind kind;
    QString before; // the locale's literal in front of it, plain
};

struct Pattern {
    std::vector<Part> parts;
    QString behind;
};

std::optional<PartKind> KindOf(QChar letter, qsizetype count)
{
    switch (letter.unicode()) {
    case u'y':
        return PartKind::Year;
    case u'M':
        return PartKind::Month;
    case u'd':
        return count > 2 ? PartKind::Weekday : PartKind::Day;
    case u'h':
    case u'H':
        return PartKind::Hour;
    case u'm':
        return PartKind::Minute;
    case u's':
        return PartKind::Second;
    case u'a':
    case u'A':
        return PartKind::Half;
    default:
        return {};
    }
}

Pattern CompileFormat(QStringView format)
{
    Pattern pattern;
    QString literal;
    bool quoted = false;
    for (qsizetype i = 0; i < format.size(); ++i) {
        const QChar letter = format[i];
        if (letter == u'\'') {
            quoted = !quoted;
            continue;
        }
        qsizetype count = 1;
        while (i + count < format.size() && format[i + count] == letter)
            ++count;
        const std::optional<PartKind> kind = quoted ? std::nullopt : KindOf(letter, count);
        if (!kind) {
            literal += letter;
            continue;
        }
        pattern.parts.push_back({*kind, Plain(literal)});
        literal.clear();
        i += count - 1;
        if (*kind == PartKind::Half && i + 1 < format.size() && format[i + 1].toLower() == u'p')
            ++i; // AM and PM are written "AP" in a format
    }
    pattern.behind = Plain(literal);
    return pattern;
}

// Walks over a plain text. A failing step leaves the place where it was.
class TextReader {
public:
    explicit TextReader(QStringView text)
        : rest_(text)
    {
    }

    bool AtEnd() const { return rest_.isEmpty(); }
    bool SkipBlanks()
    {
        const qsizetype before = rest_.size();
        while (!rest_.isEmpty() && rest_.front() == u' ')
            rest_ = rest_.sliced(1);
        return rest_.size() < before;
    }
    bool Take(QStringView wanted)
    {
        if (wanted.isEmpty() || !rest_.startsWith(wanted))
            return false;
        rest_ = rest_.sliced(wanted.size());
        return true;
    }
    bool TakeOneOf(QStringView characters)
    {
        if (rest_.isEmpty() || !characters.contains(rest_.front()))
            return false;
        rest_ = rest_.sliced(1);
        return true;
    }
    // A run of at most four digits, or nothing.
    std::optional<int> Number(qsizetype& digits)
    {
        int number = 0;
        for (digits = 0; digits < rest_.size() && IsDigit(rest_[digits]); ++digits) {
            if (digits == 4)
                return {};
            number = number * 10 + (rest_[digits].unicode() - u'0');
        }
        if (digits == 0)
            return {};
        rest_ = rest_.sliced(digits);
        return number;
    }
    // The digits behind a second's point; those past the millisecond are dropped.
    int Milliseconds()
    {
        int milliseconds = 0;
        for (int scale = 100; !rest_.isEmpty() && IsDigit(rest_.front()); scale /= 10) {
            milliseconds += (rest_.front().unicode() - u'0') * scale;
            rest_ = rest_.sliced(1);
        }
        return milliseconds;
    }
    void SkipLetters()
    {
        while (!rest_.isEmpty() && (rest_.front().isLetter() || rest_.front() == u'.'))
            rest_ = rest_.sliced(1);
    }
    bool FollowedByDigit() const { return rest_.size() > 1 && IsDigit(rest_[1]); }

private:
    static bool IsDigit(QChar character) { return character >= u'0' && character <= u'9'; }

    QStringView rest_;
};

// One attempt to read a text; each Read… leaves the reader somewhere when it fails, so it works on a copy.
class DateTextParser {
public:
    DateTextParser(const QLocale& locale, QStringView dateFormat, QStringView timeFormat)
        : locale_(locale)
        , date_(CompileFormat(dateFormat))
        , time_(CompileFormat(timeFormat))
    {
    }

    std::optional<DateParts> Read(TextReader reader) const
    {
        DateParts parts;
        // The time comes first: in some languages "9.05.00" is one, though it could be a day of the year 2000.
        if (ReadTimeToEnd(reader, parts))
            return parts;
        for (const bool yearFirst : {true, false}) {
            parts = {};
            TextReader attempt = reader;
            if (yearFirst ? ReadYearFirst(attempt, parts) : ReadLocalDate(attempt, parts)) {
                if (attempt.AtEnd())
                    return parts;
                const bool apart = attempt.Take(u"t") || attempt.TakeOneOf(u",") || attempt.SkipBlanks();
                attempt.SkipBlanks();
                if (apart && ReadTimeToEnd(attempt, parts))
                    return parts;
            }
        }
        return {};
    }

private:
    // ISO, and "2001/7/4" in any language: four digits in front are a year.
    bool ReadYearFirst(TextReader& reader, DateParts& parts) const
    {
        qsizetype digits = 0;
        const std::optional<int> year = reader.Number(digits);
        if (!year || digits != 4 || !reader.TakeOneOf(u"-/."))
            return false;
        parts.year = *year;
        const std::optional<int> month = reader.Number(digits);
        if (!month || digits > 2 || !reader.TakeOneOf(u"-/."))
            return false;
        parts.month = *month;
        const std::optional<int> day = reader.Number(digits);
        parts.day = day.value_or(0);
        return day && digits <= 2;
    }

    bool ReadLocalDate(TextReader& reader, DateParts& parts) const
    {
        bool first = true;
        for (const Part& part : date_.parts) {
            if (!ReadSeparator(reader, part.before, first) || !ReadDatePart(reader, part.kind, parts))
                return false;
            first = false;
        }
        TakeTrailingLiteral(reader, date_.behind);
        return !first;
    }

    static bool ReadSeparator(TextReader& reader, QStringView literal, bool first)
    {
        reader.SkipBlanks();
        const bool taken = reader.Take(literal) || (!first && reader.TakeOneOf(u"/-.,"));
        reader.SkipBlanks();
        return first || taken || literal.isEmpty();
    }

    static void TakeTrailingLiteral(TextReader& reader, QStringView literal)
    {
        TextReader behind = reader;
        behind.SkipBlanks();
        if (behind.Take(literal))
            reader = behind;
    }

    bool ReadDatePart(TextReader& reader, PartKind kind, DateParts& parts) const
    {
        if (kind == PartKind::Weekday) {
            reader.SkipLetters();
            return true;
        }
        qsizetype digits = 0;
        const std::optional<int> number = reader.Number(digits);
        if (kind == PartKind::Year) {
            if (!number || digits == 3)
                return false;
            const int century = *number < 30 ? 2000 : 1900;
            parts.year = digits < 3 ? century + *number : *number;
            return true;
        }
        if (kind == PartKind::Month && !number)
            return ReadMonthName(reader, parts.month);
        if (!number || digits > 2)
            return false;
        (kind == PartKind::Month ? parts.month : parts.day) = *number;
        return true;
    }

    bool ReadMonthName(TextReader& reader, int& month) const
    {
        for (const QLocale::FormatType length : {QLocale::LongFormat, QLocale::ShortFormat}) {
            for (month = 12; month >= 1; --month) { // "10月" before "1月" is never read as the first month
                if (reader.Take(Plain(locale_.monthName(month, length))) ||
                    reader.Take(Plain(locale_.standaloneMonthName(month, length))))
                    return true;
            }
        }
        return false;
    }

    enum class Half { None, Morning, Afternoon };

    bool ReadTimeToEnd(TextReader reader, DateParts& parts) const
    {
        TakeLiteralOf(reader, PartKind::Hour);
        reader.SkipBlanks();
        Half half = ReadHalf(reader);
        reader.SkipBlanks();
        TakeLiteralOf(reader, PartKind::Hour);
        reader.SkipBlanks();
        qsizetype digits = 0;
        const std::optional<int> hour = reader.Number(digits);
        if (!hour || digits > 2)
            return false;
        parts.hour = *hour;
        parts.minute = parts.second = parts.millisecond = 0;
        const bool hasMinutes = ReadSexagesimal(reader, PartKind::Minute, parts.minute);
        if (hasMinutes && ReadSexagesimal(reader, PartKind::Second, parts.second) && reader.FollowedByDigit() &&
            reader.TakeOneOf(u".,"))
            parts.millisecond = reader.Milliseconds();
        TakeTrailingLiteral(reader, time_.behind);
        reader.SkipBlanks();
        if (half == Half::None)
            half = ReadHalf(reader);
        TakeTrailingLiteral(reader, time_.behind);
        return reader.AtEnd() && (hasMinutes || half != Half::None) && ApplyHalf(half, parts.hour);
    }

    bool TakeLiteralOf(TextReader& reader, PartKind kind) const
    {
        const auto part = std::ranges::find(time_.parts, kind, &Part::kind);
        return part != time_.parts.end() && reader.Take(part->before);
    }

    // ":" and two digits, or what the locale writes instead; without them the reader stays where it is.
    bool ReadSexagesimal(TextReader& reader, PartKind kind, int& value) const
    {
        TextReader attempt = reader;
        attempt.SkipBlanks();
        const bool colon = attempt.Take(u":");
        if (!colon && !TakeLiteralOf(attempt, kind))
            return false;
        attempt.SkipBlanks();
        qsizetype digits = 0;
        const std::optional<int> number = attempt.Number(digits);
        if (!number || digits > 2 || (colon && digits != 2)) // "9:5" is half typed
            return false;
        value = *number;
        reader = attempt;
        return true;
    }

    Half ReadHalf(TextReader& reader) const
    {
        for (const QString& name : {Plain(locale_.amText()), u"am"_s, u"a.m."_s}) {
            if (reader.Take(name))
                return Half::Morning;
        }
        for (const QString& name : {Plain(locale_.pmText()), u"pm"_s, u"p.m."_s}) {
            if (reader.Take(name))
                return Half::Afternoon;
        }
        return Half::None;
    }

    static bool ApplyHalf(Half half, int& hour)
    {
        if (half == Half::None)
            return true;
        if (hour > 12)
            return false;
        hour = hour % 12 + (half == Half::Afternoon ? 12 : 0);
        return true;
    }

    const QLocale& locale_;
    Pattern date_;
    Pattern time_;
};

} // namespace

std::optional<double> ReadDateText(const QLocale& locale, QStringView dateFormat, QStringView timeFormat,
                                   QStringView text)
{
    if (text.size() > kMaxLength)
        return {};
    const QString plain = Plain(text);
    const std::optional<DateParts> parts = DateTextParser(locale, dateFormat, timeFormat).Read(TextReader(plain));
    return parts ? OleDate(*parts) : std::nullopt;
}

} // namespace mirel
