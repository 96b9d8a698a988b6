#include "resources/string_table.h"

#include "resources/language.h"
#include "resources/string_rows.h"

#include <algorithm>
#include <iterator>

namespace mirel {
namespace {

// A plain array: clang 14 deduces the size of a std::array up to 256 elements only.
constexpr StringRow kRows[] = {
#define MIREL_STRING(name, number, text) StringRow{Str::name, 0, {}, u##text},
#define MIREL_COUNTED(name, number, counted, one, many) StringRow{Str::name, counted, u##one, u##many},
#include "resources/strings.def"
#undef MIREL_STRING
#undef MIREL_COUNTED
};

constexpr bool NumbersRise()
{
    for (size_t i = 1; i < std::size(kRows); ++i) {
        if (kRows[i - 1].id >= kRows[i].id)
            return false;
    }
    return true;
}
static_assert(NumbersRise(), "strings.def is sorted by number, and no number stands twice");

// The number in an argument, whatever separates its groups of digits.
quint64 CountIn(QStringView argument)
{
    constexpr quint64 kMost = 1'000'000'000'000'000;
    quint64 count = 0;
    for (const QChar letter : argument) {
        if (letter.isDigit() && count < kMost)
            count = count * 10 + quint64(letter.digitValue());
    }
    return count;
}

QString Fill(QStringView pattern, const QStringList& arguments)
{
    QString filled;
    for (qsizetype i = 0; i < pattern.size(); ++i) {
        const int index = pattern[i] == u'%' && i + 1 < pattern.size() ? pattern[i + 1].unicode() - u'1' : -1;
        if (index < 0 || index >= arguments.size()) {
            filled += pattern[i];
            continue;
        }
        filled += arguments[index];
        ++i;
    }
    return filled;
}

} // namespace

std::span<const StringRow> StringRows()
{
    return kRows;
}

const StringRow* FindStringRow(Str id)
{
    const auto row = std::ranges::lower_bound(kRows, id, {}, &StringRow::id);
    return row == std::end(kRows) || row->id != id ? nullptr : row;
}

QString StringText(Str id, const QStringList& arguments)
{
    const StringRow* row = FindStringRow(id);
    if (!row)
        return {};
    const quint64 count = row->counted > 0 ? CountIn(arguments.value(row->counted - 1)) : 0;
    if (const LanguageTexts* spoken = SpokenLanguage()) {
        const QStringView pattern = spoken->Pattern(id, count);
        if (!pattern.isNull())
            return Fill(pattern, arguments);
    }
    const std::u16string_view english = row->counted > 0 && count == 1 ? row->one : row->text;
    return Fill(QStringView(english.data(), qsizetype(english.size())), arguments);
}

} // namespace mirel
