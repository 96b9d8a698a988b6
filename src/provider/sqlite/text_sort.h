#pragma once

#include "provider/sqlite/sort_keys.h"

#include <QtGlobal>

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace mirel::sqlite {

// Puts the row ids of one table in the order of a text column: by the user's language without regard to case,
// then by the exact text, then by row id; NULL first. Does what "ORDER BY sortkey(x), x, rowid" does in half
// the time, because each different text is made a key of only once and eight bytes of it mostly decide.
class TextSort {
public:
    // False when memory for it should not be taken; the engine's own sorting, which uses files, is for that.
    [[nodiscard]] bool Add(qint64 rowId, std::optional<std::string_view> text);
    std::vector<qint64> Finish(bool descending);

private:
    // A text in the arena: its key, then itself.
    struct Stored {
        quint32 at = 0;
        quint32 keySize = 0;
        quint32 textSize = 0;
    };
    struct Entry {
        quint64 prefix; // the first eight bytes of the key, as a number
        qint64 rowId;
        quint32 stored; // index in stored_
    };

    bool Store(std::string_view text, quint32& index);
    std::string_view KeyBehindPrefix(const Stored& stored) const;
    std::string_view TextOf(const Stored& stored) const
    {
        return std::string_view(arena_).substr(stored.at + stored.keySize, stored.textSize);
    }
    int Compare(const Entry& a, const Entry& b) const;

    SortKeys keys_;
    std::string arena_;
    std::vector<Stored> stored_;
    std::vector<Entry> entries_;
    std::vector<qint64> nulls_;
    std::vector<quint32> recent_; // by a hash of the text: index in stored_ + 1, 0 for none
};

} // namespace mirel::sqlite
