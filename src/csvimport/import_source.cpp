#include "csvimport/import_source.h"
#include "platform/system_reason.h"

#include <QBuffer>
#include <QFile>
#include <QFileInfo>

namespace mirel {

ImportSource ImportSource::OfFile(const QString& path)
{
    ImportSource source;
    source.path_ = path;
    return source;
}

ImportSource ImportSource::OfText(const QString& text)
{
    ImportSource source;
    source.bytes_ = text.toUtf8();
    return source;
}

qint64 ImportSource::SizeBytes() const
{
    return IsFile() ? QFileInfo(path_).size() : bytes_.size();
}

std::unique_ptr<QIODevice> ImportSource::Open(QString& fault) const
{
    if (!IsFile()) {
        auto buffer = std::make_unique<QBuffer>();
        buffer->setData(bytes_);
        return buffer->open(QIODevice::ReadOnly) ? std::move(buffer) : nullptr;
    }
    auto file = std::make_unique<QFile>(path_);
    if (file->open(QIODevice::ReadOnly | QIODevice::Unbuffered))
        return file;
    fault = SystemReason(*file);
    return {};
}

} // namespace mirel
