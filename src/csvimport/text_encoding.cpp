#include "csvimport/text_encoding.h"

#include "csvimport/utf8_source.h"

#include <algorithm>
#include <cstring>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qsizetype kBlockBytes = 1 << 20;
constexpr qsizetype kLongestCharacter = 4;

// How many bytes a character of UTF-8 takes, by its first one; 0: it begins none.
qsizetype LengthOf(unsigned char lead)
{
    if (lead < 0x80)
        return 1;
    if (lead < 0xC2 || lead > 0xF4)
        return 0;
    return lead < 0xE0 ? 2 : lead < 0xF0 ? 3 : 4;
}

class Look {
public:
    explicit Look(TextLook& look)
        : look_(look)
    {
    }

    // Looks at the next bytes of the file: how many of them are done. The others may be half a character.
    qsizetype Take(QByteArrayView bytes, bool isLast)
    {
        const auto has = [&bytes](char byte) {
            return !bytes.isEmpty() && std::memchr(bytes.data(), byte, size_t(bytes.size())) != nullptr;
        };
        if (look_.bytes == 0)
            look_.byteOrderMark = Utf8Source::EncodingOfMark(bytes);
        look_.hasMarks = look_.hasMarks || has('"');
        const qsizetype whole = isLast ? bytes.size() : WholeCharacters(bytes);
        const QByteArrayView taken = bytes.first(whole);
        if (!taken.isValidUtf8())
            CountCharacters(taken);
        else if (look_.utf8Characters == 0)
            look_.utf8Characters = std::ranges::any_of(taken, [](char byte) { return (byte & 0x80) != 0; });
        if (has('\0'))
            CountNuls(taken);
        look_.bytes += whole;
        return whole;
    }

private:
    static qsizetype WholeCharacters(QByteArrayView bytes)
    {
        for (qsizetype back = 1; back < kLongestCharacter && back <= bytes.size(); ++back) {
            const auto byte = static_cast<unsigned char>(bytes[bytes.size() - back]);
            if (byte < 0x80)
                break;
            if (byte >= 0xC0)
                return LengthOf(byte) > back ? bytes.size() - back : bytes.size();
        }
        return bytes.size();
    }

    void CountCharacters(QByteArrayView bytes)
    {
        for (qsizetype at = 0; at < bytes.size();) {
            const qsizetype length = LengthOf(static_cast<unsigned char>(bytes[at]));
            if (length == 1) {
                ++at;
            } else if (length > 1 && at + length <= bytes.size() && bytes.sliced(at, length).isValidUtf8()) {
                ++look_.utf8Characters;
                at += length;
            } else {
                ++look_.notUtf8;
                look_.c1Bytes += static_cast<unsigned char>(bytes[at]) < 0xA0;
                ++at;
            }
        }
    }

    void CountNuls(QByteArrayView bytes)
    {
        for (qsizetype i = 0; i < bytes.size(); ++i) {
            if (bytes[i] == 0)
                ++((look_.bytes + i) % 2 == 0 ? look_.nulsAtEven : look_.nulsAtOdd);
        }
    }

    TextLook& look_;
};

} // namespace

QString TextLook::Encoding() const
{
    if (!byteOrderMark.isEmpty())
        return byteOrderMark;
    // Of UTF-16 without a mark, Latin letters have a NUL each, always on the same side.
    constexpr qint64 kFewest = 5;
    const qint64 characters = bytes / 2;
    if (bytes % 2 == 0 && nulsAtOdd * 2 > characters && nulsAtEven * kFewest < nulsAtOdd)
        return u"UTF-16LE"_s;
    if (bytes % 2 == 0 && nulsAtEven * 2 > characters && nulsAtOdd * kFewest < nulsAtEven)
        return u"UTF-16BE"_s;
    // A few broken bytes among much UTF-8 are lines that fail.
    constexpr qint64 kFew = 20;
    if (notUtf8 == 0 || notUtf8 * kFew < utf8Characters)
        return u"UTF-8"_s;
    const QString windows = u"windows-1252"_s;
    return c1Bytes > 0 && Utf8Source::IsKnownEncoding(windows) ? windows : u"ISO-8859-1"_s;
}

bool TextLook::HasNuls(const QString& encoding) const
{
    const bool oneByte = !encoding.startsWith("UTF-16"_L1, Qt::CaseInsensitive) &&
                         !encoding.startsWith("UTF-32"_L1, Qt::CaseInsensitive);
    return oneByte && nulsAtEven + nulsAtOdd > 0;
}

LookResult LookAtText(QIODevice& file, Progress& progress, TextLook& look)
{
    look = {};
    Look state(look);
    QByteArray bytes;
    for (bool isLast = false; !isLast;) {
        if (!progress.Advance(look.bytes))
            return LookResult::Stopped;
        const QByteArray block = file.read(kBlockBytes);
        if (block.isEmpty() && !file.atEnd())
            return LookResult::CannotRead;
        isLast = block.isEmpty();
        bytes += block;
        bytes.remove(0, state.Take(bytes, isLast));
    }
    return LookResult::Done;
}

} // namespace mirel
