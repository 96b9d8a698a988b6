#include "cli/cell_text.h"

namespace mirel::cli {

std::string_view View(const QByteArray& bytes)
{
    return {bytes.constData(), size_t(bytes.size())};
}

std::string_view CellText::Of(const Cell& cell, FieldType type)
{
    switch (cell.kind) {
    case Cell::Kind::Null:
        return {};
    case Cell::Kind::Integer:
        if (type == FieldType::YesNo)
            return View(cell.integer != 0 ? yes_ : no_);
        number_ = NumberBuffer(cell.integer);
        return number_.Text();
    case Cell::Kind::Real:
        number_ = NumberBuffer(cell.real);
        return number_.Text();
    case Cell::Kind::Text:
        return cell.bytes;
    case Cell::Kind::Binary:
        base64_ = QByteArray::fromRawData(cell.bytes.data(), qsizetype(cell.bytes.size())).toBase64();
        return View(base64_);
    }
    return {};
}

} // namespace mirel::cli
