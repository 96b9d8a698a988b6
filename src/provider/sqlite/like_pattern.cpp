#include "provider/sqlite/like_pattern.h"

#include <QStringList>

#include <algorithm>
#include <cstdint>
#include <cstring>

namespace mirel::sqlite {
namespace {

bool IsAscii(std::string_view text)
{
    size_t at = 0;
    for (; at + 8 <= text.size(); at += 8) {
        uint64_t word = 0;
        std::memcpy(&word, text.data() + at, 8);
        if (word & 0x8080808080808080U)
            return false;
    }
    return std::all_of(text.begin() + qsizetype(at), text.end(), [](char unit) { return (unit & 0x80) == 0; });
}

constexpr char Lower(char unit)
{
    return unit >= 'A' && unit <= 'Z' ? char(unit + ('a' - 'A')) : unit;
}

bool EqualFolded(const char* text, const std::string& lower)
{
    for (size_t i = 0; i < lower.size(); ++i) {
        if (Lower(text[i]) != lower[i])
            return false;
    }
    return true;
}

// Where `lower` first stands in `text` at or behind `from`.
size_t FindFolded(std::string_view text, const std::string& lower, size_t from)
{
    if (lower.size() > text.size())
        return std::string_view::npos;
    const size_t last = text.size() - lower.size();
    const char first = lower.front();
    for (; from <= last; ++from) {
        if (Lower(text[from]) == first && EqualFolded(text.data() + from, lower))
            return from;
    }
    return std::string_view::npos;
}

} // namespace

LikePattern::LikePattern(std::string_view utf8)
    : isAscii_(IsAscii(utf8))
{
    const QString pattern = QString::fromUtf8(utf8.data(), qsizetype(utf8.size())).toCaseFolded();
    for (const QString& part : pattern.split(u'%')) {
        folded_.push_back(part);
        if (isAscii_)
            ascii_.push_back(part.toStdString());
    }
}

bool LikePattern::Matches(std::string_view utf8) const
{
    if (isAscii_ && IsAscii(utf8))
        return MatchesAscii(utf8);
    return MatchesFolded(QString::fromUtf8(utf8.data(), qsizetype(utf8.size())).toCaseFolded());
}

// The first and the last part stand at the ends; each part between them where it first fits.
bool LikePattern::MatchesAscii(std::string_view text) const
{
    const std::string& first = ascii_.front();
    const std::string& last = ascii_.back();
    if (ascii_.size() == 1)
        return text.size() == first.size() && EqualFolded(text.data(), first);
    if (text.size() < first.size() + last.size() || !EqualFolded(text.data(), first) ||
        !EqualFolded(text.data() + text.size() - last.size(), last)) {
        return false;
    }
    const std::string_view middle = text.substr(0, text.size() - last.size());
    size_t at = first.size();
    for (size_t i = 1; i + 1 < ascii_.size(); ++i) {
        if (ascii_[i].empty())
            continue;
        at = FindFolded(middle, ascii_[i], at);
        if (at == std::string_view::npos)
            return false;
        at += ascii_[i].size();
    }
    return true;
}

bool LikePattern::MatchesFolded(const QString& folded) const
{
    const QString& first = folded_.front();
    const QString& last = folded_.back();
    if (folded_.size() == 1)
        return folded == first;
    if (folded.size() < first.size() + last.size() || !folded.startsWith(first) || !folded.endsWith(last))
        return false;
    const QStringView middle = QStringView(folded).chopped(last.size());
    qsizetype at = first.size();
    for (size_t i = 1; i + 1 < folded_.size(); ++i) {
        at = middle.indexOf(folded_[i], at);
        if (at < 0)
            return false;
        at += folded_[i].size();
    }
    return true;
}

} // namespace mirel::sqlite
