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
    // Its parts between the wildcards, in small letters. Most texts are ASCII and are compared as bytes.
    std::vector<std::string> ascii_; // empty when a part is not ASCII
    std::string probe_;              // then a part that is, to look for before a text is folded
    std::vector<QString> folded_;
};

} // namespace mirel::sqlite
