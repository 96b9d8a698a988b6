#pragma once

#include <QtGlobal>

#include <csignal>
#include <sys/resource.h>

namespace mirel {

// As long as it lives, no file that is written grows beyond so many bytes: a full disk, as plain files meet it.
class FileSizeLimit {
public:
    explicit FileSizeLimit(quint64 sizeBytes)
    {
        getrlimit(RLIMIT_FSIZE, &before_);
        handler_ = std::signal(SIGXFSZ, SIG_IGN); // the write fails instead
        const rlimit limit{sizeBytes, before_.rlim_max};
        setrlimit(RLIMIT_FSIZE, &limit);
    }
    ~FileSizeLimit()
    {
        setrlimit(RLIMIT_FSIZE, &before_);
        std::signal(SIGXFSZ, handler_);
    }
    Q_DISABLE_COPY_MOVE(FileSizeLimit)

private:
    rlimit before_{};
    void (*handler_)(int) = SIG_DFL;
};

} // namespace mirel
