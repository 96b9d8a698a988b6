#pragma once

#include "platform/ole_date.h"

#include <QtGlobal>

#include <optional>
#include <string_view>

namespace mirel::sqlite {

// The forms in which others write dates into a file, as ours. Each is empty when the value is no date.

// ISO with "T", zone or missing seconds; a time alone falls on the base date 1899-12-30.
std::optional<StoredDate> StoredDateOfText(std::string_view text);
// A Julian day number, seconds since 1970, or milliseconds since then, told apart by their size.
std::optional<StoredDate> StoredDateOfNumber(double number);

} // namespace mirel::sqlite
