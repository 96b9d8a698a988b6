#pragma once

#include <QString>
#include <QStringList>

#include <vector>

namespace mirel {

// Rows of cell texts as they travel over the clipboard. The rows need not be equally long.
using TextRows = std::vector<QStringList>;

// A row a line, cells by tabs, as spreadsheets write and read them: a text that holds a tab or a line end, or
// begins with a quotation mark, stands in quotation marks, its own ones doubled.
QString TextOfRows(const TextRows& rows);

// What TextOfRows or a spreadsheet wrote. A quotation mark that is never closed is a character like any other; a
// line end behind the last row begins no further row. The empty text is one empty cell.
TextRows RowsOfText(QStringView text);

// The rows as an HTML table, for spreadsheets to take as it stands: leading zeros and blanks included.
QString HtmlOfRows(const TextRows& rows);

} // namespace mirel
