#pragma once

#include "platform/cell.h"
#include "platform/field_type.h"
#include "platform/ole_date.h"
#include "platform/value.h"
#include "provider/cell_value.h"
#include "provider/provider.h"

#include <sqlite3.h>

#include <span>
#include <vector>

namespace mirel::sqlite {

// Reads the fields of a result off the rows of a statement, each as its column's type asks: dates in our stored
// form whatever the file holds, Yes/No as 0 or 1. What does not read as its type comes as it stands.
class RowReader {
public:
    // Where the fields stand in the statement: those asked for, one after the other, or each at its own index
    // among all.
    enum class Layout { Listed, Whole };

    RowReader(std::span<const ResultField> result, std::span<const int> fields, Layout layout);

    // Borrowed until the statement moves on.
    std::span<const Cell> Read(sqlite3_stmt* row);

private:
    struct Slot {
        int column;
        FieldType type;
        StoredDate date;     // a date that the file holds in another form
        QByteArray repaired; // a text that the file holds in no UTF-8
    };

    static Cell ReadSlot(Slot& slot, sqlite3_stmt* row);

    std::vector<Slot> slots_;
    std::vector<Cell> cells_;
};

// 0, 1, 2, …: all fields of a result.
std::vector<int> AllFields(std::span<const ResultField> result);

} // namespace mirel::sqlite
