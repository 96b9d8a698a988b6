#include "data/db_connection.h"

namespace mirel {

DbConnection::DbConnection(const QString& provider)
    : provider_(CreateProvider(provider))
{
}

DbConnection::~DbConnection() = default;

} // namespace mirel
