#pragma once

#include "platform/field_type.h"
#include "platform/value.h"

#include <QByteArray>

#include <sqlite3.h>

#include <list>
#include <memory>
#include <optional>
#include <string_view>

namespace mirel::sqlite {

struct StatementCloser {
    void operator()(sqlite3_stmt* statement) const { sqlite3_finalize(statement); }
};
using StatementPtr = std::unique_ptr<sqlite3_stmt, StatementCloser>;

class StatementCache;

// A prepared statement on loan from its cache. Going out of scope resets it, so that no statement of ours keeps
// a lock beyond the call that ran it, and gives it back.
//
// Parameters count from 1, columns from 0. A parameter that could not be bound makes Step fail.
class Statement {
public:
    Statement() = default;
    Statement(std::weak_ptr<StatementCache> cache, QByteArray sql, StatementPtr statement);
    ~Statement();
    Statement(Statement&& other) noexcept = default;
    Statement& operator=(Statement&& other) = delete;

    explicit operator bool() const { return statement_ != nullptr; }
    sqlite3_stmt* Get() const { return statement_.get(); }

    void Bind(int parameter, qint64 number) { Keep(sqlite3_bind_int64(Get(), parameter, number)); }
    void Bind(int parameter, double number) { Keep(sqlite3_bind_double(Get(), parameter, number)); }
    void BindNull(int parameter) { Keep(sqlite3_bind_null(Get(), parameter)); }
    // A value that was converted for its column.
    void Bind(int parameter, const Value& value);

    // SQLITE_ROW, SQLITE_DONE, or what failed.
    int Step() { return bindResult_ == SQLITE_OK ? sqlite3_step(Get()) : bindResult_; }
    void Reset()
    {
        sqlite3_reset(Get());
        bindResult_ = SQLITE_OK;
    }

    qint64 Integer(int column) const { return sqlite3_column_int64(Get(), column); }
    QString Text(int column) const;
    std::optional<std::string_view> TextView(int column) const; // until the next step; empty for NULL

private:
    void Keep(int result)
    {
        if (result != SQLITE_OK)
            bindResult_ = result;
    }

    std::weak_ptr<StatementCache> cache_;
    QByteArray sql_;
    StatementPtr statement_;
    int bindResult_ = SQLITE_OK;
};

// The prepared, reset statements of one database handle, the latest used first. Dies with the handle; a loan
// that comes back later is finalised.
class StatementCache : public std::enable_shared_from_this<StatementCache> {
public:
    // An empty loan when the statement does not prepare; the handle then knows why.
    Statement Lend(sqlite3* handle, const QByteArray& sql);
    void TakeBack(QByteArray sql, StatementPtr statement);
    void Clear() { idle_.clear(); }

private:
    struct Idle {
        QByteArray sql;
        StatementPtr statement;
    };
    std::list<Idle> idle_;
};

} // namespace mirel::sqlite
