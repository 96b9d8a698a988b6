// Statements of any kind: what is split into clauses and joined again is the same statement to the parser, and so
// is what a diagram reads and writes.
#include "provider/dialect/parser.h"
#include "querybuilder/query_clauses.h"
#include "querybuilder/query_diagram.h"
#include "querybuilder/statement_marks.h"

#include <cstdint>

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size)
{
    using namespace mirel;
    const QString statement = QString::fromUtf8(reinterpret_cast<const char*>(data), qsizetype(size));
    const dialect::ParseResult parsed = dialect::ParseStatement(statement);
    const bool reads = std::holds_alternative<dialect::Statement>(parsed);

    const QString joined = JoinClauses(SplitStatement(statement));
    if (!ObstacleToSplitting(statement) && reads && dialect::ParseStatement(joined).index() != parsed.index())
        __builtin_trap();
    if (!ObstacleToSplitting(statement) && reads &&
        std::get<dialect::Statement>(dialect::ParseStatement(joined)) != std::get<dialect::Statement>(parsed))
        __builtin_trap();

    if (const std::optional<QueryDiagram> diagram = QueryDiagram::Read(statement)) {
        const QString written = diagram->Statement();
        const std::optional<QueryDiagram> again = QueryDiagram::Read(written);
        if (!reads || !again || again->Statement() != written)
            __builtin_trap();
    }
    QChar open;
    for (const QString& line : statement.split(u'\n')) {
        for (const StatementMark& mark : MarksOfLine(line, open)) {
            if (mark.begin < 0 || mark.begin + mark.length > line.size())
                __builtin_trap();
        }
    }
    const QString fixed = QStringLiteral("SELECT *");
    (void)WithSelectClause(fixed, WithoutSelectClause(statement, fixed));
    return 0;
}
