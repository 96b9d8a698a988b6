#pragma once

#include <QString>

namespace mirel {

// Line editors know one kind of line end and hand it back as a paragraph separator. So a text that goes through
// one comes back by comparison: what was not edited keeps each of its characters, be it CR LF, LF alone, a
// no-break space or a separator of lines.

// `edited` is what the editor holds of `before` after the user's change, as QTextDocument::toRawText has it. New
// line ends are those of `before`, LF where it has none.
QString WithEdit(const QString& before, const QString& edited);

} // namespace mirel
