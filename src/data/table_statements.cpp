#include "data/table_statements.h"

#include "data/field_names.h"

#include <QStringList>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

QString FieldClause(const FieldDefinition& field)
{
    QString type;
    TypeNameOfField(field.type, type);
    return NameInBrackets(field.name) + u' ' + DdlTypeOfName(type, field.size);
}

QString Filled(QStringView format, const QString& table, const QString& field, const QString& other)
{
    return format.toString().arg(NameInBrackets(table), NameInBrackets(field), NameInBrackets(other));
}

} // namespace

IndexOrder IndexOrderOfWord(QStringView word)
{
    if (word.startsWith(u'N', Qt::CaseInsensitive))
        return IndexOrder::None;
    return word.compare(u"DESC", Qt::CaseInsensitive) == 0 ? IndexOrder::Descending : IndexOrder::Ascending;
}

QString WordOfIndexOrder(IndexOrder order)
{
    switch (order) {
    case IndexOrder::None:
        return u"NO"_s;
    case IndexOrder::Ascending:
        return u"ASC"_s;
    case IndexOrder::Descending:
        break;
    }
    return u"DESC"_s;
}

QString NameInBrackets(QStringView name)
{
    return u'[' + name.toString().replace(u']', "]]"_L1) + u']';
}

QString CreateTableStatement(const QString& table, std::span<const FieldDefinition> fields)
{
    QStringList clauses;
    for (const FieldDefinition& field : fields)
        clauses += FieldClause(field);
    return u"CREATE TABLE %1 (%2)"_s.arg(NameInBrackets(table), clauses.join(u','));
}

QString CreateStampTableStatement(const QString& stamp)
{
    return u"CREATE TABLE MirelSys%1 (SysParam Varchar(255))"_s.arg(stamp);
}

QString DropTableStatement(const QString& table)
{
    return u"DROP TABLE "_s + NameInBrackets(table);
}

QString RenameTableStatement(const QString& table, const QString& newName)
{
    return u"ALTER TABLE %1 to %2"_s.arg(NameInBrackets(table), NameInBrackets(newName));
}

QString AddFieldStatement(const QString& table, const FieldDefinition& field)
{
    return u"ALTER TABLE %1 ADD %2"_s.arg(NameInBrackets(table), FieldClause(field));
}

QString DropFieldStatement(const QString& table, const QString& field)
{
    return u"ALTER TABLE %1 DROP %2"_s.arg(NameInBrackets(table), NameInBrackets(field));
}

QString RenameFieldStatement(const QString& table, const QString& field, const QString& newName)
{
    return Filled(u"ALTER TABLE %1 RENAME %2 TO %3", table, field, newName);
}

QString MoveFieldStatement(const QString& table, const QString& field, const QString& before)
{
    return Filled(u"ALTER TABLE %1 MOVE %2 BEFORE %3", table, field, before);
}

QString CopyFieldStatement(const QString& table, const QString& field, const QString& source)
{
    return Filled(u"UPDATE %1 SET %2=%3", table, field, source);
}

QString IndexNameOfField(const QString& table, const QString& field)
{
    return u"%1_%2_idx"_s.arg(table, field);
}

QString CreateIndexStatement(const QString& table, const IndexDefinition& index)
{
    QStringList parts;
    for (const IndexDefinition::Part& part : index.parts)
        parts += NameInBrackets(part.field) + (part.descending ? u" DESC"_s : u" ASC"_s);
    return u"CREATE %1INDEX %2 ON %3 (%4)"_s.arg(index.unique ? u"UNIQUE "_s : QString(),
                                                 NameInBrackets(index.name), NameInBrackets(table),
                                                 parts.join(u','));
}

QString DropIndexStatement(const QString& table, const QString& index)
{
    return u"DROP INDEX %1.%2"_s.arg(NameInBrackets(table), NameInBrackets(index));
}

} // namespace mirel
