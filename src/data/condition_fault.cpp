#include "data/condition_fault.h"

#include "provider/dialect/parser.h"

#include <algorithm>

namespace mirel {

std::optional<qsizetype> FaultInCondition(QStringView condition)
{
    // Between the parentheses that no condition can close early and go on behind.
    const QString before = QStringLiteral("SELECT * FROM T WHERE (");
    const dialect::ParseResult parsed = dialect::ParseStatement(before + condition.toString() + u')');
    const auto* failure = std::get_if<dialect::Failure>(&parsed);
    if (!failure)
        return std::nullopt;
    return std::clamp<qsizetype>(failure->at - before.size(), 0, condition.size());
}

} // namespace mirel
