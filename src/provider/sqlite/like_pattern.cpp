#include "provider/sqlite/like_pattern.h"

#include "platform/utf8_bytes.h"

#include <QStringList>

#include <algorithm>
#include <cstdint>
#include <cstring>

namespace mirel::sqlite {
namespace {

// Whether a search for ASCII letters may miss one that the text has once its case is folded: two characters beyond
// ASCII become one, the long s and the Kelvin sign.
bool HidesAscii(std::string_view text)
{
    if (IsAscii(text))
        return false;
    constexpr std::string_view kLongS = "\xC5\xBF";
    constexpr std::string_view kKelvin = "\xE2\x84\xAA";
    return text.find(kLongS) != std::string_view::npos || text.find(kKelvin) != std::string_view::npos;
}

constexpr bool IsSmall(char unit)
{
    return unit >= 'a' && unit <= 'z';
}

constexpr char Small(char unit)
{
    return unit >= 'A' && unit <= 'Z' ? char(unit + ('a' - 'A')) : unit;
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

// Meets every place where a byte stands in either case, from the first on.
class BothCases {
public:
    BothCases(std::string_view text, char small)
        : text_(text)
        , small_(small)
        , capital_(IsSmall(small) ? char(small - ('a' - 'A')) : small)
        , nextSmall_(Next(small_, 0))
        , nextCapital_(capital_ == small_ ? text_.size() : Next(capital_, 0))
    {
    }

    // The size of the text when there is no further one.
    size_t Place() const { return std::min(nextSmall_, nextCapital_); }
    void Advance()
    {
        if (nextSmall_ < nextCapital_)
            nextSmall_ = Next(small_, nextSmall_ + 1);
        else
            nextCapital_ = Next(capital_, nextCapital_ + 1);
    }

private:
    size_t Next(char unit, size_t from) const
    {
        const void* hit = std::memchr(text_.data() + from, unit, text_.size() - from);
        return hit ? size_t(static_cast<const char*>(hit) - text_.data()) : text_.size();
    }

    std::string_view text_;
    char small_;
    char capital_;
    size_t nextSmall_;
    size_t nextCapital_;
};

bool StartsWith(std::string_view text, const LikePattern::AsciiPart& part)
{
    return part.Begins(text);
}

qsizetype Find(std::string_view text, const LikePattern::AsciiPart& part)
{
    return part.FindIn(text);
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
    return text.size() >= last.size() && StartsWith(From(text, qsizetype(text.size() - last.size())), last);
}

} // namespace

LikePattern::AsciiPart::AsciiPart(std::string small)
    : small_(std::move(small))
    , anchor_(RarestByte(small_))
{
}

bool LikePattern::AsciiPart::Begins(std::string_view text) const
{
    return text.size() >= small_.size() &&
           std::equal(small_.begin(), small_.end(), text.begin(), [](char a, char b) { return a == Small(b); });
}

qsizetype LikePattern::AsciiPart::FindByAnchor(std::string_view text) const
{
    for (BothCases places(text.substr(anchor_), small_[anchor_]); places.Place() + anchor_ < text.size();
         places.Advance()) {
        if (Begins(text.substr(places.Place())))
            return qsizetype(places.Place());
    }
    return -1;
}

qsizetype LikePattern::AsciiPart::FindIn(std::string_view text) const
{
    constexpr size_t kShort = 16; // a longer one is searched for in a time that does not grow with its length
    if (small_.size() > text.size())
        return -1;
    if (small_.empty())
        return 0;
    if (small_.size() <= kShort)
        return FindByAnchor(text);
    std::string small(text);
    std::ranges::transform(small, small.begin(), Small);
    const void* found = memmem(small.data(), small.size(), small_.data(), small_.size());
    return found ? static_cast<const char*>(found) - small.data() : -1;
}

LikePattern::LikePattern(std::string_view utf8)
{
    const QString pattern = QString::fromUtf8(utf8.data(), qsizetype(utf8.size())).toCaseFolded();
    for (const QString& part : pattern.split(u'%')) {
        folded_.push_back(part);
        const std::string bytes = part.toStdString();
        if (IsAscii(utf8))
            ascii_.emplace_back(bytes);
        else if (IsAscii(bytes) && bytes.size() > (probe_ ? probe_->size() : 0))
            probe_.emplace(bytes);
    }
}

bool LikePattern::Matches(std::string_view utf8) const
{
    // Letters beyond ASCII leave the others alone, but for a few.
    if ((!ascii_.empty() || probe_) && !HidesAscii(utf8)) {
        if (!ascii_.empty())
            return MatchesParts(utf8, ascii_);
        if (probe_->FindIn(utf8) < 0)
            return false;
    }
    const QString folded = QString::fromUtf8(utf8.data(), qsizetype(utf8.size())).toCaseFolded();
    return MatchesParts(QStringView(folded), folded_);
}

} // namespace mirel::sqlite
