#pragma once

#include "app/database_session.h"
#include "platform/program_folder.h"

#include <QString>

namespace mirel {

// A small database to try things on: bird strikes, airports, and invented contacts and orders that have every type
// of field. It is made in the program folder from the CSV files that come with the program, on the day it is first
// wanted; from then on it is the user's.
class SampleDatabase {
public:
    // `source` is the folder with the CSV files.
    SampleDatabase(const ProgramFolder& folder, QString source);

    QString Path() const { return path_; }
    // Opens it in the session, and makes it first where it is not there. False, and the session as it was, when
    // that fails: why was told to the session's prompt, and nothing half-made is left.
    bool Open(DatabaseSession& session) const;
    // The same in steps: makes the file where it is not there; fills a new one's store once it is the session's.
    bool Provide(DatabaseSession& session) const;
    void Furnish(DatabaseSession& session) const;

private:
    bool Make(DatabaseSession& session, const QString& path) const;

    QString folder_;
    QString path_;
    QString source_;
};

} // namespace mirel
