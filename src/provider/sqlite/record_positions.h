#pragma once

#include "provider/sqlite/database_file.h"
#include "provider/sqlite/plan.h"
#include "provider/sqlite/result_rows.h"

#include <memory>

namespace mirel::sqlite {

// Which record of a result stands where, and for which state of the file that was found out. The caller holds the
// read transaction.
//
// Where it is allowed, a result that takes a long search or sort stays the old one after a change, while the new
// one is made in steps.
class RecordPositions {
public:
    // What somebody has changed since the last look: values alone, or which records there are and where.
    enum class Change { None, Values, Records };

    // Both must outlive it.
    RecordPositions(DatabaseFile& file, const SelectPlan& plan);

    // `isShared`: others can change these records.
    Outcome Begin(bool isShared);
    ResultRows& Rows() const { return *rows_; }

    // After Records all positions are to be learned again, unless they are behind. Within a transaction, and after
    // a change of the file's structure, they are not left behind.
    Outcome Look(Change& change);
    // All positions are to be learned again.
    Outcome Renew();
    // After a change of ours that the rows know of. What another program has committed since is still to come.
    void AdoptOwnChange();
    void AdoptOwnValues();

    void AllowOldOrder(qint64 fromRowIds) { oldFrom_ = fromRowIds; }
    bool IsBehind() const { return coming_ != nullptr; }
    // The file's structure is what it was: nobody gave the records other row ids.
    bool AreKeysTheSame() const { return file_.SchemaVersion() == structure_; }
    // `isNew`: the rows are others now. They may be behind once more, where they have been changed meanwhile.
    Outcome CatchUp(const QDeadlineTimer& until, bool& isNew);
    // After a failure: the next look finds that everything has changed.
    void GiveUp();

    // Whether the file still has the record.
    Outcome Holds(const RecordKey& key, bool& holds) const;

private:
    struct Version {
        qint64 data = 0;    // other programs
        quint64 own = 0;    // this one, through anybody: records that came or went
        quint64 values = 0; // and values

        bool HasSameRecords(const Version& other) const { return data == other.data && own == other.own; }
        friend bool operator==(const Version&, const Version&) = default;
    };

    std::unique_ptr<ResultRows> MakeRows() const;
    quint64 OwnVersion() const;
    Outcome ReadVersion(Version& version) const;
    bool MayStayOld() const;
    void BeginComing();

    DatabaseFile& file_;
    const SelectPlan& plan_;
    bool isShared_ = true;
    std::unique_ptr<ResultRows> rows_;
    Version version_; // at the last look

    qint64 oldFrom_ = std::numeric_limits<qint64>::max(); // among so many row ids
    qint64 structure_ = -1;                               // of the file, when the rows were begun
    std::unique_ptr<ResultRows> coming_;                  // what the rows will be
    Version comingVersion_;                               // when they were begun
};

} // namespace mirel::sqlite
