#pragma once

#include "platform/cell.h"
#include "platform/field_type.h"
#include "platform/number_text.h"
#include "platform/yes_no_words.h"

#include <QByteArray>

#include <string_view>

namespace mirel::cli {

// The cell of a column of that type as people read it: NULL as nothing, a date without midnight, the two words
// of Yes/No, binary as base64. Makes one text at a time: the view is good until the next call.
class CellText {
public:
    explicit CellText(const YesNoWords& words)
        : yes_(words.yes.toUtf8())
        , no_(words.no.toUtf8())
    {
    }

    std::string_view Of(const Cell& cell, FieldType type);

private:
    QByteArray yes_;
    QByteArray no_;
    NumberBuffer number_{qint64(0)};
    QByteArray base64_;
};

std::string_view View(const QByteArray& bytes);

} // namespace mirel::cli
