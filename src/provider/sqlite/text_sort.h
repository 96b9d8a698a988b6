#pragma once

#include "provider/sqlite/sort_keys.h"

#include <QtGlobal>

#include <cstdint>
#include <functional>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace mirel::sqlite {

// Puts the row ids of one table in the order of a text column: by the user's language without regard to case,
// then by the exact text, then by row id; NULL first. Does what "ORDER BY sortkey(x), x, rowid" does in half
// the time or less: only different texts are made keys of and sorted, the records then fall into place. Keys are
// compared as numbers: by their first eight bytes, those with the same eight by the next ones, and so on.
class TextSort {
public:
    // False when memory for it should not be taken; the engine's own sorting, which uses files, is for that.
    [[nodiscard]] bool Add(qint64 rowId, std::optional<std::string_view> text);
    // Hands over all row ids in their order, once.
    void Finish(bool descending, const std::function<void(qint64 rowId)>& take);

private:
    // A text in the arena: its key, then itself.
    struct Stored {
        quint32 at = 0;
        quint32 keySize = 0;
        quint32 textSize = 0;
    };
    struct Entry {
        quint64 piece;  // eight bytes of the key, as a number
        quint32 stored; // index in stored_
    };

    bool Store(std::string_view text, quint32& index);
    std::string_view KeyOf(const Stored& stored) const
    {
        return std::string_view(arena_).substr(stored.at, stored.keySize);
    }
    std::string_view TextOf(const Stored& stored) const
    {
        return std::string_view(arena_).substr(stored.at + stored.keySize, stored.textSize);
    }
    // Entries whose keys are the same up to piece number `piece`.
    void SortFrom(int piece, std::span<Entry> entries);
    void SortWhole(std::span<Entry> entries) const;
    // The place of each stored text among the different ones; how many those are.
    quint32 Rank(std::vector<quint32>& ranks);

    SortKeys keys_;
    std::string arena_;
    std::vector<Stored> stored_;
    std::vector<qint64> rowIds_;
    std::vector<quint32> texts_; // of each row id: index in stored_
    std::vector<qint64> nulls_;
    // By a hash of the text. The hash is kept, so that a text is looked at only where it is likely the same. Of
    // many different texts some are stored twice.
    struct Recent {
        size_t hash = 0;
        qint64 index = -1; // in stored_; -1: none
    };
    std::vector<Recent> recent_;
};

} // namespace mirel::sqlite
