#include "provider/sqlite/row_reader.h"

#include "provider/dialect/column_value.h"
#include "provider/sqlite/date_forms.h"

#include <numeric>

namespace mirel::sqlite {
namespace {

std::string_view TextAt(sqlite3_stmt* row, int column)
{
    const auto* text = reinterpret_cast<const char*>(sqlite3_column_text(row, column));
    return {text ? text : "", size_t(sqlite3_column_bytes(row, column))};
}

Cell BinaryAt(sqlite3_stmt* row, int column)
{
    const auto* bytes = static_cast<const char*>(sqlite3_column_blob(row, column));
    return Cell::OfBinary({bytes ? bytes : "", size_t(sqlite3_column_bytes(row, column))});
}

// As the file holds it.
Cell StoredCell(sqlite3_stmt* row, int column)
{
    switch (sqlite3_column_type(row, column)) {
    case SQLITE_INTEGER:
        return Cell::Of(qint64(sqlite3_column_int64(row, column)));
    case SQLITE_FLOAT:
        return Cell::Of(sqlite3_column_double(row, column));
    case SQLITE_TEXT:
        return Cell::OfText(TextAt(row, column));
    case SQLITE_BLOB:
        return BinaryAt(row, column);
    default:
        return {};
    }
}

Cell TextCell(sqlite3_stmt* row, int column)
{
    const int type = sqlite3_column_type(row, column);
    if (type == SQLITE_TEXT)
        return Cell::OfText(TextAt(row, column));
    if (type == SQLITE_NULL)
        return {};
    return type == SQLITE_BLOB ? BinaryAt(row, column) : Cell::OfText(TextAt(row, column));
}

Cell DateCell(sqlite3_stmt* row, int column, StoredDate& rewritten)
{
    const Cell cell = StoredCell(row, column);
    std::optional<StoredDate> date;
    switch (cell.kind) {
    case Cell::Kind::Text:
        if (IsStoredDateForm(cell.bytes))
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
        return cell;
    rewritten = *date;
    return Cell::OfText(rewritten.Text());
}

Cell TruthCell(sqlite3_stmt* row, int column)
{
    const Cell cell = StoredCell(row, column);
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

Value ValueOfInteger(qint64 number, FieldType type)
{
    if (type == FieldType::YesNo)
        return Value::Bool(number != 0);
    if (type == FieldType::SmallInt && number == qint16(number))
        return Value::SmallInt(qint16(number));
    if (type != FieldType::Double && number == qint32(number))
        return Value::Integer(qint32(number));
    return Value::Double(double(number));
}

} // namespace

RowReader::RowReader(std::span<const ResultField> result, std::span<const int> fields, Layout layout)
    : cells_(fields.size())
{
    for (size_t i = 0; i < fields.size(); ++i)
        slots_.push_back({layout == Layout::Whole ? fields[i] : int(i), result[size_t(fields[i])].type, {}});
}

std::span<const Cell> RowReader::Read(sqlite3_stmt* row)
{
    for (size_t i = 0; i < slots_.size(); ++i)
        cells_[i] = ReadSlot(slots_[i], row);
    return cells_;
}

Cell RowReader::ReadSlot(Slot& slot, sqlite3_stmt* row)
{
    switch (slot.type) {
    case FieldType::Text:
    case FieldType::Memo:
        return TextCell(row, slot.column);
    case FieldType::Date:
        return DateCell(row, slot.column, slot.date);
    case FieldType::YesNo:
        return TruthCell(row, slot.column);
    case FieldType::None:
    case FieldType::SmallInt:
    case FieldType::Integer:
    case FieldType::Double:
    case FieldType::VarBinary:
    case FieldType::LongBinary:
        break;
    }
    return StoredCell(row, slot.column);
}

Value ValueOfCell(const Cell& cell, FieldType type)
{
    switch (cell.kind) {
    case Cell::Kind::Null:
        break;
    case Cell::Kind::Integer:
        return ValueOfInteger(cell.integer, type);
    case Cell::Kind::Real:
        return Value::Double(cell.real);
    case Cell::Kind::Text:
        if (type == FieldType::Date) {
            if (const std::optional<double> days = OleDateFromStored(cell.bytes))
                return Value::Date(*days);
        }
        return Value::Text(QString::fromUtf8(cell.bytes.data(), qsizetype(cell.bytes.size())));
    case Cell::Kind::Binary:
        return Value::Binary(QByteArray(cell.bytes.data(), qsizetype(cell.bytes.size())));
    }
    return Value::Null();
}

std::vector<int> AllFields(std::span<const ResultField> result)
{
    std::vector<int> fields(result.size());
    std::iota(fields.begin(), fields.end(), 0);
    return fields;
}

} // namespace mirel::sqlite
