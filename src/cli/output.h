#pragma once

#include <QString>

#include <algorithm>
#include <memory>
#include <string_view>

namespace mirel::cli {

// The standard output of a command, collected into large writes. Once a write has failed (the reader of a pipe is
// gone, the disk is full) it accepts nothing more, and the command ends at its next record.
class Output {
public:
    explicit Output(int fileDescriptor);
    ~Output();
    Q_DISABLE_COPY_MOVE(Output)

    void Write(std::string_view bytes)
    {
        if (bytes.size() > kBufferBytes - used_) {
            WriteThrough(bytes);
            return;
        }
        std::copy(bytes.begin(), bytes.end(), buffer_.get() + used_); // memcpy refuses an empty view's null
        used_ += bytes.size();
    }
    void Write(char byte)
    {
        if (used_ == kBufferBytes)
            Flush();
        buffer_[used_++] = byte;
    }
    void WriteText(QStringView text);
    void WriteLine(QStringView text);

    bool Flush(); // false once a write has failed
    bool HasFailed() const { return failed_ != 0; }
    // Whether the reader is gone, which needs no message.
    bool IsBrokenPipe() const;
    QString Reason() const;

private:
    bool WriteAscii(QStringView text);
    void WriteThrough(std::string_view bytes);

    static constexpr size_t kBufferBytes = 256 * 1024;

    int fileDescriptor_;
    std::unique_ptr<char[]> buffer_;
    size_t used_ = 0;
    int failed_ = 0; // the errno
};

// A message to standard error, with plain line ends.
void WriteMessage(const QString& text);

} // namespace mirel::cli
