#pragma once

#include "data/db_connection.h"
#include "platform/hr.h"
#include "platform/user_prompt.h"

#include <QString>

#include <memory>

namespace mirel {

// Statements on one database that are carried out together or not at all: taken back unless committed. Nothing may
// be asked of the user while one is open, because other programs wait for it.
//
// The connection must outlive it, and the database must stay open.
class Transaction {
public:
    Transaction(DbConnection& connection, QString database);

    [[nodiscard]] bool Begin();
    // On false everything is taken back.
    [[nodiscard]] bool Commit();

    // Why Begin or Commit failed, as every failure of the provider is told.
    void Report(UserPrompt& prompt) const;

private:
    DbConnection& connection_;
    QString database_;
    std::unique_ptr<ProviderTransaction> open_;
    Hr lastResult_ = Hr::Ok;
    QString context_;
};

} // namespace mirel
