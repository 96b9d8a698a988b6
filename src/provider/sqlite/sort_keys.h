#pragma once

#include <unicode/ucol.h>

#include <memory>
#include <span>
#include <string_view>
#include <vector>

namespace mirel::sqlite {

// Makes the keys by which texts are ordered as the user's language orders them, ignoring case: keys compare
// byte by byte.
class SortKeys {
public:
    // Borrowed until the next call; without the closing zero.
    std::span<const uint8_t> KeyOf(std::string_view utf8);

private:
    void Open();

    struct Closer {
        void operator()(UCollator* collator) const { ucol_close(collator); }
    };

    bool opened_ = false;                         // it takes as long as opening the file, and few need it
    std::unique_ptr<UCollator, Closer> collator_; // null when the library has no data at all
    std::vector<char16_t> units_;
    std::vector<uint8_t> key_;
};

} // namespace mirel::sqlite
