#pragma once

#include <QString>
#include <QStringList>

namespace mirel {

// The name of one of the system's texts, for headers that pass names on. Who names a text includes
// string_table.h: so a new text recompiles those alone.
enum class Str : int;

// The text in the language that is spoken (language.h), with %1, %2, … replaced by `arguments`, all at once: an
// argument that holds "%2" stays as it is.
QString StringText(Str id, const QStringList& arguments = {});

} // namespace mirel
