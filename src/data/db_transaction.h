#pragma once

#include "data/db_connection.h"
#include "platform/user_prompt.h"

#include <QString>

#include <memory>

namespace mirel {

// Changes to one database that are one transaction: all that is written to it from Begin on, through any
// recordset, is on disk when Commit returns true, and taken back when this goes without it. They nest.
//
// No question is asked while one lives: others wait for it. The connection must outlive it.
class DbTransaction {
public:
    DbTransaction(DbConnection& connection, DatabaseLocation database)
        : connection_(connection)
        , database_(std::move(database))
    {
    }

    // Takes the lock for writing at once. False when another program holds it, or the database cannot be written.
    [[nodiscard]] bool Begin();
    [[nodiscard]] bool Commit();

    Hr LastResult() const { return lastResult_; }
    const QString& ErrorContext() const { return context_; }
    // Why Begin or Commit failed, as every failure of the provider is told. Nothing when neither did.
    void Report(UserPrompt& prompt) const;

private:
    DbConnection& connection_;
    DatabaseLocation database_;
    std::unique_ptr<ProviderTransaction> transaction_;
    Hr lastResult_ = Hr::Ok;
    QString context_;
};

} // namespace mirel
