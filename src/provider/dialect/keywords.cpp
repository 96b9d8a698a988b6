#include "provider/dialect/keywords.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace mirel::dialect {
namespace {

struct Row {
    std::u16string_view word;
    Keyword keyword;
};

constexpr std::array kWords = {
    Row{u"ALTER", Keyword::Alter},     Row{u"AND", Keyword::And},
    Row{u"AS", Keyword::As},           Row{u"ASC", Keyword::Asc},
    Row{u"BETWEEN", Keyword::Between}, Row{u"BY", Keyword::By},
    Row{u"CREATE", Keyword::Create},   Row{u"DELETE", Keyword::Delete},
    Row{u"DESC", Keyword::Desc},       Row{u"DISTINCT", Keyword::Distinct},
    Row{u"DROP", Keyword::Drop},       Row{u"FALSE", Keyword::False},
    Row{u"FROM", Keyword::From},       Row{u"GROUP", Keyword::Group},
    Row{u"HAVING", Keyword::Having},   Row{u"IN", Keyword::In},
    Row{u"INNER", Keyword::Inner},     Row{u"INSERT", Keyword::Insert},
    Row{u"INTO", Keyword::Into},       Row{u"IS", Keyword::Is},
    Row{u"JOIN", Keyword::Join},       Row{u"LEFT", Keyword::Left},
    Row{u"LIKE", Keyword::Like},       Row{u"NOT", Keyword::Not},
    Row{u"NULL", Keyword::Null},       Row{u"ON", Keyword::On},
    Row{u"OR", Keyword::Or},           Row{u"ORDER", Keyword::Order},
    Row{u"RIGHT", Keyword::Right},     Row{u"SELECT", Keyword::Select},
    Row{u"SET", Keyword::Set},         Row{u"TRUE", Keyword::True},
    Row{u"UNION", Keyword::Union},     Row{u"UPDATE", Keyword::Update},
    Row{u"VALUES", Keyword::Values},   Row{u"WHERE", Keyword::Where},
};
static_assert(std::ranges::is_sorted(kWords, {}, &Row::word));

constexpr size_t kLongestWord = 8;

} // namespace

Keyword FindKeyword(QStringView word)
{
    if (word.size() < 2 || size_t(word.size()) > kLongestWord)
        return Keyword::None;
    std::array<char16_t, kLongestWord> upper{};
    for (size_t i = 0; i < size_t(word.size()); ++i) {
        const char16_t unit = word[qsizetype(i)].unicode();
        upper[i] = unit >= u'a' && unit <= u'z' ? char16_t(unit - u'a' + u'A') : unit;
    }
    const std::u16string_view wanted(upper.data(), size_t(word.size()));
    const auto row = std::ranges::lower_bound(kWords, wanted, {}, &Row::word);
    return row != kWords.end() && row->word == wanted ? row->keyword : Keyword::None;
}

} // namespace mirel::dialect
