// Statements of any kind, and a condition behind the first line's end: whatever they are, they are rewritten
// without a piece of them getting lost.
#include "data/statement_text.h"

#include <cstdint>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    using namespace mirel;
    const QString text = QString::fromUtf8(reinterpret_cast<const char*>(data), qsizetype(size));
    const QString statement = text.section(u'\n', 0, 0);
    const QString addition = text.section(u'\n', 1);

    const QString filtered = WithCondition(statement, addition);
    const qsizetype added = filtered.size() - statement.size();
    if (filtered != statement && (added <= addition.size() || !filtered.contains(addition)))
        __builtin_trap();
    const QString sorted = WithOrder(statement, addition);
    if (!sorted.endsWith(addition) || (KeywordPosition(statement, u"ORDER") >= 0 && sorted.isEmpty()))
        __builtin_trap();
    const QStringList columns = SelectList(statement);
    const QString reduced = WithSelectList(statement, columns);
    if (columns.isEmpty() && reduced != statement)
        __builtin_trap();
    if (!columns.isEmpty() && !reduced.startsWith(u"SELECT "))
        __builtin_trap();
    (void)IsBalanced(text);
    return 0;
}
