#include "tableview/why_not_stored.h"

#include "platform/user_locale.h"
#include "resources/string_table.h"
#include "result/cell_text.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <limits>
#include <optional>

namespace mirel {
namespace {

constexpr qsizetype kMostQuoted = 40;

struct Typed {
    QString text;
    FieldType type;
    int size;
    std::optional<double> number; // as it reads here, or in the user's locale
};

std::optional<double> NumberIn(const QString& text)
{
    bool isNumber = false;
    QLocale plain = QLocale::c();
    plain.setNumberOptions(QLocale::RejectGroupSeparator);
    double number = plain.toDouble(text.trimmed(), &isNumber);
    if (!isNumber)
        number = UserLocale::Current().Locale().toDouble(text.trimmed(), &isNumber);
    return isNumber ? std::optional(number) : std::nullopt;
}

bool IsFraction(const Typed& typed)
{
    return typed.number && std::isfinite(*typed.number) && *typed.number != std::trunc(*typed.number);
}

template <typename Integer>
QString RangeText(const Typed& typed)
{
    using Limits = std::numeric_limits<Integer>;
    return StringText(Str::WhyOutOfRange,
                      {QString::number(Limits::min()), QString::number(Limits::max()), Quoted(typed.text)});
}

// Says what is wrong with the texts that it is about; the first that fits is said.
struct Rule {
    bool (*fits)(const Typed&);
    QString (*says)(const Typed&);
};
constexpr std::array kRules = {
    Rule{[](const Typed& typed) { return typed.type == FieldType::Date; },
         [](const Typed& typed) { return StringText(Str::WhyNotDate, {Quoted(typed.text)}); }},
    Rule{[](const Typed& typed) { return IsNumber(typed.type) && !typed.number; },
         [](const Typed& typed) { return StringText(Str::WhyNotNumber, {Quoted(typed.text)}); }},
    Rule{[](const Typed& typed) { return IsInteger(typed.type) && IsFraction(typed); },
         [](const Typed& typed) { return StringText(Str::WhyNotWhole, {Quoted(typed.text)}); }},
    Rule{[](const Typed& typed) { return typed.type == FieldType::SmallInt; }, RangeText<qint16>},
    Rule{[](const Typed& typed) { return typed.type == FieldType::Integer; }, RangeText<qint32>},
    Rule{[](const Typed& typed) { return IsNumber(typed.type); },
         [](const Typed& typed) { return StringText(Str::WhyNotNumber, {Quoted(typed.text)}); }},
    Rule{[](const Typed& typed) { return typed.size >= 0; },
         [](const Typed& typed) {
             return StringText(Str::WhyTooLong, {QString::number(typed.size), QString::number(typed.text.size())});
         }},
};

} // namespace

QString WhyNotStored(const QString& text, FieldType type, int size)
{
    if (IsKeptWhole(text, type, size))
        return {};
    const Typed typed{text, type, size, IsNumber(type) ? NumberIn(text) : std::nullopt};
    const auto rule = std::ranges::find_if(kRules, [&](const Rule& candidate) { return candidate.fits(typed); });
    return rule == kRules.end() ? QString() : rule->says(typed);
}

QString Quoted(const QString& text)
{
    QString line = text.simplified();
    if (line.size() > kMostQuoted)
        line = line.left(kMostQuoted - 10) + u'…' + line.right(9);
    return line;
}

} // namespace mirel
