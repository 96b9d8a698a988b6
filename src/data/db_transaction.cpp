#include "data/db_transaction.h"

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

} // namespace mirel
