#include "result/cell_text.h"

#include "platform/ole_date.h"
#include "platform/user_locale.h"

#include <QRegularExpression>

#include <charconv>
#include <cmath>
#include <limits>
#include <optional>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

QString TextOfCell(const Cell& cell, qsizetype maxChars)
{
    // A UTF-16 unit takes at most three bytes of UTF-8; one unit more than the limit shows that there is more.
    size_t bytes = cell.bytes.size();
    if (maxChars >= 0 && bytes / 3 > size_t(maxChars)) {
        bytes = size_t(maxChars + 1) * 3;
        while (bytes < cell.bytes.size() && (static_cast<unsigned char>(cell.bytes[bytes]) & 0xC0U) == 0x80U)
            ++bytes;
    }
    return QString::fromUtf8(cell.bytes.data(), qsizetype(bytes));
}

QString DateTextOfCell(const Cell& cell, qsizetype maxChars)
{
    const std::optional<double> date = OleDateFromStored(cell.bytes);
    return date ? UserLocale::Current().DateTimeText(*date) : TextOfCell(cell, maxChars);
}

QString UncutText(const Cell& cell, FieldType type, const YesNoWords& words, int maxChars)
{
    switch (cell.kind) {
    case Cell::Kind::Integer:
        return type == FieldType::YesNo ? words.Of(cell.integer != 0) : QString::number(cell.integer);
    case Cell::Kind::Real:
        return NumberText(cell.real);
    case Cell::Kind::Text:
        return type == FieldType::Date ? DateTextOfCell(cell, maxChars) : TextOfCell(cell, maxChars);
    case Cell::Kind::Null:
    case Cell::Kind::Binary:
        break;
    }
    return {};
}

// How much of a text a number reader took, and what it read. The readers of the C++ library take no leading
// blanks and no "+"; people do.
template <typename Number>
struct NumberRead {
    Number number = 0;
    bool whole = false;
    bool fits = true;
};

template <typename Number>
NumberRead<Number> ReadNumber(const QString& text)
{
    const QByteArray typed = text.trimmed().toLatin1();
    const char* first = typed.constData();
    const char* const last = first + typed.size();
    if (first != last && *first == '+' && first + 1 != last && first[1] != '-')
        ++first;
    NumberRead<Number> read;
    std::from_chars_result result{};
    if constexpr (std::is_floating_point_v<Number>)
        result = std::from_chars(first, last, read.number, std::chars_format::general);
    else
        result = std::from_chars(first, last, read.number);
    read.fits = result.ec != std::errc::result_out_of_range;
    read.whole = result.ec == std::errc() && result.ptr == last;
    if (result.ec == std::errc::invalid_argument)
        read.number = 0;
    return read;
}

bool Fits(qint64 number, FieldType type)
{
    return type == FieldType::SmallInt
               ? number >= std::numeric_limits<qint16>::min() && number <= std::numeric_limits<qint16>::max()
               : number >= std::numeric_limits<qint32>::min() && number <= std::numeric_limits<qint32>::max();
}

// The whole text as a number: as numbers are shown here, and only then as the user's locale writes them, with its
// groups of three. "12.7" is no integer, and "abc" no 0: what was typed would be lost.
std::optional<qint64> WholeInteger(const QString& text)
{
    if (const NumberRead<qint64> read = ReadNumber<qint64>(text); read.whole)
        return read.number;
    bool isNumber = false;
    const qint64 number = UserLocale::Current().Locale().toLongLong(text.trimmed(), &isNumber);
    return isNumber ? std::optional(number) : std::nullopt;
}

std::optional<double> WholeDouble(const QString& text)
{
    NumberRead<double> read = ReadNumber<double>(text);
    if (!read.whole && read.fits)
        read.number = UserLocale::Current().Locale().toDouble(text.trimmed(), &read.whole);
    return read.whole && std::isfinite(read.number) ? std::optional(read.number) : std::nullopt;
}

Value TypedInteger(const QString& text, FieldType type)
{
    const std::optional<qint64> number = WholeInteger(text);
    if (!number)
        return Value::Text(text);
    if (type == FieldType::SmallInt && Fits(*number, type))
        return Value::SmallInt(qint16(*number));
    // One that is too large for the field is passed on as its digits: the store knows what the field takes.
    return Fits(*number, FieldType::Integer) ? Value::Integer(qint32(*number))
                                             : Value::Text(QString::number(*number));
}

Value TypedDouble(const QString& text)
{
    const std::optional<double> number = WholeDouble(text);
    return number ? Value::Double(*number) : Value::Text(text);
}

Value TypedDate(const QString& text)
{
    const std::optional<double> date = UserLocale::Current().ParseDateTime(text);
    return date ? Value::Date(*date) : Value::Text(text);
}

} // namespace

QString DisplayText(const Value& value, FieldType type, const YesNoWords& words)
{
    if (type == FieldType::YesNo && !value.IsNull())
        return words.Of(value.Number() != 0);
    return VariantText(value);
}

QString BlobText(qint64 bytes)
{
    return UserLocale::Current().Locale().formattedDataSize(bytes, 1, QLocale::DataSizeTraditionalFormat);
}

QString CutForGrid(const QString& text, int maxChars)
{
    if (maxChars < 0 || text.size() <= maxChars)
        return text;
    const bool splitsPair = maxChars > 0 && text[maxChars - 1].isHighSurrogate();
    return text.left(splitsPair ? maxChars - 1 : maxChars) + u'~';
}

QString GridText(const Cell& cell, FieldType type, const YesNoWords& words, int maxChars)
{
    return CutForGrid(UncutText(cell, type, words, maxChars), maxChars);
}

Value TypedValue(const QString& text, FieldType type)
{
    if (text.isEmpty())
        return Value::Null();
    if (IsInteger(type))
        return TypedInteger(text, type);
    if (type == FieldType::Double)
        return TypedDouble(text);
    if (type == FieldType::Date)
        return TypedDate(text);
    return Value::Text(text);
}

QString LeadingNumber(const QString& text, FieldType type)
{
    static const QRegularExpression kInteger(u"^[+-]?[0-9]+"_s);
    static const QRegularExpression kDouble(u"^[+-]?([0-9]+\\.?[0-9]*|\\.[0-9]+)([eE][+-]?[0-9]+)?"_s);
    if (text.isEmpty() || !IsNumber(type))
        return text;
    const QString number = (IsInteger(type) ? kInteger : kDouble).match(text.trimmed()).captured();
    return number.isEmpty() ? u"0"_s : number;
}

bool IsKeptWhole(const QString& text, FieldType type, int size)
{
    if (text.isEmpty())
        return true;
    if (IsInteger(type)) {
        const std::optional<qint64> number = WholeInteger(text);
        return number && (size == kWideIntegerSize || Fits(*number, type));
    }
    if (type == FieldType::Double)
        return WholeDouble(text).has_value();
    if (type == FieldType::Date)
        return UserLocale::Current().ParseDateTime(text).has_value();
    return size < 0 || text.size() <= size;
}

} // namespace mirel
