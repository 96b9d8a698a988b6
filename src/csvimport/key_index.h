#pragma once

#include "csvimport/import_plan.h"
#include "data/db_recordset.h"
#include "platform/record_id.h"

#include <optional>
#include <span>
#include <string>
#include <unordered_map>
#include <vector>

namespace mirel {

// The records of a table by the values of some of their fields, and which lines of a file bear the same values.
class KeyIndex {
public:
    // Where a line goes.
    struct Entry {
        RecordId record; // null: the table holds none with that key
        bool several = false;
        qint64 lastLine = 0; // of the file, that bears it; 0: none
    };

    // Reads the key of every record of an open result. `fields`: indexes there. False when it cannot be read.
    [[nodiscard]] bool Build(DbRecordset& table, std::span<const int> fields);

    // The key of a line; empty where one of its cells is NULL. `at`: which of the cells make it up.
    static std::optional<std::string> KeyOf(std::span<const Cell> cells, std::span<const int> at);
    // Takes a line in. False when its key names several records.
    [[nodiscard]] bool AddLine(const std::optional<std::string>& key, qint64 line);
    // Null: no line bears it.
    const Entry* Find(const std::string& key) const;

    const KeyCounts& Counts() const { return counts_; }

private:
    std::unordered_map<std::string, Entry> entries_;
    KeyCounts counts_;
};

} // namespace mirel
