#pragma once

#include "platform/cell.h"
#include "platform/ole_date.h"
#include "provider/provider.h"
#include "provider/sqlite/statement.h"

namespace mirel::sqlite {

// Binds cells to the parameters of a statement after checking them against their columns: what fits goes from
// the caller's bytes into the file without a copy, the rest is converted as every value is.
class CellBinder {
public:
    explicit CellBinder(const ResultField& field)
        : type_(field.type)
        , size_(field.size)
    {
    }

    // On failure nothing was bound. What was bound is good while the cell's bytes and the binder stay.
    [[nodiscard]] Hr Bind(Statement& statement, int parameter, const Cell& cell);

private:
    [[nodiscard]] Hr BindText(Statement& statement, int parameter, std::string_view utf8) const;
    [[nodiscard]] Hr BindDate(Statement& statement, int parameter, std::string_view text);
    [[nodiscard]] Hr BindInteger(Statement& statement, int parameter, qint64 number) const;
    [[nodiscard]] Hr BindConverted(Statement& statement, int parameter, const Cell& cell) const;

    FieldType type_;
    int size_;
    StoredDate date_;
};

} // namespace mirel::sqlite
