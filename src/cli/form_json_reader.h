#pragma once

#include "forms/form_records.h"
#include "platform/user_prompt.h"

#include <QByteArray>

#include <optional>

namespace mirel::cli {

// The one form in a JSON text of the shape that WriteStoreJson writes. Members that are left out are as on a new
// record; lengths and counts follow from the rest, whatever the text says. What is not understood is refused: empty,
// and `fault` names the member by its path.
std::optional<FormDef> ReadFormJson(const QByteArray& json, UserMessage& fault);

} // namespace mirel::cli
