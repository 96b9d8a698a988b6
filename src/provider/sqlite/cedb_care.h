#pragma once

#include "provider/database_care.h"
#include "provider/sqlite/outcome.h"

#include <memory>

namespace mirel::sqlite {

class CedbProvider;
class DatabaseFile;

// The table of a copied database that holds its belongings; it is never listed.
inline constexpr const char* kBelongingsTable = "mirel_store";

class CedbCare : public DatabaseCare {
public:
    explicit CedbCare(CedbProvider& provider)
        : provider_(provider)
    {
    }

    Hr BackUp(const DatabaseLocation& database, const QString& file, const QByteArray& belongings,
              const std::function<bool(int)>& progress, QString& context) override;
    QByteArray Belongings(const DatabaseLocation& database) override;
    Hr Compact(const DatabaseLocation& database, const std::function<bool()>& goesOn, QString& context) override;
    Hr Check(const DatabaseLocation& database, const std::function<bool()>& goesOn, QStringList& findings,
             QString& context) override;

private:
    // Runs `work` on the open file; `context` is what the failure, of either, has to say.
    template <typename Work>
    Hr OnFile(const DatabaseLocation& database, QString& context, Work work);

    CedbProvider& provider_;
};

} // namespace mirel::sqlite
