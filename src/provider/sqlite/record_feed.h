#pragma once

#include "platform/cell.h"
#include "provider/sqlite/database_file.h"

#include <string>
#include <vector>

namespace mirel::sqlite {

// Puts records into a table many at a time: they wait here, and a virtual table hands them over to one
// INSERT … SELECT. That takes little more than half the time of an INSERT for each of them, which would begin and
// end a statement, and look for the table's end, again each time.
//
// Records are put cell by cell; a cell's bytes are copied.
class RecordFeed {
public:
    explicit RecordFeed(DatabaseFile& file);
    ~RecordFeed();
    Q_DISABLE_COPY_MOVE(RecordFeed)

    // `table` and `columns` as SQL.
    Outcome Open(const QByteArray& table, const std::vector<QByteArray>& columns);

    void Put(const Cell& cell);
    void DropUnfinished() { cells_.resize(Waiting() * width_); } // the cells of a record that lacks some yet
    size_t Waiting() const { return cells_.size() / width_; }    // whole records
    bool IsFull() const;

    // Inserts what waits, all of it or nothing, and forgets it.
    Outcome Insert();

private:
    struct Source; // the virtual table

    struct Fed {
        Cell::Kind kind;
        qint64 integer; // of a text or bytes: where they begin
        double real;
        size_t size;
    };

    DatabaseFile& file_;
    QByteArray name_; // of the virtual table, no other feed's
    size_t width_ = 1;
    std::vector<Fed> cells_;
    std::string bytes_;
    StatementPtr insert_;
    bool isRegistered_ = false;
};

} // namespace mirel::sqlite
