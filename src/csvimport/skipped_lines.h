#pragma once

#include "platform/system_reason.h"

#include <QByteArray>
#include <QSaveFile>

#include <memory>

namespace mirel {

// The file that takes the lines that failed. It is made with the first of them, and there once all are written.
class SkippedLines {
public:
    // `start`: what the file begins with.
    SkippedLines(QString path, QByteArray start)
        : path_(std::move(path))
        , start_(std::move(start))
    {
    }

    // Each is false when the file cannot be written; ErrorText says why.
    [[nodiscard]] bool Add(const QByteArray& line);
    [[nodiscard]] bool Commit();

    QString ErrorText() const { return file_ ? SystemReason(*file_) : QString(); }
    qint64 Count() const { return count_; }

private:
    QString path_;
    QByteArray start_;
    std::unique_ptr<QSaveFile> file_;
    qint64 count_ = 0;
};

} // namespace mirel
