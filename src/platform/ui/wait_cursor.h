#pragma once

#include <QCursor>
#include <QGuiApplication>

namespace mirel {

// The wait cursor, as long as it lives.
class WaitCursor {
public:
    WaitCursor() { QGuiApplication::setOverrideCursor(Qt::WaitCursor); }
    ~WaitCursor() { QGuiApplication::restoreOverrideCursor(); }
    Q_DISABLE_COPY_MOVE(WaitCursor)
};

// The usual cursor again, for a question in the middle of that.
class UsualCursor {
public:
    UsualCursor() { QGuiApplication::setOverrideCursor(Qt::ArrowCursor); }
    ~UsualCursor() { QGuiApplication::restoreOverrideCursor(); }
    Q_DISABLE_COPY_MOVE(UsualCursor)
};

} // namespace mirel
