#include "app/instance.h"

#include <QCoreApplication>
#include <QCryptographicHash>
#include <QDeadlineTimer>
#include <QFileInfo>
#include <QJsonDocument>
#include <QJsonObject>
#include <QSocketNotifier>

#include <array>
#include <cerrno>
#include <cstddef>
#include <cstring>
#include <fcntl.h>
#include <poll.h>
#include <sys/socket.h>
#include <sys/un.h>
#include <unistd.h>

// Sockets in Linux's abstract name space: no file is left over by a process that was killed, and asking whether a
// name is taken costs two system calls. Both ends check that the other is the same user.

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qsizetype kMostBytes = 64 * 1024; // of a request
constexpr size_t kMostCallers = 8;
constexpr int kWaiting = 8; // connections
constexpr char kTaken = '+';

struct Address {
    sockaddr_un data{};
    socklen_t size = 0;

    explicit Address(const QByteArray& name)
    {
        data.sun_family = AF_UNIX;
        const auto used = std::min<size_t>(size_t(name.size()), sizeof(data.sun_path) - 1);
        memcpy(data.sun_path + 1, name.constData(), used); // behind a NUL: abstract
        size = socklen_t(offsetof(sockaddr_un, sun_path) + 1 + used);
    }
    const sockaddr* Get() const { return reinterpret_cast<const sockaddr*>(&data); }
};

bool IsSameUser(int socket)
{
    ucred peer{};
    socklen_t size = sizeof(peer);
    return ::getsockopt(socket, SOL_SOCKET, SO_PEERCRED, &peer, &size) == 0 && peer.uid == ::getuid();
}

int NewSocket()
{
    return ::socket(AF_UNIX, SOCK_STREAM | SOCK_NONBLOCK | SOCK_CLOEXEC, 0);
}

// Closed at the end of its block.
class Socket {
public:
    Socket()
        : socket_(NewSocket())
    {
    }
    ~Socket()
    {
        if (socket_ >= 0)
            ::close(socket_);
    }
    Q_DISABLE_COPY_MOVE(Socket)
    int Get() const { return socket_; }

private:
    int socket_;
};

bool WaitFor(int socket, short events, const QDeadlineTimer& deadline)
{
    pollfd wait{socket, events, 0};
    int ready = 0;
    do
        ready = ::poll(&wait, 1, int(deadline.remainingTime()));
    while (ready < 0 && errno == EINTR);
    return ready > 0;
}

bool SendAll(int socket, const QByteArray& bytes, const QDeadlineTimer& deadline)
{
    for (qsizetype sent = 0; sent < bytes.size();) {
        const ssize_t now = ::send(socket, bytes.constData() + sent, size_t(bytes.size() - sent), MSG_NOSIGNAL);
        if (now > 0)
            sent += now;
        else if ((errno != EAGAIN && errno != EINTR) || !WaitFor(socket, POLLOUT, deadline))
            return false;
    }
    return true;
}

} // namespace

QByteArray InstanceName(const QString& home, const QString& database, const std::optional<ViewKey>& alone)
{
    const QString canonical = QFileInfo(database).canonicalFilePath();
    QStringList parts{home, canonical.isEmpty() ? database : canonical};
    if (alone)
        parts += FavoriteText({alone->kind, alone->name, {}, false});
    QCryptographicHash hash(QCryptographicHash::Sha256);
    for (const QString& part : std::as_const(parts))
        hash.addData(QByteArray::number(part.size()) + ':' + part.toUtf8());
    return "mirel-" + QByteArray::number(::getuid()) + '-' + hash.result().toHex();
}

QByteArray InstanceRequestLine(const InstanceRequest& request)
{
    QJsonObject object;
    if (request.view)
        object[u"view"] = FavoriteText({request.view->kind, request.view->name, {}, false});
    if (!request.activation.isEmpty())
        object[u"activation"] = QString::fromUtf8(request.activation);
    return QJsonDocument(object).toJson(QJsonDocument::Compact) + '\n';
}

