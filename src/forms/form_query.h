#pragma once

#include <QString>

#include <functional>
#include <optional>

namespace mirel {

// A control's text by its name; empty optional: there is no such control.
using ControlTextOf = std::function<std::optional<QString>(QStringView name)>;

// The statement that a form's query stands for. With no FROM, "FROM [table]" goes in front of the joins, WHERE,
// GROUP BY or ORDER BY, or at the end. "&[name]" outside of quotes becomes the control's text as a quoted
// literal, NULL for an empty text; inside of quotes its text with quotes doubled. So no text of a control can
// change what the statement says. A name that no control bears stays as it is, for the provider to judge.
QString CompleteQuery(const QString& query, const QString& table, const ControlTextOf& controlText);

} // namespace mirel
