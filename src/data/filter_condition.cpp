#include "data/filter_condition.h"

#include "data/catalog.h"
#include "platform/ole_date.h"
#include "resources/string_table.h"

#include <QLocale>

#include <algorithm>
#include <array>
#include <optional>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

struct ShownOperator {
    std::u16string_view name;
    Str shown;
};
// Those that are words; the others are shown as they are written.
constexpr std::array kShownOperators = {
    ShownOperator{u"contains", Str::OperatorContains},
    ShownOperator{u"begins with", Str::OperatorBeginsWith},
    ShownOperator{u"ends with", Str::OperatorEndsWith},
    ShownOperator{u"not contains", Str::OperatorNotContains},
    ShownOperator{u"not begins with", Str::OperatorNotBeginsWith},
    ShownOperator{u"not ends with", Str::OperatorNotEndsWith},
    ShownOperator{u"not =", Str::OperatorNotEqual},
    ShownOperator{u"is true", Str::OperatorIsTrue},
    ShownOperator{u"is false", Str::OperatorIsFalse},
};
constexpr std::array<std::u16string_view, 6> kComparisons = {u"=", u">", u">=", u"<", u"<=", u"not ="};
constexpr std::array<std::u16string_view, 2> kTruths = {u"is true", u"is false"};

struct TextOperator {
    std::u16string_view name;
    std::u16string_view pattern; // %1 the field, %2 the value with its quotes doubled
};
// A "%" in the pattern is a wildcard of LIKE and never doubled; only %1 and %2 are placeholders.
constexpr std::array kTextOperators = {
    TextOperator{u"contains", u"%1 LIKE '%%2%'"},           TextOperator{u"begins with", u"%1 LIKE '%2%'"},
    TextOperator{u"ends with", u"%1 LIKE '%%2'"},           TextOperator{u"not contains", u"%1 NOT LIKE '%%2%'"},
    TextOperator{u"not begins with", u"%1 NOT LIKE '%2%'"}, TextOperator{u"not ends with", u"%1 NOT LIKE '%%2'"},
};

constexpr auto kTextOperatorNames = [] {
    std::array<std::u16string_view, kTextOperators.size()> names;
    for (size_t i = 0; i < names.size(); ++i)
        names[i] = kTextOperators[i].name;
    return names;
}();

QString Trimmed(QStringView text)
{
    while (text.startsWith(u' '))
        text = text.sliced(1);
    while (text.endsWith(u' '))
        text.chop(1);
    return text.toString();
}

QStringView WithoutPair(QStringView text, QChar quote)
{
    const bool paired = text.size() > 1 && text.front() == quote && text.back() == quote;
    return paired ? text.sliced(1, text.size() - 2) : text;
}

// A value of an integer column; others' files hold fractions and texts there, too.
QString WholeText(const Value& value)
{
    if (const std::optional<qint64> whole = value.WholeNumber())
        return QString::number(*whole);
    return value.Tag() == ValueTag::Double ? QString::number(value.Number(), 'g', QLocale::FloatingPointShortest)
                                           : QString::number(value.ToInt());
}

// A date shows no fractions of a second: one that has some is written as it is stored.
QString DateLiteral(const Value& value, const QString& displayText)
{
    const std::optional<StoredDate> stored = StoredDateOf(value.Number());
    const bool hasFraction = stored && stored->Text().find('.') != std::string_view::npos;
    return hasFraction ? QString::fromLatin1(stored->characters.data(), stored->length) : displayText;
}

// A typed value as it goes between single quotes.
QString PreparedText(const QString& typed)
{
    const QStringView inner = WithoutPair(WithoutPair(typed, u'\''), u'"');
    return inner.toString().replace(u'\'', u"''"_s);
}

QString TextCondition(const QString& reference, const QString& operatorText, const QString& value)
{
    for (const TextOperator& row : kTextOperators) {
        if (operatorText == QStringView(row.name))
            return QStringView(row.pattern).toString().arg(reference, PreparedText(value));
    }
    return {};
}

QString Quoted(FieldType type, const QString& value)
{
    if (IsNumber(type))
        return value;
    return u'\'' + PreparedText(value) + u'\'';
}

