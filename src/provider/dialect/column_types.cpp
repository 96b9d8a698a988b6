#include "provider/dialect/column_types.h"

#include <algorithm>
#include <array>

namespace mirel::dialect {
namespace {

struct TypeRow {
    QStringView first; // the clause's words, upper case
    QStringView second;
    FieldType type;
    FieldType sized = FieldType::None; // what it is with a size in parentheses; None: it takes none
};

// The first row of a type is the one that is written. The long text is called Text, the short one Varchar; a
// Text with a size is meant as a short one.
constexpr std::array kTypes = {
    TypeRow{u"VARCHAR", u"", FieldType::Text, FieldType::Text},
    TypeRow{u"TEXT", u"", FieldType::Memo, FieldType::Text},
    TypeRow{u"SMALLINT", u"", FieldType::SmallInt},
    TypeRow{u"INTEGER", u"", FieldType::Integer},
    TypeRow{u"FLOAT", u"", FieldType::Double},
    TypeRow{u"DATETIME", u"", FieldType::Date},
    TypeRow{u"BIT", u"", FieldType::YesNo},
    TypeRow{u"VARBINARY", u"", FieldType::VarBinary, FieldType::VarBinary},
    TypeRow{u"LONG", u"VARBINARY", FieldType::LongBinary},
    TypeRow{u"NVARCHAR", u"", FieldType::Text, FieldType::Text},
    TypeRow{u"CHAR", u"", FieldType::Text, FieldType::Text},
    TypeRow{u"CHARACTER", u"", FieldType::Text, FieldType::Text},
    TypeRow{u"MEMO", u"", FieldType::Memo},
    TypeRow{u"LONGTEXT", u"", FieldType::Memo},
    TypeRow{u"NTEXT", u"", FieldType::Memo},
    TypeRow{u"SHORT", u"", FieldType::SmallInt},
    TypeRow{u"INT", u"", FieldType::Integer},
    TypeRow{u"LONG", u"", FieldType::Integer},
    TypeRow{u"DOUBLE", u"PRECISION", FieldType::Double},
    TypeRow{u"DOUBLE", u"", FieldType::Double},
    TypeRow{u"REAL", u"", FieldType::Double},
    TypeRow{u"DATE", u"", FieldType::Date},
    TypeRow{u"TIMESTAMP", u"", FieldType::Date},
    TypeRow{u"BOOLEAN", u"", FieldType::YesNo},
    TypeRow{u"YESNO", u"", FieldType::YesNo},
    TypeRow{u"BINARY", u"", FieldType::VarBinary, FieldType::VarBinary},
    TypeRow{u"LONGBINARY", u"", FieldType::LongBinary},
    TypeRow{u"OLEOBJECT", u"", FieldType::LongBinary},
};

const TypeRow* TakeType(TokenCursor& cursor)
{
    for (const TypeRow& row : kTypes) {
        if (!cursor.AtWord(row.first))
            continue;
        if (row.second.isEmpty()) {
            cursor.Advance();
            return &row;
        }
        const auto mark = cursor;
        cursor.Advance();
        if (cursor.TakeWord(row.second))
            return &row;
        cursor = mark;
    }
    return nullptr;
}

} // namespace

bool ParseColumnType(TokenCursor& cursor, ColumnDefinition& column)
{
    const TypeRow* row = TakeType(cursor);
    if (!row)
        return cursor.Fail();
    column.type = row->type;
    const bool takesSize = row->sized != FieldType::None;
    column.size = row->type == row->sized ? kMaxTextSize : 0;
    if (!takesSize || !cursor.Take(Symbol::Open))
        return true;
    bool isInteger = false;
    column.type = row->sized;
    column.size = cursor.Current().text.toInt(&isInteger);
    if (cursor.Current().kind != TokenKind::Number)
        return cursor.Fail();
    if (!isInteger || column.size < 1 || column.size > kMaxTextSize)
        return cursor.Fail(Hr::Overflow);
    cursor.Advance();
    return cursor.Expect(Symbol::Close);
}

QString ColumnTypeText(const ColumnDefinition& column)
{
    const auto* const row = std::ranges::find(kTypes, column.type, &TypeRow::type);
    QString clause = row->first.toString();
    if (!row->second.isEmpty())
        clause += u' ' + row->second.toString();
    if (row->sized == column.type)
        clause += u'(' + QString::number(column.size) + u')';
    return clause;
}

} // namespace mirel::dialect
