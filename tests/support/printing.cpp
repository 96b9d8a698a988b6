#include "support/printing.h"

namespace mirel {

void PrintTo(const Value& value, std::ostream* out)
{
    switch (value.Tag()) {
    case ValueTag::Empty:
        *out << "empty";
        return;
    case ValueTag::Null:
        *out << "null";
        return;
    case ValueTag::SmallInt:
    case ValueTag::Integer:
    case ValueTag::Bool:
        *out << "tag " << int(value.Tag()) << ": " << value.ToInt();
        return;
    case ValueTag::Double:
    case ValueTag::Date:
        *out << "tag " << int(value.Tag()) << ": " << value.Number();
        return;
    case ValueTag::Text:
        *out << '"' << value.ToText().toStdString() << '"';
        return;
    case ValueTag::Binary:
        *out << "binary " << value.ToBinary().toHex().toStdString();
        return;
    }
}

void PrintTo(Hr hr, std::ostream* out)
{
    *out << "0x" << std::hex << quint32(hr) << std::dec;
}

} // namespace mirel
