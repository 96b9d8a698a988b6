#pragma once

#include <QByteArray>
#include <QtGlobal>

#include <array>
#include <string_view>

namespace mirel {

// A number as text in its own small buffer, for bulk work without a QString per field: integers in decimal, a
// double as NumberText writes it (up to 15 significant digits, "." as the point, no trailing zeros).
class NumberBuffer {
public:
    explicit NumberBuffer(qint64 number);
    explicit NumberBuffer(double number);

    std::string_view Text() const { return {characters_.data(), length_}; }

private:
    std::array<char, 32> characters_; // uninitialised: only the text is ever read
    size_t length_;
};

} // namespace mirel
