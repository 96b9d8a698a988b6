#include "expr/date_format.h"

#include "platform/ole_date.h"
#include "platform/user_locale.h"

#include <algorithm>

namespace mirel {
namespace {

// The places of year, month and day among the three date fields, by the number of the order.
struct FieldPlaces {
    int year;
    int month;
    int day;
};
constexpr std::array kPlaces = {
    FieldPlaces{.year = 2, .month = 0, .day = 1}, // MonthDayYear
    FieldPlaces{.year = 1, .month = 0, .day = 2}, // MonthYearDay
    FieldPlaces{.year = 0, .month = 2, .day = 1}, // YearDayMonth
    FieldPlaces{.year = 0, .month = 1, .day = 2}, // YearMonthDay
    FieldPlaces{.year = 2, .month = 1, .day = 0}, // DayMonthYear
    FieldPlaces{.year = 1, .month = 2, .day = 0}, // DayYearMonth
};

// A separator in UTF-8; empty for none, and for half a surrogate pair, which no text can hold.
class Separator {
public:
    explicit Separator(char16_t unit)
    {
        if (unit == 0 || QChar::isSurrogate(unit))
            return;
        if (unit < 0x80) {
            Add(unit);
        } else if (unit < 0x800) {
            Add(0xC0 | (unit >> 6));
            Add(0x80 | (unit & 0x3F));
        } else {
            Add(0xE0 | (unit >> 12));
            Add(0x80 | ((unit >> 6) & 0x3F));
            Add(0x80 | (unit & 0x3F));
        }
    }

    std::string_view Text() const { return {bytes_.data(), length_}; }

    // Cuts the text up to the separator off the front of `rest`, and the separator with it.
    std::optional<std::string_view> CutField(std::string_view& rest) const
    {
        const size_t at = length_ == 0 ? std::string_view::npos : rest.find(Text());
        if (at == std::string_view::npos)
            return {};
        const std::string_view field = rest.substr(0, at);
        rest.remove_prefix(at + length_);
        return field;
    }

private:
    void Add(int byte) { bytes_[length_++] = char(byte); }

    std::array<char, 3> bytes_{};
    size_t length_ = 0;
};

// The leading number of a field; empty when it has none. Only its first ten characters count, which also keeps
// the number within 64 bits.
std::optional<qint64> LeadingNumber(std::string_view field)
{
    field = field.substr(0, 10);
    size_t at = std::min(field.find_first_not_of(" \t"), field.size());
    const bool negative = at < field.size() && field[at] == '-';
    if (at < field.size() && (field[at] == '-' || field[at] == '+'))
        ++at;
    const size_t firstDigit = at;
    qint64 number = 0;
    for (; at < field.size() && field[at] >= '0' && field[at] <= '9'; ++at)
        number = number * 10 + (field[at] - '0');
    if (at == firstDigit)
        return {};
    return negative ? -number : number;
}

qint64 FullYear(qint64 year)
{
    if (year >= 100)
        return year;
    return year >= 0 && year <= 29 ? 2000 + year : 1900 + year;
}

// No date or time field is longer than a year. -1, for anything else, is not part of any date.
int FieldOrNone(std::optional<qint64> number)
{
    return number && *number >= 0 && *number <= 9999 ? int(*number) : -1;
}

// False when the minute is not there. A time field without a number is 0.
bool ReadTime(const Separator& separator, std::string_view rest, DateParts& parts)
{
    const std::optional<std::string_view> hour = separator.CutField(rest);
    if (!hour)
        return true;
    const std::optional<std::string_view> minute = separator.CutField(rest);
    if (!minute)
        return false;
    parts.hour = FieldOrNone(LeadingNumber(*hour).value_or(0));
    parts.minute = FieldOrNone(LeadingNumber(*minute).value_or(0));
    parts.second = FieldOrNone(LeadingNumber(rest).value_or(0));
    return true;
}

// Writes into the buffer of a DateFieldsText, whose size the longest of them fits.
class FieldWriter {
public:
    explicit FieldWriter(DateFieldsText& text)
        : text_(text)
    {
    }

