#include "provider/database_location.h"

#include <algorithm>

namespace mirel {

// A path may hold "://" as well, but a scheme holds letters, digits, "+", "-" and "." alone.
bool DatabaseLocation::IsAddress() const
{
    const auto end = text_.indexOf(QStringView(u"://"));
    if (end < 2)
        return false;
    const auto isSchemeLetter = [](QChar letter) {
        return letter.unicode() < 128 && (letter.isLetterOrNumber() || QStringView(u"+-.").contains(letter));
    };
    return text_.at(0).isLetter() && std::all_of(text_.begin(), text_.begin() + end, isSchemeLetter);
}

} // namespace mirel
