#pragma once

#include "provider/provider.h"

#include <QString>

#include <memory>

namespace mirel {

// The application's single connection to its data provider. It opens no database by itself: every result names its
// database file. Must outlive every DbRecordset made with it.
class DbConnection {
public:
    explicit DbConnection(const QString& provider = QStringLiteral("cedb"));
    ~DbConnection();
    Q_DISABLE_COPY_MOVE(DbConnection)

    // Null when no provider has that name; every Open then fails.
    ProviderConnection* Provider() const { return provider_.get(); }

private:
    std::unique_ptr<ProviderConnection> provider_;
};

} // namespace mirel
