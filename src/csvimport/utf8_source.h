#pragma once

#include <QByteArray>
#include <QIODevice>
#include <QString>
#include <QStringDecoder>
#include <QStringEncoder>

namespace mirel {

// The bytes of a text file as UTF-8, block by block, whatever its encoding. A byte-order mark is dropped; one
// of UTF-16 or UTF-32 chooses that encoding over UTF-8. UTF-8 passes through unchecked: the code that cuts
// it up also checks it, piece by piece.
//
// The device is open for reading and outlives the source.
class Utf8Source {
public:
    Utf8Source(QIODevice& device, const QString& encoding);

    static bool IsKnownEncoding(const QString& encoding);
    // The encoding whose byte-order mark a file begins with; empty: none.
    static QString EncodingOfMark(QByteArrayView start);

    // Puts up to `room` bytes at `to`: how many, 0 at the end, -1 when the device failed or its bytes are no
    // text in the encoding. `room` is not 0.
    [[nodiscard]] qint64 Read(char* to, qint64 room);
    bool IsMalformed() const { return malformed_; }       // tells the second failure from the first
    qint64 BytesConsumed() const { return consumed_; }    // of the device, for a progress display
    const QString& Encoding() const { return encoding_; } // the one in use
    bool HasByteOrderMark() const { return hasMark_; }    // once something was read

private:
    [[nodiscard]] qint64 ReadRaw(char* to, qint64 room);
    void DetectByteOrderMark();
    [[nodiscard]] bool DecodeBlock();

    QIODevice& device_;
    QString encoding_;
    QStringDecoder decoder_;                         // not valid for UTF-8, which needs none
    QStringEncoder encoder_{QStringConverter::Utf8}; // keeps half a surrogate pair from block to block
    QByteArray pending_;                             // bytes already read or decoded, not yet handed out
    qint64 pendingAt_ = 0;
    qint64 consumed_ = 0;
    bool started_ = false;
    bool malformed_ = false;
    bool hasMark_ = false;
};

} // namespace mirel
