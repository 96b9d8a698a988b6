#include "resources/string_table.h"

#include <algorithm>
#include <iterator>
#include <string_view>

namespace mirel {
namespace {

struct Row {
    Str id;
    std::u16string_view text;
};

// A plain array: clang 14 deduces the size of a std::array up to 256 elements only.
constexpr Row kRows[] = {
#define MIREL_STRING(name, number, text) Row{Str::name, u##text},
#include "resources/strings.def"
#undef MIREL_STRING
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

QString StringText(Str id, const QStringList& arguments)
{
    const auto row = std::ranges::lower_bound(kRows, id, {}, &Row::id);
    if (row == std::end(kRows) || row->id != id)
        return {};
    return Fill(QStringView(row->text.data(), qsizetype(row->text.size())), arguments);
}

} // namespace mirel
