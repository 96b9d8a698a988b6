#include "provider/sqlite/declared_type.h"

#include <array>

namespace mirel::sqlite {
namespace {

struct TypeRow {
    QStringView part; // upper case
    FieldType type;
};

// The first row that is part of a declared type decides; LONG and SHORT come behind the types they qualify.
constexpr std::array kForeignTypes = {
    TypeRow{u"TEXT", FieldType::Memo},
    TypeRow{u"CHAR", FieldType::Text},
    TypeRow{u"CLOB", FieldType::Memo},
    TypeRow{u"STRING", FieldType::Memo},
    TypeRow{u"MEMO", FieldType::Memo},
    TypeRow{u"UUID", FieldType::Memo},
    TypeRow{u"JSON", FieldType::Memo},
    TypeRow{u"LONG VARBINARY", FieldType::LongBinary},
    TypeRow{u"BINARY", FieldType::VarBinary},
    TypeRow{u"BLOB", FieldType::LongBinary},
    TypeRow{u"OLEOBJECT", FieldType::LongBinary},
    TypeRow{u"DATE", FieldType::Date},
    TypeRow{u"TIME", FieldType::Date},
    TypeRow{u"BOOL", FieldType::YesNo},
    TypeRow{u"YESNO", FieldType::YesNo},
    TypeRow{u"SMALLINT", FieldType::SmallInt},
    TypeRow{u"TINYINT", FieldType::SmallInt},
    TypeRow{u"INT2", FieldType::SmallInt},
    TypeRow{u"POINT", FieldType::Memo},
    TypeRow{u"INT", FieldType::Integer},
    TypeRow{u"REAL", FieldType::Double},
    TypeRow{u"FLOA", FieldType::Double},
    TypeRow{u"DOUB", FieldType::Double},
    TypeRow{u"NUM", FieldType::Double},
    TypeRow{u"DEC", FieldType::Double},
    TypeRow{u"MONEY", FieldType::Double},
    TypeRow{u"CURRENCY", FieldType::Double},
    TypeRow{u"SHORT", FieldType::SmallInt},
    TypeRow{u"LONG", FieldType::Integer},
    TypeRow{u"BIT", FieldType::YesNo},
};

struct OwnRow {
    QStringView clause;
    FieldType type;
};
constexpr std::array kOwnTypes = {
    OwnRow{u"TEXT", FieldType::Memo},
    OwnRow{u"SMALLINT", FieldType::SmallInt},
    OwnRow{u"INTEGER", FieldType::Integer},
    OwnRow{u"FLOAT", FieldType::Double},
    OwnRow{u"DATETIME", FieldType::Date},
    OwnRow{u"BIT", FieldType::YesNo},
    OwnRow{u"LONG VARBINARY", FieldType::LongBinary},
};

// The number in "(n)", or the first of "(n, m)"; -1: none.
int SizeIn(QStringView declared)
{
    const qsizetype open = declared.indexOf(u'(');
    const QStringView inside = open < 0 ? QStringView() : declared.mid(open + 1).trimmed();
    qsizetype digits = 0;
    while (digits < inside.size() && inside[digits] >= u'0' && inside[digits] <= u'9')
        ++digits;
    bool reads = false;
    const int size = inside.left(digits).toInt(&reads);
    return reads && size > 0 ? size : -1;
}

} // namespace

DeclaredType ReadDeclaredType(QStringView declared)
{
    const QString upper = declared.trimmed().toString().toUpper();
    for (const OwnRow& row : kOwnTypes) {
        if (upper == row.clause)
            return {row.type, -1, true};
    }
    FieldType type = FieldType::Memo;
    for (const TypeRow& row : kForeignTypes) {
        if (upper.contains(row.part)) {
            type = row.type;
            break;
        }
    }
    const int size = SizeIn(upper);
    const bool fits = size > 0 && size <= kMaxTextSize;
    if (type == FieldType::Text)
        return fits ? DeclaredType{type, size, upper.startsWith(u"VARCHAR(")} : DeclaredType{FieldType::Memo};
    if (type == FieldType::VarBinary)
        return fits ? DeclaredType{type, size, upper.startsWith(u"VARBINARY(")}
                    : DeclaredType{FieldType::LongBinary};
    return {type};
}

} // namespace mirel::sqlite
