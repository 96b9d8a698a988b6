#pragma once

#include <QString>

#include <algorithm>
#include <memory>
#include <string_view>

namespace mirel::cli {

// What a command writes to standard output, collected into large writes. Once a write has failed (the reader of
// a pipe went away, the disk is full) it takes nothing more, and the command ends at its next record.
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
    void WriteText(const QString& text);
    void WriteLine(const QString& text);

    bool Flush(); // false once a write has failed
    bool HasFailed() const { return failed_ != 0; }
    // Whether nobody reads any more, which is no failure to speak of.
    bool IsBrokenPipe() const;
    QString Reason() const;

private:
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
