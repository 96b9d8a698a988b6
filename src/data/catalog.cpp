#include "data/catalog.h"

#include "data/db_recordset.h"
#include "data/provider_error.h"
#include "platform/user_locale.h"
#include "provider/cell_value.h"
#include "provider/dialect/keywords.h"
#include "provider/dialect/schema.h"

#include <QDateTime>
#include <QFileInfo>
#include <QHash>

#include <algorithm>
#include <functional>
#include <iterator>
#include <utility>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

bool IsCatalogTable(const QString& table)
{
    return table == "MSysFields"_L1 || table == "MSysTables"_L1 || table == "MSysIndexes"_L1 ||
           table == "MSysProcs"_L1;
}

bool Run(DbRecordset& recordset, const QString& source, const DatabaseLocation& database)
{
    return recordset.Open(source, database, CursorType::ForwardOnly, LockType::ReadOnly);
}

bool RunOrReport(UserPrompt& prompt, DbRecordset& recordset, const QString& source,
                 const DatabaseLocation& database)
{
    if (Run(recordset, source, database))
        return true;
    ReportProviderError(prompt, &recordset, recordset.LastResult());
    return false;
}

// "[Ship To]": brackets around one name. "[x" and "[a]b" are names that begin so.
bool IsBracketed(QStringView name)
{
    if (name.size() < 2 || name.front() != u'[' || name.back() != u']')
        return false;
    QString inner = name.sliced(1, name.size() - 2).toString();
    return !inner.remove("]]"_L1).contains(u']');
}

// The first column of every row, as text.
bool ListFirstColumn(DbRecordset& rows, const QString& source, const DatabaseLocation& database,
                     QStringList& texts)
{
    if (!Run(rows, source, database))
        return false;
    const FieldType type = rows.TypeOfField(0);
    return rows.Read({.fields = {0}}, [&](std::span<const Cell> cells) {
        texts += VariantText(ValueOfCell(cells.front(), type));
        return true;
    });
}

bool ReadStamp(DbRecordset& rows, const DatabaseLocation& database, QString& stamp)
{
    QStringList names;
    if (!ListFirstColumn(rows, u"SELECT TableName FROM MSysTables WHERE TableName LIKE 'MirelSys%'"_s, database,
                         names))
        return false;
    names.sort(); // the oldest stamp, should there be several
    for (const QString& name : std::as_const(names)) {
        stamp = dialect::StampOfTable(name).toString();
        if (!stamp.isEmpty())
            break;
    }
    return true;
}

// The wall clock's reading, on which seconds can be counted up without meeting the end of summer time.
QDateTime WallClockNow()
{
    const QDateTime now = QDateTime::currentDateTime();
    return {now.date(), now.time(), Qt::UTC};
}

} // namespace

bool Catalog::ListTables(const DatabaseLocation& database, QStringList& tables)
{
    tables.clear();
    DbRecordset rows(connection_);
    QStringList names;
    if (!ListFirstColumn(rows, u"SELECT TableName FROM MSysTables ORDER BY TableName"_s, database, names)) {
        ReportProviderError(prompt_, &rows, rows.LastResult());
        return false;
    }
    std::ranges::copy_if(names, std::back_inserter(tables), [](const QString& name) {
        return !IsCatalogTable(name) && dialect::StampOfTable(name).isEmpty();
    });
    return true;
}

bool Catalog::FindDatabaseStamp(const DatabaseLocation& database, QString& stamp)
{
    stamp.clear();
    DbRecordset rows(connection_);
    if (ReadStamp(rows, database, stamp))
        return true;
    ReportProviderError(prompt_, &rows, rows.LastResult());
    return false;
}

bool Catalog::BearsStamp(const DatabaseLocation& database, const QString& stamp)
{
    DbRecordset rows(connection_);
    QString found;
    return ReadStamp(rows, database, found) && found == stamp;
}

bool Catalog::EnsureSystemTable(const DatabaseLocation& database, const QString& folderOfSideFiles, QString& stamp)
{
    stamp.clear();
    QString wanted;
    QDateTime moment = WallClockNow();
    do {
        wanted = moment.toString(u"yyyyMMddHHmmss"_s);
        moment = moment.addSecs(1);
    } while (QFileInfo::exists(SideFilePath(folderOfSideFiles, wanted)));
    DbRecordset statement(connection_);
    if (!Run(statement, CreateStampTableStatement(wanted), database))
        return ReadStamp(statement, database, stamp) && !stamp.isEmpty(); // another program was faster
    stamp = wanted;
    return true;
}

