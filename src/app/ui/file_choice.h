#pragma once

#include "resources/string_id.h"

#include <QString>

class QWidget;

namespace mirel {

enum class FileUse { Open, Create, Delete };

// Asks the user for a database file; empty when there is none. `title` is a command's text. The dialog begins in
// the folder of `near`, in the user's documents when that is empty. On a screen too small for the desktop's
// dialog, one of our own fills the window. An existing file is no question when creating: making the database
// refuses it.
QString ChooseDatabase(QWidget& parent, Str title, FileUse use, const QString& near);

} // namespace mirel
