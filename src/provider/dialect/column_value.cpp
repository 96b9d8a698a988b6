#include "provider/dialect/column_value.h"

#include "platform/ole_date.h"
#include "platform/user_locale.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace mirel::dialect {
namespace {

constexpr qsizetype kMostDigits = 64; // of a whole number, blanks around it included

bool IsNumberUnit(QChar unit)
{
    return (unit >= u'0' && unit <= u'9') || unit == u'.' || unit == u'-' || unit == u'+' || unit == u'e' ||
           unit == u'E';
}

// "12001-01-01" and "0000-05-05" look like dates, but their years are out of range.
bool IsDateOutOfRange(QStringView text)
{
    const qsizetype dash = text.indexOf(u'-');
    const bool longYear = dash > 4 && std::all_of(text.begin(), text.begin() + dash,
                                                  [](QChar unit) { return unit >= u'0' && unit <= u'9'; });
    return longYear || text.startsWith(u"0000-");
}

Hr NumberOf(const Value& value, double& number)
{
    switch (value.Tag()) {
    case ValueTag::Text:
        return ReadNumber(value.ToText(), number);
    case ValueTag::SmallInt:
    case ValueTag::Integer:
    case ValueTag::Double:
    case ValueTag::Bool:
        number = value.Number();
        return Hr::Ok;
    case ValueTag::Empty:
    case ValueTag::Null:
    case ValueTag::Date:
    case ValueTag::Binary:
        break;
    }
    return Hr::BadLiteral;
}

// The number to its last digit, where it is written as a plain whole one.
std::optional<qint64> WholeNumberOf(const Value& value)
{
    if (value.Tag() != ValueTag::Text)
        return value.WholeNumber();
    const QStringView text = value.TextView();
    bool reads = false;
    const qint64 number = text.size() <= kMostDigits ? text.trimmed().toLongLong(&reads) : 0;
    return reads ? std::optional(number) : std::nullopt;
}

template <typename Whole>
Hr ConvertWhole(const Value& value, Value (*make)(Whole), Value& converted)
{
    using Limits = std::numeric_limits<Whole>;
    if (const std::optional<qint64> whole = WholeNumberOf(value)) {
        if (*whole < Limits::min() || *whole > Limits::max())
            return Hr::Overflow;
        converted = make(Whole(*whole));
        return Hr::Ok;
    }
    double number = 0;
    if (const Hr hr = NumberOf(value, number); Failed(hr))
        return hr;
    if (!std::isfinite(number))
        return Hr::Overflow;
    if (number != std::trunc(number))
        return Hr::BadLiteral;
    // The greatest one of 64 bits is no double; the power of two behind it is.
    if (number < double(Limits::min()) || number >= -double(Limits::min()))
        return Hr::Overflow;
    converted = make(Whole(number));
    return Hr::Ok;
}

bool IsExactAsDouble(qint64 whole)
{
    const auto number = double(whole); // the greatest ones become 2^63, which is no qint64
    return number < -double(std::numeric_limits<qint64>::min()) && qint64(number) == whole;
}

Hr ConvertDouble(const Value& value, Value& converted)
{
    double number = value.Number();
    if (const std::optional<qint64> whole = WholeNumberOf(value); whole && !IsExactAsDouble(*whole)) {
        converted = Value::Whole(*whole);
        return Hr::Ok;
    }
    if (value.Tag() != ValueTag::Date) {
        if (const Hr hr = NumberOf(value, number); Failed(hr))
            return hr;
    }
    if (!std::isfinite(number))
        return Hr::Overflow;
    converted = Value::Double(number);
    return Hr::Ok;
}

Hr ConvertDate(const Value& value, Value& converted)
{
    double days = value.Number();
    if (value.Tag() == ValueTag::Text) {
        if (const Hr hr = ReadDate(value.ToText(), days); Failed(hr))
            return hr;
    } else if (value.Tag() == ValueTag::Bool || value.Tag() == ValueTag::Binary) {
        return Hr::BadLiteral;
    }
    if (!PartsOfOleDate(days))
        return Hr::Overflow;
    converted = Value::Date(days);
    return Hr::Ok;
}

Hr ConvertTruth(const Value& value, Value& converted)
{
    bool truth = false;
    double number = 0;
    const bool isText = value.Tag() == ValueTag::Text;
    const Hr hr = isText ? ReadTruth(value.ToText(), truth) : NumberOf(value, number);
    if (!Failed(hr))
        converted = Value::Bool(isText ? truth : number != 0);
    return hr;
}

Hr ConvertText(const Value& value, int size, Value& converted)
{
    if (value.Tag() == ValueTag::Binary)
        return Hr::BadLiteral;
    QString text = VariantText(value);
    if (size > 0 && text.size() > size)
        return Hr::Overflow;
    converted = Value::Text(std::move(text));
    return Hr::Ok;
}

Hr ConvertBinary(const Value& value, int size, Value& converted)
{
    if (value.Tag() != ValueTag::Binary)
        return Hr::BadLiteral;
    if (size > 0 && value.ToBinary().size() > size)
        return Hr::Overflow;
    converted = value;
    return Hr::Ok;
}

} // namespace

