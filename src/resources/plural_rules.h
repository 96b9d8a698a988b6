#pragma once

#include <QStringView>

namespace mirel {

// How many forms a language has for a text with a number, and which one a number takes. The forms stand in the
// order of Qt Linguist.
struct PluralRule {
    int forms;
    int (*formOf)(quint64 number); // from 0
};

// Of a code such as "de" or "pt_BR". A language that is not in the table has two forms, as English does.
const PluralRule& PluralRuleOf(QStringView language);

} // namespace mirel
