#include "provider/sqlite/row_reader.h"

#include "platform/utf8_bytes.h"
#include "provider/dialect/column_value.h"
#include "provider/sqlite/date_forms.h"

#include <cstring>
#include <numeric>

namespace mirel::sqlite {
namespace {

// The values of a row are read without the checks that the library makes for each access through the statement:
// the handle has no mutex, and nothing else runs between the step and the read.
Cell TextOf(sqlite3_value* value)
{
    const auto* text = reinterpret_cast<const char*>(sqlite3_value_text(value));
    return Cell::OfText({text ? text : "", size_t(sqlite3_value_bytes(value))});
}

// A text whose bytes are no UTF-8 comes with a replacement character for each fault, everywhere alike.
Cell WithValidText(const Cell& text, QByteArray& room)
{
    if (IsUtf8(text.bytes))
        return text;
    room = QString::fromUtf8(text.bytes.data(), qsizetype(text.bytes.size())).toUtf8();
    return Cell::OfText({room.constData(), size_t(room.size())});
}

Cell BinaryOf(sqlite3_value* value)
{
    const auto* bytes = static_cast<const char*>(sqlite3_value_blob(value));
    return Cell::OfBinary({bytes ? bytes : "", size_t(sqlite3_value_bytes(value))});
}

// As the file holds it.
Cell StoredCell(sqlite3_value* value)
{
    switch (sqlite3_value_type(value)) {
    case SQLITE_INTEGER:
        return Cell::Of(qint64(sqlite3_value_int64(value)));
    case SQLITE_FLOAT:
        return Cell::Of(sqlite3_value_double(value));
    case SQLITE_TEXT:
        return TextOf(value);
    case SQLITE_BLOB:
        return BinaryOf(value);
    default:
        return {};
    }
}

Cell TextCell(sqlite3_value* value)
{
    switch (sqlite3_value_type(value)) {
    case SQLITE_NULL:
        return {};
    case SQLITE_BLOB:
        return BinaryOf(value);
    default:
        return TextOf(value);
    }
}

Cell DateCell(sqlite3_value* value, StoredDate& rewritten, QByteArray& repaired)
{
    const Cell cell = StoredCell(value);
    std::optional<StoredDate> date;
    switch (cell.kind) {
    case Cell::Kind::Text:
        if (HasStoredDateForm(cell.bytes))
            return cell;
        date = StoredDateOfText(cell.bytes);
        break;
    case Cell::Kind::Integer:
        date = StoredDateOfNumber(double(cell.integer));
        break;
    case Cell::Kind::Real:
        date = StoredDateOfNumber(cell.real);
        break;
    case Cell::Kind::Null:
    case Cell::Kind::Binary:
        break;
    }
    if (!date)
        return cell.kind == Cell::Kind::Text ? WithValidText(cell, repaired) : cell;
    rewritten = *date;
    return Cell::OfText(rewritten.Text());
}

Cell TruthCell(sqlite3_value* value)
{
    const Cell cell = StoredCell(value);
    bool truth = false;
    switch (cell.kind) {
    case Cell::Kind::Integer:
        return Cell::Of(qint64(cell.integer != 0));
    case Cell::Kind::Real:
        return Cell::Of(qint64(cell.real != 0));
    case Cell::Kind::Text:
        if (!Failed(dialect::ReadTruth(QString::fromUtf8(cell.bytes.data(), qsizetype(cell.bytes.size())), truth)))
            return Cell::Of(qint64(truth));
        return cell;
    case Cell::Kind::Null:
    case Cell::Kind::Binary:
        break;
    }
    return cell;
}

} // namespace

RowReader::RowReader(std::span<const ResultField> result, std::span<const int> fields, Layout layout)
    : cells_(fields.size())
{
    slots_.reserve(fields.size());
    for (size_t i = 0; i < fields.size(); ++i)
        slots_.push_back({layout == Layout::Whole ? fields[i] : int(i), result[size_t(fields[i])].type, {}, {}});
}

std::span<const Cell> RowReader::Read(sqlite3_stmt* row)
{
    // Each cell is made in its place: copying one that was just written made the processor wait for the stores, a
    // third of the time that a text took.
    Cell* cell = cells_.data();
    for (Slot& slot : slots_) {
        new (cell) Cell(ReadSlot(slot, row));
        if (cell->kind == Cell::Kind::Text && slot.type != FieldType::Date && !IsUtf8(cell->bytes))
            *cell = WithValidText(*cell, slot.repaired);
        ++cell;
    }
    return cells_;
}

Cell RowReader::ReadSlot(Slot& slot, sqlite3_stmt* row)
{
    sqlite3_value* value = sqlite3_column_value(row, slot.column);
    switch (slot.type) {
    case FieldType::Text:
    case FieldType::Memo:
        return TextCell(value);
    case FieldType::Date:
        return DateCell(value, slot.date, slot.repaired);
    case FieldType::YesNo:
        return TruthCell(value);
    case FieldType::None:
    case FieldType::SmallInt:
    case FieldType::Integer:
    case FieldType::Double:
    case FieldType::VarBinary:
    case FieldType::LongBinary:
        break;
    }
    return StoredCell(value);
}

std::vector<int> AllFields(std::span<const ResultField> result)
{
    std::vector<int> fields(result.size());
    std::iota(fields.begin(), fields.end(), 0);
    return fields;
}

} // namespace mirel::sqlite
