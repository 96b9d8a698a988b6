#include "provider/sqlite/outcome.h"

#include "provider/sqlite/dialect_functions.h"
#include "provider/stop_check.h"
#include "resources/string_table.h"

#include <sqlite3.h>

namespace mirel::sqlite {

Outcome OutcomeOfSqlite(int resultCode, const QString& path, const QString& reason)
{
    switch (resultCode & 0xFF) {
    case SQLITE_OK:
    case SQLITE_ROW:
    case SQLITE_DONE:
        return {};
    case SQLITE_BUSY:
    case SQLITE_LOCKED:
        return {Hr::AccessDenied, StringText(Str::DatabaseIsBusy, {path})};
    case SQLITE_READONLY:
        return {Hr::AccessDenied, StringText(Str::DatabaseIsReadOnly, {path})};
    case SQLITE_PERM:
    case SQLITE_AUTH:
        return {Hr::AccessDenied, StringText(Str::DatabaseFailure, {path, reason})};
    case SQLITE_CANTOPEN:
        return {Hr::CannotOpen, StringText(Str::DatabaseFailure, {path, reason})};
    case SQLITE_INTERRUPT:
        return {kStopped, {}};
    case SQLITE_NOMEM:
        return {Hr::OutOfMemory, {}};
    case SQLITE_FULL:
        return {Hr::DiskFull, StringText(Str::DatabaseFailure, {path, reason})};
    case SQLITE_NOTADB:
        return {Hr::NotADatabase, StringText(Str::FileIsNoDatabase, {path})};
    case SQLITE_CORRUPT:
    case SQLITE_FORMAT:
        return {Hr::NotADatabase, StringText(Str::DatabaseIsDamaged, {path, reason})};
    case SQLITE_TOOBIG:
        return {Hr::Overflow, {}};
    case SQLITE_MISMATCH:
        return {Hr::BadLiteral, {}};
    case SQLITE_CONSTRAINT:
        return {Hr::IntegrityViolation, reason};
    case SQLITE_ERROR:
        if (const std::optional<Hr> refused = StoreFailure(reason.toStdString()))
            return {*refused, {}};
        if (reason.startsWith(u"too many columns")) // of a table as wide as can be, together with its row id
            return {Hr::TooManyColumns, {}};
        return {Hr::SyntaxError, reason};
    case SQLITE_SCHEMA:
        return {Hr::SyntaxError, reason};
    default:
        return {Hr::Unexpected, StringText(Str::DatabaseFailure, {path, reason})};
    }
}

} // namespace mirel::sqlite
