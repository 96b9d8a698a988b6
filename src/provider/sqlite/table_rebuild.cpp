#include "provider/sqlite/table_rebuild.h"

#include "provider/sqlite/sql_writer.h"
#include "provider/sqlite/table_text.h"

#include <QStringList>

#include <algorithm>

namespace mirel::sqlite {
namespace {

const QString kNewTable = QStringLiteral("mirel rebuilt table");

// While a table takes the old one's place, statements elsewhere in the file that name it must stay as they are.
class NamesStay {
public:
    explicit NamesStay(sqlite3* handle)
        : handle_(handle)
    {
        sqlite3_db_config(handle_, SQLITE_DBCONFIG_LEGACY_ALTER_TABLE, 1, nullptr);
    }
    ~NamesStay() { sqlite3_db_config(handle_, SQLITE_DBCONFIG_LEGACY_ALTER_TABLE, 0, nullptr); }
    Q_DISABLE_COPY_MOVE(NamesStay)

private:
    sqlite3* handle_;
};

class TableRebuild {
public:
    TableRebuild(DatabaseFile& file, const dialect::Table& table)
        : file_(file)
        , table_(table)
        , name_(QuoteName(table.storedName))
    {
    }

    Outcome MoveColumn(size_t from, size_t before);

private:
    // The first column of every row, as text.
    Outcome Texts(const QByteArray& sql, QStringList& texts);
    Outcome CreateMoved(size_t from, size_t before);
    Outcome CopyRows();
    Outcome TakePlace();
    Outcome KeepSequence();

    DatabaseFile& file_;
    const dialect::Table& table_;
    QByteArray name_;
    QByteArray newName_ = QuoteName(kNewTable);
    QStringList dependents_; // the statements of its indexes and triggers
};

Outcome TableRebuild::Texts(const QByteArray& sql, QStringList& texts)
{
    Outcome outcome;
    Statement statement = file_.Prepare(sql, outcome);
    if (!statement)
        return outcome;
    int result = statement.Step();
    for (; result == SQLITE_ROW; result = statement.Step())
        texts += statement.Text(0);
    return file_.OutcomeOf(result);
}

Outcome TableRebuild::CreateMoved(size_t from, size_t before)
{
    QStringList texts;
    Outcome outcome =
        Texts("SELECT sql FROM sqlite_schema WHERE type='table' AND name=" + QuoteText(table_.storedName), texts);
    if (!outcome.Ok())
        return outcome;
    std::optional<TableText> text = texts.isEmpty() ? std::nullopt : CutTableText(texts.first().toUtf8());
    if (!text || text->parts.size() < table_.columns.size())
        return {Hr::Unexpected, {}};
    const auto first = text->parts.begin();
    if (from < before)
        std::rotate(first + qsizetype(from), first + qsizetype(from) + 1, first + qsizetype(before));
    else
        std::rotate(first + qsizetype(before), first + qsizetype(from), first + qsizetype(from) + 1);
    return file_.Execute(text->Statement(newName_));
}

Outcome TableRebuild::CopyRows()
{
    // Generated columns make themselves.
    QStringList names;
    constexpr const char* kStored = "SELECT name FROM pragma_table_xinfo(%1) WHERE hidden=0";
    Outcome outcome = Texts(QByteArray(kStored).replace("%1", QuoteText(table_.storedName)), names);
    if (!outcome.Ok())
        return outcome;
    QByteArray columns = table_.rowId;
    for (const QString& name : names)
        columns += ',' + QuoteName(name);
    return file_.Execute("INSERT INTO " + newName_ + '(' + columns + ") SELECT " + columns + " FROM " + name_);
}

// An AUTOINCREMENT table remembers the highest row id it ever gave out.
Outcome TableRebuild::KeepSequence()
{
    QStringList sequence;
    const Outcome there = Texts("SELECT name FROM sqlite_schema WHERE name='sqlite_sequence'", sequence);
    if (!there.Ok() || sequence.isEmpty())
        return there;
    return file_.Execute("UPDATE sqlite_sequence SET seq=(SELECT seq FROM sqlite_sequence WHERE name=" +
                         QuoteText(table_.storedName) + ") WHERE name=" + QuoteText(kNewTable));
}

Outcome TableRebuild::TakePlace()
{
    const NamesStay namesStay(file_.Handle());
    Outcome outcome = file_.Execute("DROP TABLE " + name_);
    if (outcome.Ok())
        outcome = file_.Execute("ALTER TABLE " + newName_ + " RENAME TO " + name_);
    for (const QString& dependent : dependents_) {
        if (outcome.Ok())
            outcome = file_.Execute(dependent.toUtf8());
    }
    return outcome;
}

Outcome TableRebuild::MoveColumn(size_t from, size_t before)
{
    Outcome outcome = Texts("SELECT sql FROM sqlite_schema WHERE type IN ('index','trigger') AND sql IS NOT NULL "
                            "AND tbl_name=" +
                                QuoteText(table_.storedName) + " COLLATE NOCASE",
                            dependents_);
    if (outcome.Ok())
        outcome = CreateMoved(from, before);
    if (outcome.Ok())
        outcome = CopyRows();
    if (outcome.Ok())
        outcome = KeepSequence();
    return outcome.Ok() ? TakePlace() : outcome;
}

} // namespace

Outcome MoveColumnByRebuild(DatabaseFile& file, const dialect::Table& table, size_t from, size_t before)
{
    return TableRebuild(file, table).MoveColumn(from, before);
}

} // namespace mirel::sqlite