// Nothing equals no value: IS does.
QString ConditionWithoutValue(const QString& reference, QStringView operatorText)
{
    if (operatorText == u"=")
        return reference + u" IS NULL"_s;
    return operatorText == u"not =" ? reference + u" IS NOT NULL"_s : QString();
}

} // namespace

QString ConditionFromCell(CellFilter filter, const QString& reference, FieldType type, const Value& value,
                          const QString& displayText, const YesNoWords& words)
{
    const auto condition = [&]() -> QString {
        if (value.IsNull())
            return u"%1 IS NULL"_s.arg(reference);
        if (IsInteger(type))
            return u"%1 = %2"_s.arg(reference, WholeText(value));
        if (type == FieldType::Double) {
            const std::optional<qint64> whole = value.WholeNumber();
            const QString bound = whole ? QString::number(*whole) : QString::number(value.Number(), 'f', 6);
            return u"%1 >= %2 AND %1 <= %2"_s.arg(reference, bound);
        }
        if (type == FieldType::Date && value.Tag() == ValueTag::Date)
            return u"%1 = '%2'"_s.arg(reference, DateLiteral(value, displayText));
        if (type == FieldType::YesNo)
            return u"%1 IS %2"_s.arg(reference, displayText == words.yes ? u"TRUE"_s : u"FALSE"_s);
        return u"%1 = %2"_s.arg(reference, QuoteText(displayText));
    }();
    return filter == CellFilter::ExcludingSelection ? u"(NOT(%1))"_s.arg(condition) : condition;
}

QString FilterOperatorText(std::u16string_view name)
{
    const auto row = std::ranges::find(kShownOperators, name, &ShownOperator::name);
    return row == kShownOperators.end() ? QStringView(name).toString() : StringText(row->shown);
}

std::span<const std::u16string_view> FilterOperators(FieldType type, FilterKind kind)
{
    if (type == FieldType::YesNo)
        return kTruths;
    if (IsNumber(type) || type == FieldType::Date)
        return kComparisons;
    if (IsText(type))
        return kind == FilterKind::Range ? std::span<const std::u16string_view>(kComparisons)
                                         : std::span<const std::u16string_view>(kTextOperatorNames);
    return {};
}

QString FilterDraft::PresetYesNo(QStringView displayText)
{
    const bool yes = !displayText.isEmpty() && QStringView(u"Tt1Yy").contains(displayText.front());
    return QStringView(kTruths[yes ? 0 : 1]).toString();
}

QString FilterDraft::Condition() const
{
    if (table.isEmpty() || field.isEmpty() || type == FieldType::None)
        return {};
    const QString reference = FieldReference(table) + u'.' + FieldReference(field);
    const QString value = Trimmed(valueText);
    if (type == FieldType::YesNo)
        return operatorText.isEmpty() ? QString() : reference + u' ' + operatorText;
    if (fromTo) {
        const QString to = Trimmed(toValueText);
        const bool needsValues = !IsText(type);
        if (operatorText.isEmpty() || toOperatorText.isEmpty() ||
            (needsValues && (value.isEmpty() || to.isEmpty())))
            return {};
        return u"%1 %2 %3 AND %1 %4 %5"_s.arg(reference, operatorText, Quoted(type, value), toOperatorText,
                                              Quoted(type, to));
    }
    if (IsText(type))
        return TextCondition(reference, operatorText, value);
    if (!IsNumber(type) && type != FieldType::Date)
        return {};
    if (value.isEmpty())
        return ConditionWithoutValue(reference, operatorText);
    if (type == FieldType::Double && operatorText == u"="_s)
        return u"%1 >= %2 AND %1 <= %2"_s.arg(reference, value);
    return u"%1 %2 %3"_s.arg(reference, operatorText, Quoted(type, value));
}

QString SortFieldInsertion(const QString& box, const QString& table, const QString& field)
{
    const QString name = FieldReference(table) + u'.' + FieldReference(field) + u' ';
    return box.isEmpty() || box.endsWith(u',') ? name : u',' + name;
}

QString WordInsertion(const QString& box, const QString& word)
{
    const bool separated = box.isEmpty() || box.endsWith(u' ') || box.endsWith(u'\t');
    return (separated ? QString() : u" "_s) + word + u' ';
}

} // namespace mirel
