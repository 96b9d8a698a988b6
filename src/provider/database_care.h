#pragma once

#include "platform/hr.h"
#include "provider/database_location.h"

#include <QByteArray>
#include <QString>
#include <QStringList>

#include <functional>

namespace mirel {

// What keeps a database sound: a copy to fall back on, the engine's own check, and giving unused space back.
//
// Each fails like every other call of a provider: the result says how, and `context` what only the provider knows.
class DatabaseCare {
public:
    virtual ~DatabaseCare() = default;

    // A copy as the database stands when it is complete, while others go on reading and writing. It is made beside
    // `file` and replaces it in one step; a failure leaves what was there. `belongings` travel with the copy.
    // `progress` counts the thousandths that are done, and stops it by returning false, which is kStopped.
    virtual Hr BackUp(const DatabaseLocation& database, const QString& file, const QByteArray& belongings,
                      const std::function<bool(int)>& progress, QString& context) = 0;
    // What a copy carries along; empty for any other database.
    virtual QByteArray Belongings(const DatabaseLocation& database) = 0;
    // Both ask `goesOn` every few milliseconds meanwhile, from within this call; false stops them, which is
    // kStopped, and nothing has changed then.

    // AccessDenied while another program reads or writes. Results that are open close.
    virtual Hr Compact(const DatabaseLocation& database, const std::function<bool()>& goesOn,
                       QString& context) = 0;
    // What the engine finds wrong with its file, a line each; none: it is sound. Writes nothing.
    virtual Hr Check(const DatabaseLocation& database, const std::function<bool()>& goesOn, QStringList& findings,
                     QString& context) = 0;
};

} // namespace mirel