Hr ReadNumber(QStringView text, double& number)
{
    text = text.trimmed();
    if (text.isEmpty() || !std::ranges::all_of(text, IsNumberUnit)) // "nan", "inf" and "0x10" are no numbers
        return Hr::BadLiteral;
    bool reads = false;
    const double read = text.toDouble(&reads);
    if (std::isinf(read))
        return Hr::Overflow;
    if (!reads)
        return Hr::BadLiteral;
    number = read;
    return Hr::Ok;
}

Hr ReadDate(QStringView text, double& oleDays)
{
    text = text.trimmed();
    std::optional<double> days = OleDateFromStored(text.toLatin1().toStdString());
    if (!days)
        days = UserLocale::Current().ParseDateTime(text);
    if (!days)
        return IsDateOutOfRange(text) ? Hr::Overflow : Hr::BadLiteral;
    oleDays = *days;
    return Hr::Ok;
}

Hr ReadTruth(QStringView text, bool& truth)
{
    text = text.trimmed();
    const auto is = [text](QStringView word) { return text.compare(word, Qt::CaseInsensitive) == 0; };
    if (is(u"TRUE") || is(u"YES")) {
        truth = true;
        return Hr::Ok;
    }
    if (is(u"FALSE") || is(u"NO")) {
        truth = false;
        return Hr::Ok;
    }
    double number = 0;
    const Hr hr = ReadNumber(text, number);
    if (!Failed(hr))
        truth = number != 0;
    return hr;
}

Hr ConvertValue(const Value& value, FieldType type, int size, Value& converted)
{
    if (value.IsNull()) {
        converted = Value::Null();
        return Hr::Ok;
    }
    switch (type) {
    case FieldType::SmallInt:
        return ConvertWhole<qint16>(value, Value::SmallInt, converted);
    case FieldType::Integer:
        return size == kWideIntegerSize ? ConvertWhole<qint64>(value, Value::Whole, converted)
                                        : ConvertWhole<qint32>(value, Value::Integer, converted);
    case FieldType::Double:
        return ConvertDouble(value, converted);
    case FieldType::Date:
        return ConvertDate(value, converted);
    case FieldType::YesNo:
        return ConvertTruth(value, converted);
    case FieldType::Text:
        return ConvertText(value, size, converted);
    case FieldType::Memo:
        return ConvertText(value, -1, converted);
    case FieldType::VarBinary:
        return ConvertBinary(value, size, converted);
    case FieldType::LongBinary:
        return ConvertBinary(value, -1, converted);
    case FieldType::None:
        converted = value;
        return Hr::Ok;
    }
    return Hr::Unexpected;
}

} // namespace mirel::dialect
