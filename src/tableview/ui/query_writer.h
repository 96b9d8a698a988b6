#pragma once

#include <QString>

#include <functional>

class QWidget;

namespace mirel {

// How this room has a statement written by the query builder, which is a floor of its own. The maker of the views
// gives them the function.
struct QueryWanted {
    QString statement; // what it begins with
    QString table;     // the current one
    bool mayBeSaved = false;
};
// Takes the statement; false: it was refused, which was told, and the builder stays. `name` is empty when it was
// not saved.
using TakeQuery = std::function<bool(const QString& name, const QString& statement)>;
using WriteQuery = std::function<void(const QueryWanted& wanted, const TakeQuery& take, QWidget& window)>;

} // namespace mirel
