#pragma once

#include "app/view_list.h"

#include <QByteArray>
#include <QSocketNotifier>
#include <QString>

#include <functional>
#include <map>
#include <memory>
#include <optional>

namespace mirel {

// What a second start asks of the window that has the database open already.
struct InstanceRequest {
    std::optional<ViewKey> view; // to be opened; none: the window comes forward, no more
    QByteArray activation;       // the desktop's permission to come forward; may be empty

    friend bool operator==(const InstanceRequest&, const InstanceRequest&) = default;
};
QByteArray InstanceRequestLine(const InstanceRequest& request);             // with its line end
std::optional<InstanceRequest> ReadInstanceRequest(const QByteArray& line); // none: it does not read

// The name under which a window is found that has `database` open, of this user and this program folder. A window
// that shows one view alone has a name of its own: only who wants that view is led there.
QByteArray InstanceName(const QString& home, const QString& database, const std::optional<ViewKey>& alone);

// Makes one window of two starts with the same database: the first has the name, the second finds it and hands its
// wish over. A name ends with its process, however that ends. Without the name a program runs all the same, as a
// window of its own.
class Instance {
public:
    Instance() = default;
    ~Instance() { Release(); }
    Q_DISABLE_COPY_MOVE(Instance)

    // Is called in the event loop.
    void SetListener(std::function<void(const InstanceRequest&)> listener) { listener_ = std::move(listener); }

    // Gives back the name that this process has, and takes this one; empty: none. False when another has it.
    // Before there is an application object only the name is taken; who calls then waits until Listen.
    bool Take(const QByteArray& name);
    void Listen();
    void Release();
    const QByteArray& Name() const { return name_; } // empty: it has none

    // Whether the process that has the name took the request over: Nobody has it, or who has it is Silent for so
    // long.
    enum class Answer { Taken, Nobody, Silent };
    static Answer HandOver(const QByteArray& name, const InstanceRequest& request, int timeoutMs);

private:
    struct Caller {
        std::unique_ptr<QSocketNotifier> notifier;
        QByteArray received;
    };
    void Accept();
    void Read(int socket);
    void Forget(int socket);

    int socket_ = -1;
    QByteArray name_;
    std::unique_ptr<QSocketNotifier> notifier_;
    std::map<int, Caller> callers_;
    std::function<void(const InstanceRequest&)> listener_;
};

} // namespace mirel
