#pragma once

#include "provider/sqlite/sort_keys.h"

#include <sqlite3.h>

#include <array>
#include <optional>
#include <string_view>

namespace mirel::sqlite {

// The values of one term of an order, as bytes by which they are told apart, and as keys that compare byte by byte
// as the values do. Texts stand as the user's language orders them, and keys of different texts may be the same;
// numbers and stored dates stand as the engine orders them, and their bytes are their keys.
class OrderKeys {
public:
    explicit OrderKeys(bool isText)
        : isText_(isText)
    {
    }

    bool IsText() const { return isText_; }
    // Of a value that is not NULL; borrowed until the next call or step. None: only the engine knows its place.
    std::optional<std::string_view> BytesOf(sqlite3_stmt* row, int column);
    // Of a text; borrowed until the next call.
    std::string_view KeyOf(std::string_view text);

private:
    // A mark of the kind, the number rounded down, and what was cut off.
    static constexpr size_t kNumberSize = 1 + sizeof(quint64) + sizeof(quint16);

    std::string_view NumberKey(double rounded, quint16 rest);

    bool isText_;
    SortKeys texts_;
    std::array<char, kNumberSize> number_{};
};

} // namespace mirel::sqlite
