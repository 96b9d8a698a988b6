#include "data/db_transaction.h"

#include "data/provider_error.h"

namespace mirel {

bool DbTransaction::Begin()
{
    lastResult_ = Hr::NotOpen;
    transaction_.reset();
    if (ProviderConnection* provider = connection_.Provider())
        transaction_ = provider->BeginTransaction(database_, lastResult_, context_);
    return transaction_ != nullptr;
}

bool DbTransaction::Commit()
{
    lastResult_ = transaction_ ? transaction_->Commit() : Hr::NotOpen;
    context_ = transaction_ ? transaction_->ErrorContext() : QString();
    transaction_.reset();
    return !Failed(lastResult_);
}

void DbTransaction::Report(UserPrompt& prompt) const
{
    if (Failed(lastResult_))
        prompt.ShowError(ProviderErrorText(nullptr, lastResult_, context_));
}

} // namespace mirel
