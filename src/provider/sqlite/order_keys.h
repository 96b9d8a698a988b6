#pragma once

#include "provider/sqlite/sort_keys.h"

#include <sqlite3.h>

#include <array>
#include <optional>
#include <string_view>

namespace mirel::sqlite {

// The values of one term of an order as bytes that compare as the values do. Texts stand as the user's language
// orders them, ties by the exact text; numbers and stored dates as the engine orders them.
class OrderKeys {
public:
    struct Key {
        std::string_view bytes;
        std::string_view text{}; // decides where the bytes are the same
    };

    explicit OrderKeys(bool isText)
        : isText_(isText)
    {
    }

    // Of a value that is not NULL; borrowed until the next call or step. None: only the engine knows its place.
    std::optional<Key> KeyOf(sqlite3_stmt* row, int column);

private:
    // A mark of the kind, the number rounded down, and what was cut off.
    static constexpr size_t kNumberSize = 1 + sizeof(quint64) + sizeof(quint16);

    Key NumberKey(double rounded, quint16 rest);

    bool isText_;
    SortKeys texts_;
    std::array<char, kNumberSize> number_{};
};

} // namespace mirel::sqlite
