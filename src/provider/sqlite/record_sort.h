#pragma once

#include "provider/sqlite/order_keys.h"
#include "provider/sqlite/plan.h"

#include <QDeadlineTimer>
#include <QtGlobal>

#include <functional>
#include <memory_resource>
#include <span>
#include <string_view>
#include <vector>

namespace mirel::sqlite {

// Puts the row ids of one table in the order of one term, then of themselves; NULL first, in a descending order
// last. Does what "ORDER BY term, rowid" does in half the time or less, and in steps: only different values are
// made keys of and sorted, the records then fall into place. Keys are compared as numbers: by eight bytes, those
// with the same eight by the next ones, and so on.
class RecordSort {
public:
    explicit RecordSort(const PlannedOrder& order)
        : keys_(order.isText)
        , descending_(order.descending)
    {
    }

    // The value in a column of the row. False when it cannot be sorted here: only the engine knows its place, or
    // memory for it should not be taken (the engine sorts in files).
    [[nodiscard]] bool Add(qint64 rowId, sqlite3_stmt* row, int column);

    // Once all are added: sorts them, then hands over all row ids in their order, each once. False when the time
    // was over before. The longest of its steps go through all different values once, without a look at them.
    bool HandOver(const QDeadlineTimer& until, const std::function<void(qint64 rowId)>& take);

private:
    // A value in the arena: its key, then, of a text, itself.
    struct Stored {
        const char* key = nullptr;
        quint32 keySize = 0;
        quint32 textSize = 0;
    };
    struct Entry {
        quint64 piece;  // eight bytes of the key, as a number
        quint32 stored; // index in stored_
    };
    // Entries whose keys are the same before the byte `at`.
    struct Task {
        size_t first;
        size_t count;
        size_t at;
    };
    // By a hash of the value. The hash is kept, so that a value is looked at only where it is likely the same. Of
    // many different values some are stored twice.
    struct Recent {
        size_t hash = 0;
        qint64 index = -1; // in stored_; -1: none
    };

    bool Store(std::string_view bytes, quint32& index);
    static std::string_view KeyOf(const Stored& stored) { return {stored.key, stored.keySize}; }
    static std::string_view TextOf(const Stored& stored) { return {stored.key + stored.keySize, stored.textSize}; }
    std::string_view BytesOf(const Stored& stored) const
    {
        return keys_.IsText() ? TextOf(stored) : KeyOf(stored);
    }

    void SortNext();
    void Sort(const Task& task);
    void Distribute(const Task& task, quint64 least, quint64 greatest);
    void SortEqualPieces(const Task& task);
    void SortWhole(std::span<Entry> entries) const;
    void RankSome();
    void CountRanks();
    void PlaceSome();
    void HandSome(const std::function<void(qint64)>& take);

    OrderKeys keys_;
    bool descending_;
    std::pmr::monotonic_buffer_resource arena_;
    size_t bytes_ = 0; // in the arena
    std::vector<Stored> stored_;
    std::vector<Recent> recent_;
    std::vector<qint64> rowIds_;
    std::vector<quint32> values_; // of each row id: index in stored_
    std::vector<qint64> nulls_;

    // How far it is: the entries, what of them is still to be sorted, how many have their rank, how many records
    // their place, and how much has been handed over.
    enum class Stage { Adding, Sorting, Ranking, Counting, Placing, Handing };
    Stage stage_ = Stage::Adding;
    std::vector<Entry> entries_; // at first with the first piece of their keys
    std::vector<Entry> scratch_;
    std::vector<Task> tasks_;
    size_t ranked_ = 0;
    std::vector<quint32> ranks_; // of each stored value: its place among the different ones
    size_t different_ = 0;
    std::vector<quint32> starts_; // of each different value: where its records begin in sorted_
    std::vector<quint32> next_;   // where the next one of them goes
    size_t placed_ = 0;
    std::vector<qint64> sorted_;
    size_t handed_ = 0; // of the different values and the NULLs, which count as one
};

} // namespace mirel::sqlite
