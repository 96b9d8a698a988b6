#pragma once

namespace mirel {

// The storage types of a column. The numbers are the domain's: results report them, forms and the expression
// language compare them. Never renumber.
enum class FieldType : int {
    None = 0,     // a column of a result whose type is unknown
    SmallInt = 2, // 16 bits
    Integer = 3,  // 32 bits
    Double = 5,
    Date = 7, // date and time, an OLE day number in memory
    YesNo = 11,
    Text = 202,      // up to 255 characters
    Memo = 203,      // long text
    VarBinary = 204, // up to 255 bytes
    LongBinary = 205,
};

constexpr bool IsText(FieldType type)
{
    return type == FieldType::Text || type == FieldType::Memo;
}
constexpr bool IsInteger(FieldType type)
{
    return type == FieldType::SmallInt || type == FieldType::Integer;
}
constexpr bool IsNumber(FieldType type)
{
    return IsInteger(type) || type == FieldType::Double;
}
constexpr bool IsBinary(FieldType type)
{
    return type == FieldType::VarBinary || type == FieldType::LongBinary;
}

constexpr int kWideIntegerSize = 8; // bytes of an Integer field that takes 64 bits: only other programs make it
constexpr int kMaxTextSize = 255;   // characters of a Text field, bytes of a VarBinary field

} // namespace mirel
