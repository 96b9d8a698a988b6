#include "data/field_names.h"

#include <algorithm>
#include <array>
#include <string_view>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

struct TypeRow {
    FieldType type;
    std::u16string_view name;
    std::u16string_view clause; // of CREATE TABLE; Text has its size instead
};

// "Text" becomes Varchar(n) and "Memo" becomes Text on purpose: the database's own Text is the long one.
constexpr std::array kTypes = {
    TypeRow{FieldType::SmallInt, u"SmallInt", u"Smallint"},
    TypeRow{FieldType::Integer, u"Integer", u"Integer"},
    TypeRow{FieldType::Double, u"Double", u"Float"},
    TypeRow{FieldType::Date, u"DateTime", u"DateTime"},
    TypeRow{FieldType::YesNo, u"Yes/No", u"Bit"},
    TypeRow{FieldType::Text, u"Text", u"Varchar"},
    TypeRow{FieldType::Memo, u"Memo", u"Text"},
    TypeRow{FieldType::VarBinary, u"VarBinary", u"Varbinary(255)"},
    TypeRow{FieldType::LongBinary, u"OLEObject", u"Long Varbinary"},
};

QString Text(std::u16string_view text)
{
    return QStringView(text.data(), qsizetype(text.size())).toString();
}

} // namespace

bool TypeNameOfField(FieldType type, QString& name)
{
    const auto row = std::ranges::find(kTypes, type, &TypeRow::type);
    if (row == kTypes.end())
        return false;
    name = Text(row->name);
    return true;
}

FieldType FieldTypeOfName(QStringView name)
{
    if (name.compare(u"Boolean", Qt::CaseInsensitive) == 0)
        return FieldType::YesNo;
    const auto row = std::ranges::find_if(
        kTypes, [name](const TypeRow& each) { return name.compare(Text(each.name), Qt::CaseInsensitive) == 0; });
    return row == kTypes.end() ? FieldType::None : row->type;
}

QStringList FieldTypeNames()
{
    QStringList names;
    for (const TypeRow& row : kTypes)
        names += Text(row.name);
    return names;
}

QString DdlTypeOfName(QStringView name, int size)
{
    if (name == u"Boolean")
        return u"Bit"_s;
    const auto row = std::ranges::find_if(
        kTypes, [name](const TypeRow& each) { return name == QStringView(each.name.data(), each.name.size()); });
    if (row == kTypes.end())
        return u"Text"_s;
    return row->type == FieldType::Text ? u"Varchar(%1)"_s.arg(size) : Text(row->clause);
}

} // namespace mirel
