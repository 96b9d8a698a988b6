#pragma once

#include "app/database_session.h"
#include "data/db_recordset.h"
#include "resources/string_id.h"

#include <QString>
#include <QStringList>

#include <memory>
#include <optional>
#include <vector>

namespace mirel {

// What there is to know of the open database at a glance: where it is, its stamp, its size, how much is in it. The
// records of all tables are counted in slices. What cannot be read is said to be so, and reported to nobody. The
// session must outlive this.
class DatabaseFacts {
public:
    explicit DatabaseFacts(DatabaseSession& session);
    ~DatabaseFacts();
    Q_DISABLE_COPY_MOVE(DatabaseFacts)

    void Look(); // from the start
    bool IsCounting() const { return next_ < tables_.size() || counted_ != nullptr; }
    void CountOn(int budgetMs);
    void StopCounting(); // lets go of the tables

    struct Fact {
        Str label;
        QString value;
    };
    std::vector<Fact> Facts() const;

private:
    QString RecordsText() const;

    DatabaseSession& session_;
    bool isListed_ = false;
    QStringList tables_;
    qsizetype next_ = 0;                   // table to be counted
    std::unique_ptr<DbRecordset> counted_; // the one that is
    qint64 records_ = 0;
    bool isUnread_ = false; // one of the tables
};

} // namespace mirel
