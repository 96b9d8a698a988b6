#include "platform/value.h"

#include <array>

namespace mirel {

ValueTag Value::Tag() const
{
    // In the order of Content's alternatives.
    static constexpr std::array kTags = {ValueTag::Empty,  ValueTag::Null,  ValueTag::SmallInt, ValueTag::Integer,
                                         ValueTag::Double, ValueTag::Date,  ValueTag::Text,     ValueTag::Bool,
                                         ValueTag::Binary, ValueTag::Double};
    static_assert(kTags.size() == std::variant_size_v<Content>);
    return kTags[content_.index()];
}

double Value::Number() const
{
    if (const auto* number = std::get_if<double>(&content_))
        return *number;
    if (const auto* date = std::get_if<DateContent>(&content_))
        return date->oleDays;
    if (const auto* number = std::get_if<qint64>(&content_))
        return double(*number);
    return ToInt();
}

std::optional<qint64> Value::WholeNumber() const
{
    if (const auto* number = std::get_if<qint64>(&content_))
        return *number;
    const bool isWhole = std::holds_alternative<qint32>(content_) || std::holds_alternative<qint16>(content_);
    return isWhole ? std::optional<qint64>(ToInt()) : std::nullopt;
}

qint32 Value::ToInt() const
{
    if (const auto* number = std::get_if<qint32>(&content_))
        return *number;
    if (const auto* number = std::get_if<qint16>(&content_))
        return *number;
    return ToBool() ? 1 : 0;
}

bool Value::ToBool() const
{
    const auto* truth = std::get_if<bool>(&content_);
    return truth && *truth;
}

QString Value::ToText() const
{
    const auto* text = std::get_if<QString>(&content_);
    return text ? *text : QString();
}

QByteArray Value::ToBinary() const
{
    const auto* bytes = std::get_if<QByteArray>(&content_);
    return bytes ? *bytes : QByteArray();
}

} // namespace mirel
