#pragma once

#include <QByteArrayView>

#include <cstdint>
#include <cstring>
#include <string_view>

namespace mirel {

// Whether no byte has its high bit set. Most texts are like that, and it is told eight bytes at a time.
inline bool IsAscii(std::string_view text)
{
    constexpr uint64_t kHighBits = 0x8080808080808080;
    const auto word = [&text](size_t at) {
        uint64_t bytes = 0;
        std::memcpy(&bytes, text.data() + at, sizeof bytes);
        return bytes;
    };
    if (text.size() < sizeof(uint64_t)) {
        unsigned seen = 0;
        for (const char byte : text)
            seen |= static_cast<unsigned char>(byte);
        return (seen & 0x80) == 0;
    }
    constexpr size_t kWord = sizeof(uint64_t);
    uint64_t seen = word(text.size() - kWord); // may overlap the last of the others
    size_t at = 0;
    for (; at + 4 * kWord <= text.size(); at += 4 * kWord)
        seen |= word(at) | word(at + kWord) | word(at + 2 * kWord) | word(at + 3 * kWord);
    for (; at + kWord < text.size(); at += kWord)
        seen |= word(at);
    return (seen & kHighBits) == 0;
}

inline bool IsUtf8(std::string_view text)
{
    return IsAscii(text) || QByteArrayView(text.data(), qsizetype(text.size())).isValidUtf8();
}

} // namespace mirel
