#pragma once

#include <QString>

#include <string>
#include <string_view>
#include <vector>

namespace mirel::sqlite {

// A pattern of LIKE, taken apart once for many texts. "%" stands for any characters, every other character for
// itself in either case.
class LikePattern {
public:
    explicit LikePattern(std::string_view utf8);

    bool Matches(std::string_view utf8) const;

private:
    bool MatchesAscii(std::string_view text) const;
    bool MatchesFolded(const QString& folded) const;

    std::vector<std::string> ascii_; // between the wildcards, lower case; empty when one is not ASCII
    std::vector<QString> folded_;    // the same, case folded
    bool isAscii_ = false;
};

} // namespace mirel::sqlite
