#include "csvimport/utf8_source.h"

#include <algorithm>
#include <array>
#include <cstring>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qint64 kBlockBytes = 64 * 1024;
constexpr qint64 kLongestByteOrderMark = 4;

bool IsUtf8(const QString& encoding)
{
    return encoding.compare("UTF-8"_L1, Qt::CaseInsensitive) == 0 ||
           encoding.compare("UTF8"_L1, Qt::CaseInsensitive) == 0;
}

struct ByteOrderMark {
    QByteArrayView bytes;
    QLatin1StringView encoding;
};

// The longer marks come first: that of UTF-32 begins with that of UTF-16.
const std::array kByteOrderMarks = {
    ByteOrderMark{QByteArrayView("\xFF\xFE\0\0", 4), "UTF-32LE"_L1},
    ByteOrderMark{QByteArrayView("\0\0\xFE\xFF", 4), "UTF-32BE"_L1},
    ByteOrderMark{QByteArrayView("\xEF\xBB\xBF", 3), "UTF-8"_L1},
    ByteOrderMark{QByteArrayView("\xFF\xFE", 2), "UTF-16LE"_L1},
    ByteOrderMark{QByteArrayView("\xFE\xFF", 2), "UTF-16BE"_L1},
};

} // namespace

Utf8Source::Utf8Source(QIODevice& device, const QString& encoding)
    : device_(device)
    , encoding_(encoding)
{
    if (!IsUtf8(encoding))
        decoder_ = QStringDecoder(encoding.toLatin1().constData());
}

bool Utf8Source::IsKnownEncoding(const QString& encoding)
{
    return IsUtf8(encoding) || QStringDecoder(encoding.toLatin1().constData()).isValid();
}

QString Utf8Source::EncodingOfMark(QByteArrayView start)
{
    const auto mark = std::ranges::find_if(
        kByteOrderMarks, [start](const ByteOrderMark& each) { return start.startsWith(each.bytes); });
    return mark == kByteOrderMarks.end() ? QString() : QString(mark->encoding);
}

qint64 Utf8Source::Read(char* to, qint64 room)
{
    if (!started_)
        DetectByteOrderMark();
    for (;;) {
        if (pendingAt_ < pending_.size()) {
            const qint64 count = std::min(room, pending_.size() - pendingAt_);
            std::memcpy(to, pending_.constData() + pendingAt_, size_t(count));
            pendingAt_ += count;
            return count;
        }
        if (!decoder_.isValid())
            return ReadRaw(to, room);
        if (!DecodeBlock())
            return -1;
        if (pending_.isEmpty())
            return 0;
    }
}

qint64 Utf8Source::ReadRaw(char* to, qint64 room)
{
    const qint64 count = device_.read(to, room);
    if (count > 0)
        consumed_ += count;
    // A sequential device says -1 at its end; only a device that also has an error has failed.
    if (count < 0 && device_.atEnd())
        return 0;
    return count;
}

void Utf8Source::DetectByteOrderMark()
{
    started_ = true;
    if (decoder_.isValid())
        return; // the decoder leaves the mark of its own encoding out
    QByteArray start;
    while (start.size() < kLongestByteOrderMark) {
        char byte = 0;
        if (ReadRaw(&byte, 1) != 1)
            break;
        start += byte;
    }
    const auto mark = std::ranges::find_if(
        kByteOrderMarks, [&start](const ByteOrderMark& each) { return start.startsWith(each.bytes); });
    if (mark == kByteOrderMarks.end()) {
        pending_ = start;
        return;
    }
    hasMark_ = true;
    start.remove(0, mark->bytes.size());
    pending_ = start;
    if (IsUtf8(mark->encoding))
        return;
    encoding_ = mark->encoding;
    decoder_ = QStringDecoder(mark->encoding.data());
    pending_ = encoder_(decoder_(start));
    malformed_ = decoder_.hasError();
}

bool Utf8Source::DecodeBlock()
{
    pending_.clear();
    pendingAt_ = 0;
    if (malformed_)
        return false;
    QByteArray raw(kBlockBytes, Qt::Uninitialized);
    // A block may decode to nothing but the beginning of a character, so read on until there is text.
    while (pending_.isEmpty()) {
        const qint64 count = ReadRaw(raw.data(), raw.size());
        if (count < 0)
            return false;
        if (count == 0)
            return true;
        pending_ = encoder_(decoder_(QByteArrayView(raw).first(count)));
        if (decoder_.hasError()) {
            pending_.clear();
            malformed_ = true;
            return false;
        }
    }
    return true;
}

} // namespace mirel
