#pragma once

#include "provider/sqlite/database_file.h"

namespace mirel::sqlite {

// Puts several reads under one lock: without it each single read takes and drops the file's lock, which costs
// fifteen times what reading a record does. Inside another transaction it does nothing.
class ReadTransaction {
public:
    explicit ReadTransaction(DatabaseFile& file)
        : file_(file)
    {
    }
    ~ReadTransaction() { (void)End(); }
    Q_DISABLE_COPY_MOVE(ReadTransaction)

    Outcome Begin();
    // Fails only when somebody wrote meanwhile and the file cannot take it.
    Outcome End();

private:
    DatabaseFile& file_;
    bool own_ = false;
};

// Changes that are done together or not at all: undone unless committed. Inside another transaction they are
// done or undone within it.
class WriteTransaction {
public:
    explicit WriteTransaction(DatabaseFile& file)
        : file_(file)
    {
    }
    ~WriteTransaction() { Undo(); }
    Q_DISABLE_COPY_MOVE(WriteTransaction)

    Outcome Begin();
    Outcome Commit();

private:
    enum class State { Idle, Outermost, Nested };

    void Undo();

    DatabaseFile& file_;
    State state_ = State::Idle;
};

} // namespace mirel::sqlite
