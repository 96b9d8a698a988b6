#pragma once

#include "app/database_session.h"
#include "app/file_state.h"
#include "app/main_view_state.h"
#include "data/db_recordset.h"

#include <memory>
#include <optional>

namespace mirel {

// What is told of the selected entry at a glance: a table's fields and number of records, what a form or query was
// made for, size and last change of the database's file.
//
// Looking is cheap: the records are counted in slices afterwards, of this one table alone. What cannot be read
// is left out and reported to nobody. The session must outlive this.
class EntrySummary {
public:
    explicit EntrySummary(DatabaseSession& session);
    ~EntrySummary();
    Q_DISABLE_COPY_MOVE(EntrySummary)

    // Looks at an entry, none, or the same again.
    void LookAt(const std::optional<MainEntry>& entry);
    bool IsCounting() const { return counted_ != nullptr; }
    void CountOn(int budgetMs);
    // Lets go of the table, so that it can be dropped.
    void StopCounting();

    QString Name() const; // without an entry, the database's
    QStringList Lines() const;

private:
    QString EntryLine() const;

    DatabaseSession& session_;
    std::optional<MainEntry> entry_;
    std::unique_ptr<DbRecordset> counted_; // while it is counted
    std::optional<int> fields_;
    std::optional<qint64> records_;
    FileState file_;
};

} // namespace mirel