std::optional<InstanceRequest> ReadInstanceRequest(const QByteArray& line)
{
    const QJsonDocument document = QJsonDocument::fromJson(line);
    if (!document.isObject())
        return {};
    InstanceRequest request;
    request.activation = document[u"activation"].toString().toUtf8();
    if (const QJsonValue view = document[u"view"]; !view.isUndefined()) {
        const std::optional<MainEntry> entry = FavoriteOfText(view.toString());
        if (!entry)
            return {};
        request.view = ViewKey{entry->kind, entry->name};
    }
    return request;
}

// --- the first ----------------------------------------------------------------------------------------------

bool Instance::Take(const QByteArray& name)
{
    if (name == name_)
        return true;
    Release();
    if (name.isEmpty())
        return true;
    socket_ = NewSocket();
    const Address address(name);
    if (socket_ < 0 || ::bind(socket_, address.Get(), address.size) != 0 || ::listen(socket_, kWaiting) != 0) {
        Release();
        return false;
    }
    name_ = name;
    if (QCoreApplication::instance())
        Listen();
    return true;
}

void Instance::Listen()
{
    if (socket_ < 0 || notifier_)
        return;
    notifier_ = std::make_unique<QSocketNotifier>(socket_, QSocketNotifier::Read);
    QObject::connect(notifier_.get(), &QSocketNotifier::activated, notifier_.get(), [this] { Accept(); });
}

void Instance::Release()
{
    notifier_.reset();
    while (!callers_.empty())
        Forget(callers_.begin()->first);
    if (socket_ >= 0)
        ::close(socket_);
    socket_ = -1;
    name_.clear();
}

void Instance::Accept()
{
    const int caller = ::accept4(socket_, nullptr, nullptr, SOCK_NONBLOCK | SOCK_CLOEXEC);
    if (caller < 0)
        return;
    if (!IsSameUser(caller)) {
        ::close(caller);
        return;
    }
    if (callers_.size() >= kMostCallers) // those say nothing
        Forget(callers_.begin()->first);
    Caller& entry = callers_[caller];
    entry.notifier = std::make_unique<QSocketNotifier>(caller, QSocketNotifier::Read);
    QObject::connect(entry.notifier.get(), &QSocketNotifier::activated, entry.notifier.get(),
                     [this, caller] { Read(caller); });
}

void Instance::Read(int socket)
{
    const auto caller = callers_.find(socket);
    if (caller == callers_.end())
        return;
    std::array<char, 4096> buffer{};
    const ssize_t count = ::recv(socket, buffer.data(), buffer.size(), 0);
    if (count < 0 && (errno == EAGAIN || errno == EINTR))
        return;
    QByteArray& received = caller->second.received;
    if (count > 0)
        received.append(buffer.data(), count);
    const qsizetype end = received.indexOf('\n');
    if (end < 0 && count > 0 && received.size() <= kMostBytes)
        return;
    const std::optional<InstanceRequest> request =
        end < 0 ? std::nullopt : ReadInstanceRequest(received.first(end));
    if (request)
        (void)::send(socket, &kTaken, 1, MSG_NOSIGNAL);
    Forget(socket);
    if (request && listener_)
        listener_(*request);
}

void Instance::Forget(int socket)
{
    const auto caller = callers_.find(socket);
    if (caller == callers_.end())
        return;
    caller->second.notifier->setEnabled(false);
    caller->second.notifier.release()->deleteLater(); // it may be in the middle of its signal
    callers_.erase(caller);
    ::close(socket);
}

// --- the second ---------------------------------------------------------------------------------------------

Instance::Answer Instance::HandOver(const QByteArray& name, const InstanceRequest& request, int timeoutMs)
{
    const QDeadlineTimer deadline(timeoutMs);
    const Socket socket;
    const Address address(name);
    if (socket.Get() < 0)
        return Answer::Nobody;
    if (::connect(socket.Get(), address.Get(), address.size) != 0)
        return errno == EAGAIN ? Answer::Silent : Answer::Nobody; // too many wait already
    char answer = 0;
    const bool taken = IsSameUser(socket.Get()) && SendAll(socket.Get(), InstanceRequestLine(request), deadline) &&
                       WaitFor(socket.Get(), POLLIN, deadline) && ::recv(socket.Get(), &answer, 1, 0) == 1 &&
                       answer == kTaken;
    return taken ? Answer::Taken : Answer::Silent;
}

} // namespace mirel
