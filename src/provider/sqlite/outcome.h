#pragma once

#include "platform/hr.h"

#include <QString>

namespace mirel::sqlite {

// How a call inside this folder ended: the code, and what only the engine knows about it (path and reason).
struct [[nodiscard]] Outcome {
    Hr code = Hr::Ok;
    QString context;

    bool Ok() const { return !Failed(code); }
};

// What a result code of SQLite is for the rest of the system. `reason` is the engine's own message.
Outcome OutcomeOfSqlite(int resultCode, const QString& path, const QString& reason);

} // namespace mirel::sqlite
