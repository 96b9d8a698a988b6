#pragma once

#include <QString>

#include <optional>
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

    // A part between wildcards, in small letters, and its byte to look for first.
    class AsciiPart {
    public:
        explicit AsciiPart(std::string small);

        size_t size() const { return small_.size(); }
        bool Begins(std::string_view text) const;
        qsizetype FindIn(std::string_view text) const; // -1: not there

    private:
        qsizetype FindByAnchor(std::string_view text) const;

        std::string small_;
        size_t anchor_;
    };

private:
    // Most texts are ASCII and are compared as bytes.
    std::vector<AsciiPart> ascii_;   // empty when a part is not ASCII
    std::optional<AsciiPart> probe_; // then a part that is, to look for before a text is folded
    std::vector<QString> folded_;
};

} // namespace mirel::sqlite
