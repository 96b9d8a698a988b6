#pragma once

#include "expr/date_format.h"

#include <array>
#include <string>
#include <string_view>
#include <vector>

namespace mirel {

// Stored dates as texts of one format, in UTF-8, for bulk work. A table's days and times of day come again and
// again: each is formatted once and remembered, because a locale's form takes 0.7 microseconds, its memory 0.06.
class DateTexts {
public:
    explicit DateTexts(const DateFormat& format);

    // As FormatDateText writes the date; empty for what is no date. Good until the next call and as long as
    // `stored`.
    std::string_view Of(std::string_view stored);

private:
    // A day or a time of day as it is stored, and its text.
    struct Remembered {
        std::array<char, 10> stored{};
        quint8 size = 0;
        quint8 textSize = 0;
        std::array<char, 20> text{};
    };
    using Memory = std::vector<Remembered>;

    void Append(std::string_view stored, Memory& memory);
    std::string Format(const std::string& stored) const;

    DateFormat format_;
    bool isStoredForm_; // nothing has to be done
    Memory days_;
    Memory times_;
    std::string text_; // of the last call
};

} // namespace mirel
