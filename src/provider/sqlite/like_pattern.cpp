#include "provider/sqlite/like_pattern.h"

#include <QStringList>

#include <cstdint>
#include <cstring>

namespace mirel::sqlite {
namespace {

constexpr uint64_t kEachByte = 0x0101010101010101;
constexpr uint64_t kTopBits = 0x80 * kEachByte;

// Eight ASCII bytes in small letters at once: adding carries into the top bit of those at or behind "A", and of
// those behind "Z".
constexpr uint64_t LowerEight(uint64_t bytes)
{
    const uint64_t fromA = bytes + (0x80 - 'A') * kEachByte;
    const uint64_t behindZ = bytes + (0x7F - 'Z') * kEachByte;
    return bytes | (((fromA ^ behindZ) & kTopBits) >> 2);
}
static_assert(LowerEight(0x405A415B7A617B30) == 0x407A615B7A617B30);

// Puts `text` into `lower` in small letters; false when it is not ASCII.
bool LowerAscii(std::string_view text, std::string& lower)
{
    lower.resize(text.size());
    size_t at = 0;
    for (; at + 8 <= text.size(); at += 8) {
        uint64_t bytes = 0;
        std::memcpy(&bytes, text.data() + at, 8);
        if (bytes & kTopBits)
            return false;
        bytes = LowerEight(bytes);
        std::memcpy(lower.data() + at, &bytes, 8);
    }
    uint64_t rest = 0;
    const size_t left = text.size() - at;
    std::memcpy(&rest, text.data() + at, left);
    if (rest & kTopBits)
        return false;
    rest = LowerEight(rest);
    std::memcpy(lower.data() + at, &rest, left);
    return true;
}

// Letters that texts are full of come last; what is not listed is rarer than all of them.
constexpr std::string_view kCommon = "zqjxkvbywgpfmucdlhrsnioate ";

// The byte of `part` to look for first: the fewer places it stands at, the less there is to compare.
size_t RarestByte(const std::string& part)
{
    size_t rarest = 0;
    size_t lowest = kCommon.size();
    for (size_t i = 0; i < part.size(); ++i) {
        const size_t place = kCommon.find(part[i]) + 1; // 0: not listed
        if (place < lowest) {
            lowest = place;
            rarest = i;
        }
    }
    return rarest;
}

qsizetype FindShort(std::string_view text, const std::string& part)
{
    const size_t anchor = RarestByte(part);
    for (size_t from = anchor; text.size() - from >= part.size() - anchor;) {
        const void* hit = std::memchr(text.data() + from, part[anchor], text.size() - from);
        if (!hit)
            return -1;
        const size_t at = size_t(static_cast<const char*>(hit) - text.data()) - anchor;
        if (text.substr(at, part.size()) == part)
            return qsizetype(at);
        from = at + anchor + 1;
    }
    return -1;
}

qsizetype Find(std::string_view text, const std::string& part)
{
    constexpr size_t kShort = 16; // a longer one is searched for in a time that does not grow with its length
    if (part.size() > text.size())
        return -1;
    if (part.empty())
        return 0;
    if (part.size() <= kShort)
        return FindShort(text, part);
    const void* found = memmem(text.data(), text.size(), part.data(), part.size());
    return found ? static_cast<const char*>(found) - text.data() : -1;
}

qsizetype Find(QStringView text, const QString& part)
{
    return text.indexOf(part);
}

std::string_view From(std::string_view text, qsizetype start)
{
    return text.substr(size_t(start));
}

QStringView From(QStringView text, qsizetype start)
{
    return text.mid(start);
}

bool StartsWith(std::string_view text, std::string_view part)
{
    return text.starts_with(part);
}

bool StartsWith(QStringView text, const QString& part)
{
    return text.startsWith(part);
}

// The first and the last part stand at the ends; each part between them where it first fits.
template <typename View, typename Part>
bool MatchesParts(View text, const std::vector<Part>& parts)
{
    if (!StartsWith(text, parts.front()))
        return false;
    if (parts.size() == 1)
        return text.size() == parts.front().size();
    text = From(text, qsizetype(parts.front().size()));
    for (size_t i = 1; i + 1 < parts.size(); ++i) {
        const qsizetype at = Find(text, parts[i]);
        if (at < 0)
            return false;
        text = From(text, at + qsizetype(parts[i].size()));
    }
    const Part& last = parts.back();
    return text.size() >= last.size() && From(text, qsizetype(text.size() - last.size())) == last;
}

} // namespace

LikePattern::LikePattern(std::string_view utf8)
{
    std::string lower;
    const bool isAscii = LowerAscii(utf8, lower);
    const QString pattern = QString::fromUtf8(utf8.data(), qsizetype(utf8.size())).toCaseFolded();
    for (const QString& part : pattern.split(u'%')) {
        folded_.push_back(part);
        if (isAscii)
            ascii_.push_back(part.toStdString());
    }
}

bool LikePattern::Matches(std::string_view utf8)
{
    if (!ascii_.empty() && LowerAscii(utf8, lower_))
        return MatchesParts(std::string_view(lower_), ascii_);
    const QString folded = QString::fromUtf8(utf8.data(), qsizetype(utf8.size())).toCaseFolded();
    return MatchesParts(QStringView(folded), folded_);
}

} // namespace mirel::sqlite
