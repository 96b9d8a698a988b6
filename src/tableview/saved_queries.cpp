#include "tableview/saved_queries.h"

#include "data/catalog.h"
#include "data/db_recordset.h"
#include "data/statement_text.h"
#include "resources/string_table.h"
#include "tableview/record_browser.h"

namespace mirel {

using namespace Qt::StringLiterals;

namespace {

QueryDef MakeQuery(const QString& name, const QString& table, const QString& statement)
{
    QueryDef query;
    query.SetName(name);
    query.SetTableName(table);
    query.SetText(statement);
    return query;
}

} // namespace

QStringList SavedQueries::Names() const
{
    QStringList names;
    for (const QueryDef& query : store_.Queries())
        names += query.name.Text();
    return names;
}

std::optional<QString> SavedQueries::StatementOf(QStringView name) const
{
    const QueryDef* query = std::as_const(store_).FindQuery(name);
    return query ? std::optional(query->text.Text()) : std::nullopt;
}

bool SavedQueries::Knows(QStringView name) const
{
    QueryDef query;
    query.SetName(name);
    return std::as_const(store_).FindQuery(query.name.Text()) != nullptr;
}

bool SavedQueries::AskIfUnbalanced(const QString& statement)
{
    return IsBalanced(statement) ||
           prompt_.AskYesNo({Str::UnbalancedQuestion,
                             {StringText(Str::StatementUnbalanced), StringText(Str::ContinueQuestion)}});
}

bool SavedQueries::AskIfItChanges(const QString& name, const QString& statement)
{
    if (OnlyReads(statement))
        return true;
    constexpr qsizetype kMaxShown = 400; // of a small window; what a statement does stands at its beginning
    const QString shown = statement.size() > kMaxShown ? statement.first(kMaxShown) + u'…' : statement;
    return prompt_.AskYesNo({Str::RunQueryThatChanges, {name, shown}});
}

bool SavedQueries::Save(const QString& name, const QString& table, const QString& statement, OnExisting existing)
{
    return Save(MakeQuery(name, table, statement),
                [existing](const QueryDef&) { return existing == OnExisting::Replace; });
}

bool SavedQueries::Save(const QString& name, const QString& table, const QString& statement,
                        const std::optional<QueryDef>& edited)
{
    return Save(MakeQuery(name, table, statement), [&edited](const QueryDef& stored) {
        return edited && edited->name.Text() == stored.name.Text() && edited->text.Text() == stored.text.Text();
    });
}

bool SavedQueries::Save(const QueryDef& query, const std::function<bool(const QueryDef& stored)>& mayReplace)
{
    const QString kept = query.name.Text();
    if (kept.trimmed().isEmpty())
        return false;
    // Whether the name is taken is known for certain only under the store's lock, and nobody is asked there.
    bool agreed = false;
    for (;;) {
        bool taken = false;
        const bool saved = store_.Apply([&](FormStore& store) {
            QueryDef* before = store.FindQuery(kept);
            taken = before && !agreed && !mayReplace(*before);
            if (taken)
                return false;
            if (before) {
                before->tableName = query.tableName;
                before->text = query.text;
            } else {
                store.AddQuery(query);
            }
            return true;
        });
        if (saved)
            return true;
        if (!taken) {
            ReportFailure();
            return false;
        }
        if (!prompt_.AskYesNo({Str::QueryExists, {kept}}))
            return false;
        agreed = true;
    }
}

bool SavedQueries::Remove(const QString& name)
{
    bool found = false;
    const bool removed = store_.Apply([&](FormStore& store) { return found = store.RemoveQuery(name); });
    if (removed)
        return true;
    if (found || !store_.LastError().isEmpty())
        ReportFailure();
    else
        prompt_.Show({Str::NoSuchQuery, {name}});
    return false;
}

void SavedQueries::ReportFailure()
{
    if (CanSave())
        prompt_.ShowError(store_.LastError());
    else
        prompt_.Show({Str::StoreMissing, {}});
}

QString ShownStatement(const RecordBrowser& browser)
{
    const QString& statement = browser.Statement();
    const QStringList written = SelectList(statement);
    const std::span<const ResultField> fields = browser.Fields();
    QStringList shown;
    for (int i = 0; i < browser.FieldCount(); ++i) {
        const ResultField& field = fields[size_t(i)];
        if (!browser.IsVisible(i))
            continue;
        if (!field.column.isEmpty()) {
            const bool renamed = field.name.compare(field.column, Qt::CaseInsensitive) != 0;
            shown += renamed ? u"%1 AS %2"_s.arg(browser.ReferenceOf(i), FieldReference(field.name))
                             : browser.ReferenceOf(i);
        } else if (written.size() == browser.FieldCount()) {
            shown += written[i];
        } else {
            return statement; // an expression beside a "*": there is no name to say it by
        }
    }
    return shown.size() == browser.FieldCount() ? statement : WithSelectList(statement, shown);
}

} // namespace mirel