    void Number(int number, int digits)
    {
        for (int at = digits - 1; at >= 0; --at, number /= 10)
            text_.characters[text_.length + size_t(at)] = char('0' + number % 10);
        text_.length += size_t(digits);
    }
    void Text(std::string_view text)
    {
        std::ranges::copy(text, text_.characters.begin() + ptrdiff_t(text_.length));
        text_.length += text.size();
    }

private:
    DateFieldsText& text_;
};

void WriteDate(FieldWriter& writer, const DateFormat& format, const DateParts& parts)
{
    const FieldPlaces& places = kPlaces[size_t(format.order)];
    const Separator separator(format.dateSeparator);
    for (int place = 0; place < 3; ++place) {
        if (place > 0)
            writer.Text(separator.Text());
        if (place == places.year)
            writer.Number(parts.year, 4);
        else
            writer.Number(place == places.month ? parts.month : parts.day, 2);
    }
}

void WriteTime(FieldWriter& writer, const DateFormat& format, const DateParts& parts)
{
    const Separator separator(format.timeSeparator);
    writer.Number(parts.hour, 2);
    writer.Text(separator.Text());
    writer.Number(parts.minute, 2);
    writer.Text(separator.Text());
    writer.Number(parts.second, 2);
}

bool IsBaseDate(const DateParts& parts)
{
    constexpr DateParts kBase;
    return parts.year == kBase.year && parts.month == kBase.month && parts.day == kBase.day;
}

// The pieces of a pattern, and what they remember while it is filled.
class PatternFiller {
public:
    explicit PatternFiller(const DateParts& parts)
        : parts_(parts)
    {
    }

    QString Piece(QStringView name)
    {
        for (const PieceDef& piece : kPieces) {
            if (name == QStringView(piece.name.data(), qsizetype(piece.name.size())))
                return (this->*piece.text)(piece.digits);
        }
        return name.toString();
    }

private:
    struct PieceDef {
        std::u16string_view name;
        QString (PatternFiller::*text)(int digits);
        int digits;
    };

    static QString Padded(int number, int digits) { return QString::asprintf("%0*d", digits, number); }

    QString Year(int digits) { return Padded(parts_.year, digits); }
    QString ShortYear(int digits)
    {
        const int year = parts_.year;
        if (year >= 2000 && year <= 2029)
            return Padded(year - 2000, digits);
        return Padded(year >= 1930 && year <= 1999 ? year - 1900 : year, digits);
    }
    QString Month(int digits) { return Padded(parts_.month, digits); }
    QString Day(int digits) { return Padded(parts_.day, digits); }
    QString Hour(int digits) { return Padded(parts_.hour - hourOffset_, digits); }
    QString Minute(int digits) { return Padded(parts_.minute, digits); }
    QString Second(int digits) { return Padded(parts_.second, digits); }
    QString SetHourOffset(int offset)
    {
        hourOffset_ = offset;
        return {};
    }

    static const std::array<PieceDef, 14> kPieces;

