#pragma once

#include "provider/sqlite/database_file.h"
#include "provider/sqlite/kept_result.h"
#include "provider/sqlite/plan.h"
#include "provider/sqlite/record_writer.h"
#include "provider/sqlite/result_cursor.h"
#include "provider/sqlite/result_rows.h"

#include <QElapsedTimer>

#include <memory>
#include <optional>

namespace mirel::sqlite {

// A result that knows its records by their keys, so that every position can be reached and every value is the
// one of now. Notices what others changed, in this program or another, before it reads on.
class StaticCursor : public ResultCursor {
public:
    StaticCursor(std::shared_ptr<DatabaseFile> file, SelectPlan plan);

    Outcome Open() override;
    std::span<const ResultField> Fields() const override { return plan_.fields; }
    bool IsUpdatable() const override { return writer_.has_value(); }

    qint64 RecordCount() override;
    bool CountStep(int budgetMs) override;
    quint64 Generation() const override { return generation_; }

    bool AtBegin() const override { return place_ == Place::Before; }
    bool AtEnd() const override { return place_ == Place::Behind; }
    qint64 Position() const override { return place_ == Place::On ? position_ : -1; }
    Outcome MoveFirst() override { return MoveTo(0); }
    Outcome MoveLast() override;
    Outcome MoveNext() override;
    Outcome MovePrevious() override;
    Outcome MoveTo(qint64 position) override;

    std::optional<qint64> RecordId() const override;
    Outcome MoveToRecord(qint64 id) override;

    Outcome GetValue(int field, Value& value) override;
    Outcome Read(const ReadRange& range, const CellSink& sink) override;

    Outcome AddNew(std::span<const FieldChange> values) override;
    Outcome Update(std::span<const FieldChange> values) override;
    Outcome Delete() override;
    Outcome UpdateAll(int field, const Value& value, const BulkProgress& progress) override;
    Outcome DeleteAll(const BulkProgress& progress) override;

private:
    enum class Place { Before, On, Behind };

    // What the records looked like when positions were last made.
    struct Version {
        qint64 data = 0; // other programs
        quint64 own = 0; // this one, through anybody
        friend bool operator==(const Version&, const Version&) = default;
    };

    template <typename Work>
    Outcome InRead(Work work);
    bool HasTables() const;
    Outcome ReadVersion(Version& version);
    Outcome TakeUpChanges();
    Outcome Restart();
    Outcome FindCurrent(const RecordKey& key);
    Outcome Settle(qint64 position);
    Outcome CountAll();
    Outcome CountAnew(); // all, as they are now
    Outcome LoadRecord();
    bool HaveValuesAged();
    qint64& RowIdOfCurrent() { return key_[plan_.updatableSource]; }
    void AdoptOwnChange();

    std::shared_ptr<DatabaseFile> file_;
    SelectPlan plan_;
    std::optional<KeptResult> kept_;
    std::unique_ptr<ResultRows> rows_;
    std::optional<RecordWriter> writer_;
    Version version_;
    quint64 generation_ = 0;

    Place place_ = Place::Before;
    qint64 position_ = -1;
    RecordKey key_;             // of the current record
    std::vector<Value> values_; // of the current record, once one was asked for
    qint64 valuesAsOf_ = -1;    // the handle's count of changes when they were read
    Version valuesVersion_;     // and what others had written by then
    QElapsedTimer sinceLook_;   // when that was last compared
};

} // namespace mirel::sqlite
