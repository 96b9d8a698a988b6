#include "provider/sqlite/cell_binder.h"

#include "provider/conversion.h"
#include "provider/sqlite/date_forms.h"
#include "provider/sqlite/row_reader.h"

#include <algorithm>
#include <charconv>
#include <cmath>

namespace mirel::sqlite {
namespace {

// UTF-16 units, which is how a text's size counts. A byte that continues a character counts nothing, one that
// begins a character beyond 16 bits counts twice.
qsizetype UnitsOf(std::string_view utf8)
{
    return std::count_if(utf8.begin(), utf8.end(), [](char unit) { return (unit & 0xC0) != 0x80; }) +
           std::count_if(utf8.begin(), utf8.end(), [](char unit) { return (unit & 0xF8) == 0xF0; });
}

// A plain decimal number that is the whole text.
template <typename Number>
bool ReadsAs(std::string_view text, Number& number)
{
    const char* end = text.data() + text.size();
    const auto [stop, error] = std::from_chars(text.data(), end, number);
    return error == std::errc() && stop == end;
}

} // namespace

Hr CellBinder::Bind(Statement& statement, int parameter, const Cell& cell)
{
    if (cell.kind == Cell::Kind::Null) {
        statement.BindNull(parameter);
        return Hr::Ok;
    }
    if (cell.kind == Cell::Kind::Integer && (IsInteger(type_) || type_ == FieldType::YesNo))
        return BindInteger(statement, parameter, cell.integer);
    if (cell.kind == Cell::Kind::Real && type_ == FieldType::Double && std::isfinite(cell.real)) {
        statement.Bind(parameter, cell.real);
        return Hr::Ok;
    }
    if (cell.kind == Cell::Kind::Text) {
        qint64 integer = 0;
        if (IsText(type_))
            return BindText(statement, parameter, cell.bytes);
        if (type_ == FieldType::Date)
            return BindDate(statement, parameter, cell.bytes);
        if (IsInteger(type_) && ReadsAs(cell.bytes, integer))
            return BindInteger(statement, parameter, integer);
    }
    return BindConverted(statement, parameter, cell);
}

Hr CellBinder::BindText(Statement& statement, int parameter, std::string_view utf8) const
{
    const bool limited = type_ == FieldType::Text && size_ > 0;
    if (limited && utf8.size() > size_t(size_) && UnitsOf(utf8) > size_)
        return Hr::Overflow;
    statement.BindText(parameter, utf8);
    return Hr::Ok;
}

Hr CellBinder::BindDate(Statement& statement, int parameter, std::string_view text)
{
    if (IsStoredDate(text)) {
        statement.BindText(parameter, text);
        return Hr::Ok;
    }
    const std::optional<double> days = OleDateFromStored(text);
    const std::optional<StoredDate> date = days ? StoredDateOf(*days) : std::nullopt;
    if (!date)
        return BindConverted(statement, parameter, Cell::OfText(text));
    date_ = *date;
    statement.BindText(parameter, date_.Text());
    return Hr::Ok;
}

Hr CellBinder::BindInteger(Statement& statement, int parameter, qint64 number) const
{
    const bool fits = type_ == FieldType::SmallInt ? number == qint16(number) : number == qint32(number);
    if (!fits && type_ != FieldType::YesNo)
        return Hr::Overflow;
    statement.Bind(parameter, type_ == FieldType::YesNo ? qint64(number != 0) : number);
    return Hr::Ok;
}

Hr CellBinder::BindConverted(Statement& statement, int parameter, const Cell& cell) const
{
    Value converted;
    const Hr hr = ConvertForColumn(ValueOfCell(cell, FieldType::None), type_, size_, converted);
    if (!Failed(hr))
        statement.Bind(parameter, converted);
    return hr;
}

} // namespace mirel::sqlite