bool Catalog::ListFields(const QString& table, const DatabaseLocation& database, QStringList& fields)
{
    fields.clear();
    DbRecordset rows(connection_);
    if (!RunOrReport(prompt_, rows, IsBracketed(table) ? table : BracketedName(table), database))
        return false;
    for (const ResultField& field : rows.Fields())
        fields += field.name;
    return true;
}

bool Catalog::FindFieldIndex(const QString& table, const QString& field, const DatabaseLocation& database,
                             QString& index, int& flags)
{
    index.clear();
    flags = 0;
    DbRecordset rows(connection_);
    if (!RunOrReport(prompt_, rows, u"SELECT TableID FROM MSysTables WHERE TableName="_s + QuoteText(table),
                     database))
        return false;
    if (rows.IsEof())
        return true;
    const QString tableId = rows.ValueText(0);
    if (!RunOrReport(
            prompt_, rows,
            u"SELECT FieldID FROM MSysFields WHERE TableID=%1 AND FieldName=%2"_s.arg(tableId, QuoteText(field)),
            database))
        return false;
    if (rows.IsEof())
        return true;
    const QString fieldId = rows.ValueText(0);
    if (!Run(rows,
             u"SELECT IndexName,IndexFlags FROM MSysIndexes WHERE TableID=%1 AND FieldID=%2"_s.arg(tableId,
                                                                                                   fieldId),
             database))
        return false;
    if (!rows.IsEof()) {
        index = rows.ValueText(0);
        flags = rows.ValueText(1).toInt();
    }
    return true;
}

bool Catalog::ListIndexes(const QString& table, const DatabaseLocation& database,
                          std::vector<IndexDefinition>& indexes)
{
    constexpr int kDescending = 1;
    constexpr int kUnique = 2;
    indexes.clear();
    DbRecordset rows(connection_);
    if (!RunOrReport(prompt_, rows, u"SELECT TableID FROM MSysTables WHERE TableName="_s + QuoteText(table),
                     database))
        return false;
    if (rows.IsEof())
        return true;
    const QString tableId = rows.ValueText(0);
    const auto read = [&](const QString& statement, const std::function<void()>& row) {
        bool reads = RunOrReport(prompt_, rows, statement.arg(tableId), database);
        while (reads && !rows.IsEof()) {
            row();
            reads = rows.MoveNext();
        }
        return reads;
    };
    QHash<QString, QString> fields; // by their numbers
    const bool named = read(u"SELECT FieldID,FieldName FROM MSysFields WHERE TableID=%1"_s,
                            [&] { fields.insert(rows.ValueText(0), rows.ValueText(1)); });
    return named && read(u"SELECT IndexName,FieldID,IndexFlags FROM MSysIndexes WHERE TableID=%1"_s, [&] {
               const QString name = rows.ValueText(0);
               const int flags = rows.ValueText(2).toInt();
               if (indexes.empty() || indexes.back().name != name)
                   indexes.push_back({name, {}, (flags & kUnique) != 0});
               indexes.back().parts.push_back({fields.value(rows.ValueText(1)), (flags & kDescending) != 0});
           });
}

bool Catalog::ExecuteStatement(const DatabaseLocation& database, const QString& statement)
{
    DbRecordset recordset(connection_);
    return RunOrReport(prompt_, recordset, statement, database);
}

QString SideFilePath(const QString& folder, const QString& stamp)
{
    return u"%1/Mirel_%2.RAF"_s.arg(folder, stamp);
}

QString BracketedName(QStringView name)
{
    return u'[' + name.toString().replace(u']', "]]"_L1) + u']';
}

QString FieldReference(QStringView name)
{
    const bool asItStands = name.isEmpty() || IsBracketed(name) || name == u"*";
    const auto isLatinLetter = [](QChar each) { return each.unicode() < 0x80 && each.isLetter(); };
    const bool plain = !name.isEmpty() && isLatinLetter(name.front()) && std::ranges::all_of(name, [](QChar each) {
        return each.unicode() < 0x80 && (each.isLetterOrNumber() || each == u'_');
    });
    if (asItStands || (plain && !dialect::IsReservedWord(name)))
        return name.toString();
    return BracketedName(name);
}

QString QuoteText(QStringView text)
{
    return u'\'' + text.toString().replace(u'\'', "''"_L1) + u'\'';
}

} // namespace mirel
