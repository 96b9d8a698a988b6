#pragma once

#include "resources/string_id.h"

namespace mirel {

// The system's texts by name. The table itself is strings.def, one row a text (name, number, text): the names
// here and the texts in the program come from that one file. Numbers below 60000 are the ones that people and
// documents know; later texts take theirs from 60000.
enum class Str : int {
#ifndef Q_MOC_RUN // which cannot follow includes inside an enum
#define MIREL_STRING(name, number, text) name = (number),
#define MIREL_COUNTED(name, number, counted, one, many) name = (number),
#include "resources/strings.def"
#undef MIREL_STRING
#undef MIREL_COUNTED
#endif
};

} // namespace mirel
