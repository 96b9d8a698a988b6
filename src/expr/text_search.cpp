#include "expr/text_search.h"

#include <algorithm>
#include <functional>
#include <string_view>
#include <utility>
#include <vector>

namespace mirel {
namespace {

// Comparing at each place in turn is fastest for these, but takes the product of both lengths at worst.
constexpr qsizetype kShort = 64;

// Finds a long text by Knuth, Morris and Pratt: in one pass, whatever the texts hold. (The standard library's
// Boyer-Moore searcher takes quadratic time to prepare.)
template <typename Iterator>
class OnePassSearcher {
public:
    OnePassSearcher(Iterator wantedBegin, Iterator wantedEnd)
        : wanted_(wantedBegin)
        , border_(size_t(wantedEnd - wantedBegin))
    {
        for (size_t i = 1, matched = 0; i < border_.size(); ++i) {
            matched = Extend(matched, wanted_[ptrdiff_t(i)]);
            border_[i] = matched;
        }
    }

    std::pair<Iterator, Iterator> operator()(Iterator begin, Iterator end) const
    {
        size_t matched = 0;
        for (Iterator at = begin; at != end; ++at) {
            matched = Extend(matched, *at);
            if (matched == border_.size())
                return {at + 1 - ptrdiff_t(matched), at + 1};
        }
        return {end, end};
    }

private:
    // How much of the beginning of `wanted` ends with `unit`, when `matched` of it ended just before.
    size_t Extend(size_t matched, char16_t unit) const
    {
        while (matched > 0 && wanted_[ptrdiff_t(matched)] != unit)
            matched = border_[matched - 1];
        return wanted_[ptrdiff_t(matched)] == unit ? matched + 1 : 0;
    }

    Iterator wanted_;
    std::vector<size_t> border_; // of each beginning of `wanted`: its longest beginning that is also its end
};

// The place of the `occurrence`-th match, or `end`; no match overlaps the one before.
template <typename Iterator>
Iterator FindMatch(Iterator begin, Iterator end, Iterator wantedBegin, Iterator wantedEnd, qint64 occurrence)
{
    const auto find = [&](const auto& searcher) {
        for (Iterator rest = begin;;) {
            const Iterator at = std::search(rest, end, searcher);
            if (at == end || --occurrence == 0)
                return at;
            rest = at + (wantedEnd - wantedBegin);
        }
    };
    if (wantedEnd - wantedBegin <= kShort)
        return find(std::default_searcher(wantedBegin, wantedEnd));
    return find(OnePassSearcher(wantedBegin, wantedEnd));
}

std::u16string_view Units(QStringView text)
{
    return {text.utf16(), size_t(text.size())};
}

} // namespace

qsizetype FindText(QStringView text, QStringView wanted, qsizetype from)
{
    if (wanted.size() <= kShort)
        return text.indexOf(wanted, from);
    const std::u16string_view units = Units(text).substr(size_t(from));
    const std::u16string_view sought = Units(wanted);
    const auto at = FindMatch(units.begin(), units.end(), sought.begin(), sought.end(), 1);
    return at == units.end() ? -1 : from + (at - units.begin());
}

qsizetype PositionOfMatch(QStringView text, QStringView wanted, qint64 start, qint64 occurrence)
{
    if (start == 0)
        start = 1;
    if (wanted.isEmpty() || occurrence < 1 || std::abs(start) > text.size())
        return 0;
    const std::u16string_view units = Units(text);
    const std::u16string_view sought = Units(wanted);
    if (start > 0) {
        const auto from = units.begin() + (start - 1);
        const auto at = FindMatch(from, units.end(), sought.begin(), sought.end(), occurrence);
        return at == units.end() ? 0 : at - units.begin() + 1;
    }
    const auto from = units.rbegin() + (-start - 1);
    const auto at = FindMatch(from, units.rend(), sought.rbegin(), sought.rend(), occurrence);
    return at == units.rend() ? 0 : units.rend() - at - wanted.size() + 1;
}

} // namespace mirel
