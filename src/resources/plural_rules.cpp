#include "resources/plural_rules.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace mirel {
namespace {

int One(quint64)
{
    return 0;
}

int OneOrMore(quint64 n)
{
    return n == 1 ? 0 : 1;
}

int UpToOneOrMore(quint64 n)
{
    return n < 2 ? 0 : 1;
}

bool EndsInFew(quint64 n) // 2 to 4, but not 12 to 14
{
    return n % 10 >= 2 && n % 10 <= 4 && (n % 100 < 10 || n % 100 >= 20);
}

int EastSlavic(quint64 n)
{
    return n % 10 == 1 && n % 100 != 11 ? 0 : EndsInFew(n) ? 1 : 2;
}

int Polish(quint64 n)
{
    return n == 1 ? 0 : EndsInFew(n) ? 1 : 2;
}

int Czech(quint64 n)
{
    return n == 1 ? 0 : n >= 2 && n <= 4 ? 1 : 2;
}

int Slovenian(quint64 n)
{
    return n % 100 == 1 ? 0 : n % 100 == 2 ? 1 : n % 100 == 3 || n % 100 == 4 ? 2 : 3;
}

int Romanian(quint64 n)
{
    return n == 1 ? 0 : n == 0 || (n % 100 >= 1 && n % 100 <= 19) ? 1 : 2;
}

int Lithuanian(quint64 n)
{
    const bool teen = n % 100 >= 11 && n % 100 <= 19;
    return n % 10 == 1 && !teen ? 0 : n % 10 != 0 && !teen ? 1 : 2;
}

int Latvian(quint64 n)
{
    return n % 10 == 1 && n % 100 != 11 ? 0 : n != 0 ? 1 : 2;
}

int Arabic(quint64 n)
{
    if (n < 3)
        return int(n);
    const quint64 last = n % 100;
    return last >= 3 && last <= 10 ? 3 : last >= 11 ? 4 : 5;
}

struct Row {
    std::u16string_view language;
    PluralRule rule;
};

constexpr PluralRule kOneForm{1, One};
constexpr PluralRule kUpToOne{2, UpToOneOrMore};
constexpr PluralRule kEastSlavic{3, EastSlavic};
constexpr PluralRule kCzech{3, Czech};
constexpr PluralRule kUsual{2, OneOrMore};

// The longer code first.
constexpr std::array kRules = {
    Row{u"pt_BR", kUpToOne},     Row{u"fr", kUpToOne},     Row{u"hy", kUpToOne},       Row{u"ja", kOneForm},
    Row{u"zh", kOneForm},        Row{u"ko", kOneForm},     Row{u"vi", kOneForm},       Row{u"th", kOneForm},
    Row{u"id", kOneForm},        Row{u"ms", kOneForm},     Row{u"tr", kOneForm},       Row{u"hu", kOneForm},
    Row{u"fa", kOneForm},        Row{u"ru", kEastSlavic},  Row{u"uk", kEastSlavic},    Row{u"be", kEastSlavic},
    Row{u"sr", kEastSlavic},     Row{u"hr", kEastSlavic},  Row{u"bs", kEastSlavic},    Row{u"cs", kCzech},
    Row{u"sk", kCzech},          Row{u"pl", {3, Polish}},  Row{u"sl", {4, Slovenian}}, Row{u"ro", {3, Romanian}},
    Row{u"lt", {3, Lithuanian}}, Row{u"lv", {3, Latvian}}, Row{u"ar", {6, Arabic}},
};

} // namespace

const PluralRule& PluralRuleOf(QStringView language)
{
    const auto row = std::ranges::find_if(kRules, [language](const Row& each) {
        const QStringView code(each.language.data(), qsizetype(each.language.size()));
        const bool whole =
            language.size() == code.size() || (language.size() > code.size() && language[code.size()] == u'_');
        return whole && language.startsWith(code);
    });
    return row == kRules.end() ? kUsual : row->rule;
}

} // namespace mirel
