#include "cli/output.h"

#include <QByteArray>
#include <QtGlobal>

#include <cerrno>
#include <unistd.h>

namespace mirel::cli {
namespace {

using namespace Qt::StringLiterals;

// The errno, 0 when all was written.
int WriteAll(int fileDescriptor, std::string_view bytes)
{
    while (!bytes.empty()) {
        const ssize_t count = ::write(fileDescriptor, bytes.data(), bytes.size());
        if (count < 0 && errno == EINTR)
            continue;
        if (count < 0)
            return errno;
        bytes.remove_prefix(size_t(count));
    }
    return 0;
}

} // namespace

Output::Output(int fileDescriptor)
    : fileDescriptor_(fileDescriptor)
    , buffer_(new char[kBufferBytes])
{
}

Output::~Output()
{
    Flush();
}

void Output::WriteText(QStringView text)
{
    if (WriteAscii(text))
        return;
    const QByteArray utf8 = text.toUtf8();
    Write({utf8.constData(), size_t(utf8.size())});
}

// False, and nothing written, for other characters and for texts that the buffer has no room for.
bool Output::WriteAscii(QStringView text)
{
    if (size_t(text.size()) > kBufferBytes - used_)
        return false;
    char16_t bits = 0;
    for (qsizetype i = 0; i < text.size(); ++i) {
        const char16_t unit = text.utf16()[i];
        buffer_[used_ + size_t(i)] = char(unit);
        bits |= unit;
    }
    if (bits >= 0x80)
        return false;
    used_ += size_t(text.size());
    return true;
}

void Output::WriteLine(QStringView text)
{
    WriteText(text);
    Write('\n');
}

bool Output::Flush()
{
    if (failed_ == 0)
        failed_ = WriteAll(fileDescriptor_, {buffer_.get(), used_});
    used_ = 0;
    return failed_ == 0;
}

void Output::WriteThrough(std::string_view bytes)
{
    Flush();
    if (bytes.size() <= kBufferBytes)
        Write(bytes);
    else if (failed_ == 0)
        failed_ = WriteAll(fileDescriptor_, bytes);
}

bool Output::IsBrokenPipe() const
{
    return failed_ == EPIPE;
}

QString Output::Reason() const
{
    return qt_error_string(failed_);
}

void WriteMessage(const QString& text)
{
    QString lines = text;
    lines.replace(u"\r\n"_s, u"\n"_s);
    lines += u'\n';
    // If standard error is closed too, nobody is left to tell.
    const QByteArray utf8 = lines.toUtf8();
    WriteAll(STDERR_FILENO, {utf8.constData(), size_t(utf8.size())});
}

} // namespace mirel::cli
