#include "app/store_check.h"

#include "data/catalog.h"
#include "data/db_recordset.h"
#include "data/provider_error.h"
#include "data/statement_text.h"
#include "forms/assignment.h"
#include "forms/control_binding.h"
#include "forms/form_query.h"
#include "forms/record_context.h"
#include "platform/shared_file.h"
#include "resources/string_table.h"

#include <QFileInfo>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// Why a statement gives no records, on one line.
QString FaultOf(const DbRecordset& rows)
{
    return ProviderErrorText(&rows, rows.LastResult(), rows.ErrorContext()).section(u'\n', 0, 0).trimmed();
}

bool IsKnown(const QStringList& names, const QString& name)
{
    return names.contains(name, Qt::CaseInsensitive);
}

void CollectFieldNames(const ExprNode* tree, QStringList& names)
{
    if (!tree)
        return;
    if (tree->code == OpCode::Field)
        names += tree->text;
    for (const ExprTree& argument : tree->args)
        CollectFieldNames(argument.get(), names);
}

// What a control's sources name.
QStringList FieldsOf(const ControlDef& control)
{
    QStringList names;
    const ControlBinding binding = BindControl(control);
    if (!binding.isMaybeItem) // a drop-down box's one item is no field
        CollectFieldNames(binding.tree.get(), names);
    for (const ControlBinding::Column& column : binding.columns)
        CollectFieldNames(column.tree.get(), names);
    const bool assigns = control.buttonFunction == ButtonFunction::Update ||
                         control.buttonFunction == ButtonFunction::UpdateAll ||
                         control.buttonFunction == ButtonFunction::Insert;
    if (control.type == ControlType::Button && assigns) {
        for (const SourceAssignment& source : SplitAssignments(control.source.Text())) {
            const FieldAssignment assignment = ParseAssignment(source);
            CollectFieldNames(assignment.tree.get(), names);
            if (!assignment.target.field.isEmpty())
                names += u'[' + assignment.target.field + u']';
        }
    }
    names.removeDuplicates();
    return names;
}

class FormCheck {
public:
    FormCheck(DbConnection& connection, const DatabaseLocation& database, const FormStore& store,
              const QStringList& tables, std::vector<CheckFinding>& findings)
        : connection_(connection)
        , database_(database)
        , store_(store)
        , tables_(tables)
        , findings_(findings)
    {
    }

    void Run(const FormDef& form)
    {
        const QString name = form.name.Text();
        const QString table = form.tableName.Text();
        CheckCalls(form);
        if (!table.isEmpty() && !IsKnown(tables_, table)) {
            Note(StringText(Str::CheckFormTable, {name, table}));
            return;
        }
        const QString query = form.defaultQueryOnStartup != 0 && form.defaultQuery.IsSet()
                                  ? form.defaultQuery.Text()
                              : table.isEmpty() ? QString()
                                                : u"SELECT *"_s;
        if (query.isEmpty())
            return;
        const auto noText = [](QStringView) { return std::optional<QString>(); };
        DbRecordset rows(connection_);
        if (!rows.OpenSource(CompleteQuery(query, table, noText), database_, CursorType::ForwardOnly,
                             LockType::ReadOnly)) {
            Note(StringText(Str::CheckFormQuery, {name, FaultOf(rows)}));
            return;
        }
        CheckFields(form, rows);
    }

private:
    void Note(const QString& text) { findings_.push_back({text, Str::RemedyForm}); }

    void CheckCalls(const FormDef& form)
    {
        for (const ControlDef& control : form.controls) {
            const bool calls =
                control.type == ControlType::Button && control.buttonFunction == ButtonFunction::CallForm;
            if (calls && !store_.FindForm(control.source.Text()))
                Note(StringText(Str::CheckFormCall,
                                {form.name.Text(), control.name.Text(), control.source.Text()}));
        }
    }

    void CheckFields(const FormDef& form, DbRecordset& rows)
    {
        RecordContext context(rows, YesNoWords(), [](QStringView) { return QString(); });
        context.ResultChanged();
        for (const ControlDef& control : form.controls) {
            for (const QString& field : FieldsOf(control)) {
                if (context.FindColumn(field) < 0)
                    Note(StringText(Str::CheckFormField, {form.name.Text(), control.name.Text(), field}));
            }
        }
    }

    DbConnection& connection_;
    const DatabaseLocation& database_;
    const FormStore& store_;
    const QStringList& tables_;
    std::vector<CheckFinding>& findings_;
};

} // namespace

std::vector<CheckFinding> CheckStoreFile(const QString& path, FormStore& store)
{
    if (!QFileInfo::exists(path))
        return {};
    const std::optional<QByteArray> bytes = ReadWholeFile(path);
    if (!bytes)
        return {{StringText(Str::CheckStoreUnread, {path, qt_error_string()}), Str::RemedyStore}};
    if (bytes->isEmpty())
        return {{StringText(Str::CheckStoreEmpty, {path}), Str::RemedyStore}};
    if (!store.LoadFrom(*bytes))
        return {{StringText(Str::CheckStoreShort, {path}), Str::RemedyStore}};
    return {};
}

std::vector<CheckFinding> CheckReferences(DbConnection& connection, const DatabaseLocation& database,
                                          const FormStore& store)
{
    std::vector<CheckFinding> findings;
    DbRecordset list(connection);
    QStringList tables;
    bool more =
        list.Open(u"SELECT TableName FROM MSysTables"_s, database, CursorType::ForwardOnly, LockType::ReadOnly);
    for (; more && !list.IsEof(); more = list.MoveNext())
        tables += list.ValueText(0);
    if (!more)
        return {{FaultOf(list), Str::RemedyTables}};
    FormCheck check(connection, database, store, tables, findings);
    for (const FormDef& form : store.Forms())
        check.Run(form);
    for (const QueryDef& query : store.Queries()) {
        DbRecordset rows(connection);
        const QString statement = query.text.Text();
        if (OnlyReads(statement) &&
            !rows.OpenSource(statement, database, CursorType::ForwardOnly, LockType::ReadOnly))
            findings.push_back(
                {StringText(Str::CheckQuery, {query.name.Text(), FaultOf(rows)}), Str::RemedyQuery});
    }
    return findings;
}

} // namespace mirel