    const DateParts& parts_;
    int hourOffset_ = 0; // 12 takes 12 off every hour, forenoon too: 09:00 is -3, as patterns always meant it
};

constexpr std::array<PatternFiller::PieceDef, 14> PatternFiller::kPieces = {{
    {u"YYYY", &PatternFiller::Year, 1},
    {u"YY", &PatternFiller::ShortYear, 1},
    {u"MM", &PatternFiller::Month, 2},
    {u"M", &PatternFiller::Month, 1},
    {u"DD", &PatternFiller::Day, 2},
    {u"D", &PatternFiller::Day, 1},
    {u"12", &PatternFiller::SetHourOffset, 12},
    {u"24", &PatternFiller::SetHourOffset, 0},
    {u"hh", &PatternFiller::Hour, 2},
    {u"h", &PatternFiller::Hour, 1},
    {u"mm", &PatternFiller::Minute, 2},
    {u"m", &PatternFiller::Minute, 1},
    {u"ss", &PatternFiller::Second, 2},
    {u"s", &PatternFiller::Second, 1},
}};

QString FromUtf8(std::string_view utf8)
{
    return QString::fromUtf8(utf8.data(), qsizetype(utf8.size()));
}

} // namespace

std::optional<double> ParseDateFields(const DateFormat& format, std::string_view utf8)
{
    if (format.order == DateOrder::Locale)
        return UserLocale::Current().ParseDateTime(FromUtf8(utf8));
    const Separator dateSeparator(format.dateSeparator);
    std::string_view rest = utf8;
    const std::optional<std::string_view> first = dateSeparator.CutField(rest);
    const std::optional<std::string_view> second = first ? dateSeparator.CutField(rest) : std::nullopt;
    if (!second)
        return {};
    const size_t blank = rest.find(' ');
    const std::array fields = {LeadingNumber(*first), LeadingNumber(*second),
                               LeadingNumber(rest.substr(0, blank))};

    const FieldPlaces& places = kPlaces[size_t(format.order)];
    const std::optional<qint64> year = fields[size_t(places.year)];
    if (!year)
        return {};
    DateParts parts;
    parts.year = FieldOrNone(FullYear(*year));
    parts.month = FieldOrNone(fields[size_t(places.month)]);
    parts.day = FieldOrNone(fields[size_t(places.day)]);
    if (blank != std::string_view::npos &&
        !ReadTime(Separator(format.timeSeparator), rest.substr(blank + 1), parts)) {
        return {};
    }
    return OleDate(parts);
}

std::optional<double> ParseTimeFields(const DateFormat& format, std::string_view utf8)
{
    const auto isNumber = [](std::string_view field) {
        return field.size() >= 1 && field.size() <= 2 &&
               std::ranges::all_of(field, [](char byte) { return byte >= '0' && byte <= '9'; });
    };
    const Separator separator(format.timeSeparator);
    std::string_view second = utf8;
    const std::optional<std::string_view> hour = separator.CutField(second);
    const std::optional<std::string_view> minute = hour ? separator.CutField(second) : std::nullopt;
    if (format.order == DateOrder::Locale || !minute || !isNumber(*hour) || !isNumber(*minute) ||
        !isNumber(second))
        return {};
    DateParts parts; // of the base date
    parts.hour = FieldOrNone(LeadingNumber(*hour));
    parts.minute = FieldOrNone(LeadingNumber(*minute));
    parts.second = FieldOrNone(LeadingNumber(second));
    return OleDate(parts);
}

bool ParseDateText(DateOrder order, QChar dateSeparator, QChar timeSeparator, QStringView text, QString& out)
{
    const DateFormat format{order, dateSeparator.unicode(), timeSeparator.unicode()};
    const QByteArray utf8 = text.toUtf8();
    const std::optional<double> date = ParseDateFields(format, {utf8.constData(), size_t(utf8.size())});
    if (!date)
        return false;
    out = UserLocale::Current().DateTimeText(*date);
    return true;
}

DateFieldsText FormatDateFields(const DateFormat& format, double oleDays)
{
    Q_ASSERT(format.order != DateOrder::Locale);
    DateFieldsText text;
    const std::optional<DateParts> parts = PartsOfOleDate(oleDays);
    if (!parts)
        return text;
    FieldWriter writer(text);
    const bool hasTime = parts->hour != 0 || parts->minute != 0 || parts->second != 0;
    const bool timeAlone = hasTime && IsBaseDate(*parts);
    if (!timeAlone)
        WriteDate(writer, format, *parts);
    if (hasTime && !timeAlone)
        writer.Text(" ");
    if (hasTime)
        WriteTime(writer, format, *parts);
    return text;
}

QString FormatDateText(const DateFormat& format, double oleDays)
{
    if (format.order == DateOrder::Locale)
        return UserLocale::Current().DateTimeText(oleDays);
    return FromUtf8(FormatDateFields(format, oleDays).Text());
}

QString FormatDatePattern(double oleDays, QStringView pattern)
{
    const std::optional<DateParts> parts = PartsOfOleDate(oleDays);
    if (!parts)
        return {};
    PatternFiller filler(*parts);
    QString filled;
    while (!pattern.isEmpty()) {
        const qsizetype open = pattern.indexOf(u'(');
        const qsizetype close = open < 0 ? -1 : pattern.indexOf(u')', open);
        if (close < 0)
            break;
        filled += pattern.first(open);
        filled += filler.Piece(pattern.sliced(open + 1, close - open - 1));
        pattern = pattern.sliced(close + 1);
    }
    filled += pattern;
    return filled;
}

QString CurrentTimeText(QTime now)
{
    return QString::asprintf("%02d:%02d:%02d", now.hour(), now.minute(), now.second());
}

QString DateText(double oleDays)
{
    const std::optional<DateParts> parts = PartsOfOleDate(oleDays);
    return parts ? QString::asprintf("%04d-%02d-%02d", parts->year, parts->month, parts->day) : QString();
}

QString CompactDateText(QStringView text)
{
    const std::optional<double> date = UserLocale::Current().ParseDateTime(text);
    const std::optional<DateParts> parts = date ? PartsOfOleDate(*date) : std::nullopt;
    return parts ? QString::asprintf("%04d%02d%02d", parts->year, parts->month, parts->day) : QString();
}

} // namespace mirel
