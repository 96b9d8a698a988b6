#pragma once

#include "platform/cell.h"
#include "provider/provider.h"

#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace mirel {

// Records as JSON objects: numbers as numbers, Yes/No as true and false, a date as "YYYY-MM-DDTHH:MM:SS", binary
// as base64, NULL as null. A second column of one name has the key "Table.Field". Each call appends to `out`.
class JsonRecords {
public:
    enum class Shape { Array, Lines }; // one array of objects, or one object per line

    // The fields must outlive it.
    JsonRecords(Shape shape, std::span<const ResultField> fields);

    void Begin(std::string& out) const;
    void Record(std::span<const Cell> cells, std::string& out);
    void End(std::string& out) const;

private:
    Shape shape_;
    std::span<const ResultField> fields_;
    std::vector<std::string> keys_; // in quotes, with the colon
    bool first_ = true;
};

// A text in quotes, as JSON writes it. Bytes that are not UTF-8 become the replacement character.
void AppendJsonText(std::string& out, std::string_view utf8);

} // namespace mirel
