#include "provider/sqlite/cell_checker.h"

#include "platform/utf8_bytes.h"
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

Hr CellChecker::Check(const Cell& cell, Cell& stored)
{
    switch (cell.kind) {
    case Cell::Kind::Null:
        stored = {};
        return Hr::Ok;
    case Cell::Kind::Integer:
        if (IsInteger(type_) || type_ == FieldType::YesNo)
            return CheckInteger(cell.integer, stored);
        break;
    case Cell::Kind::Real:
        if (type_ == FieldType::Double && std::isfinite(cell.real)) {
            stored = cell;
            return Hr::Ok;
        }
        break;
    case Cell::Kind::Text:
        if (IsText(type_))
            return CheckText(cell.bytes, stored);
        if (type_ == FieldType::Date)
            return CheckDate(cell.bytes, stored);
        if (qint64 integer = 0; IsInteger(type_) && ReadsAs(cell.bytes, integer))
            return CheckInteger(integer, stored);
        break;
    case Cell::Kind::Binary:
        break;
    }
    return Convert(cell, stored);
}

Hr CellChecker::CheckText(std::string_view utf8, Cell& stored) const
{
    if (!IsUtf8(utf8))
        return Hr::BadLiteral;
    const bool limited = type_ == FieldType::Text && size_ > 0;
    if (limited && utf8.size() > size_t(size_) && UnitsOf(utf8) > size_)
        return Hr::Overflow;
    stored = Cell::OfText(utf8);
    return Hr::Ok;
}

Hr CellChecker::CheckDate(std::string_view text, Cell& stored)
{
    if (IsStoredDate(text)) {
        stored = Cell::OfText(text);
        return Hr::Ok;
    }
    const std::optional<double> days = OleDateFromStored(text);
    const std::optional<StoredDate> date = days ? StoredDateOf(*days) : std::nullopt;
    if (!date)
        return Convert(Cell::OfText(text), stored);
    date_ = *date;
    stored = Cell::OfText(date_.Text());
    return Hr::Ok;
}

Hr CellChecker::CheckInteger(qint64 number, Cell& stored) const
{
    const bool fits = type_ == FieldType::SmallInt ? number == qint16(number)
                      : size_ == kWideIntegerSize  ? true
                                                   : number == qint32(number);
    if (!fits && type_ != FieldType::YesNo)
        return Hr::Overflow;
    stored = Cell::Of(type_ == FieldType::YesNo ? qint64(number != 0) : number);
    return Hr::Ok;
}

Hr CellChecker::Convert(const Cell& cell, Cell& stored)
{
    Value value;
    if (const Hr hr = ConvertForColumn(ValueOfCell(cell, FieldType::None), type_, size_, value); Failed(hr))
        return hr;
    switch (value.Tag()) {
    case ValueTag::Empty:
    case ValueTag::Null:
        stored = {};
        break;
    case ValueTag::Bool:
        stored = Cell::Of(qint64(value.ToBool()));
        break;
    case ValueTag::SmallInt:
    case ValueTag::Integer:
    case ValueTag::Double:
        if (const std::optional<qint64> whole = value.WholeNumber())
            stored = Cell::Of(*whole);
        else
            stored = Cell::Of(value.Number());
        break;
    case ValueTag::Date:
        date_ = StoredDateOf(value.Number()).value_or(StoredDate());
        stored = Cell::OfText(date_.Text());
        break;
    case ValueTag::Text:
        converted_ = value.ToText().toUtf8();
        stored = Cell::OfText({converted_.constData(), size_t(converted_.size())});
        break;
    case ValueTag::Binary:
        converted_ = value.ToBinary();
        stored = Cell::OfBinary({converted_.constData(), size_t(converted_.size())});
        break;
    }
    return Hr::Ok;
}

} // namespace mirel::sqlite
