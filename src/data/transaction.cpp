#include "data/transaction.h"

#include "data/provider_error.h"

namespace mirel {

Transaction::Transaction(DbConnection& connection, QString database)
    : connection_(connection)
    , database_(std::move(database))
{
}

bool Transaction::Begin()
{
    lastResult_ = Hr::Unexpected;
    if (ProviderConnection* provider = connection_.Provider())
        open_ = provider->BeginTransaction(database_, lastResult_, context_);
    return open_ != nullptr;
}

bool Transaction::Commit()
{
    lastResult_ = open_->Commit();
    context_ = open_->ErrorContext();
    open_.reset();
    return !Failed(lastResult_);
}

void Transaction::Report(UserPrompt& prompt) const
{
    if (Failed(lastResult_))
        prompt.ShowError(ProviderErrorText(nullptr, lastResult_, context_));
}

} // namespace mirel
