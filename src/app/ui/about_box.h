#pragma once

class QWidget;

namespace mirel {

class DatabaseSession;

// The program's version, and path and stamp of the open database: copies of one database share their stamp, and
// with it forms and queries, which can be seen here alone.
void ShowAbout(const DatabaseSession& session, QWidget& parent);

} // namespace mirel
