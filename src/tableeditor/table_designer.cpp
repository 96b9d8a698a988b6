#include "tableeditor/table_designer.h"

#include "data/db_recordset.h"
#include "resources/string_table.h"

#include <algorithm>

namespace mirel {

using namespace Qt::StringLiterals;

TableDesigner::TableDesigner(DbConnection& connection, DatabaseLocation database, UserPrompt& prompt,
                             DesignHost& host)
    : connection_(connection)
    , database_(std::move(database))
    , prompt_(prompt)
    , host_(host)
    , run_(connection, database_, prompt)
{
}

bool TableDesigner::Open(const QString& table)
{
    std::optional<TableDesign> design = ReadTableDesign(connection_, database_, table, prompt_);
    if (!design)
        return false;
    design_ = std::move(*design);
    isNew_ = false;
    Select(std::max(selected_, 0));
    return true;
}

void TableDesigner::Select(int row)
{
    selected_ = std::min(row, int(design_.fields.size()) - 1);
}

void TableDesigner::SelectName(const QString& name)
{
    const auto field = std::ranges::find(design_.fields, name, &FieldDesign::name);
    Select(field == design_.fields.end() ? std::max(selected_, 0) : int(field - design_.fields.begin()));
}

bool TableDesigner::Tell(const std::optional<UserMessage>& fault)
{
    if (fault)
        prompt_.Show(*fault);
    return !fault;
}

bool TableDesigner::Create()
{
    if (!Tell(FaultOfTableName(design_.table)) || !Tell(FaultOfFields(design_.fields)))
        return false;
    QStringList tables;
    if (!Catalog(connection_, prompt_).ListTables(database_, tables))
        return false;
    if (tables.contains(design_.table, Qt::CaseInsensitive))
        return Tell(UserMessage{Str::DesignTableTaken, {design_.table}});
    if (!prompt_.AskYesNo({Str::DesignCreateQuestion, {design_.table}}) || !run_.Create(design_))
        return false;
    prompt_.Show({Str::DesignTableCreated, {design_.table}});
    return Open(design_.table);
}

bool TableDesigner::RenameTable(const QString& newName)
{
    const QString name = newName.trimmed();
    const QString before = design_.table;
    if (name == before)
        return true;
    if (!Tell(FaultOfTableName(name)) || !host_.WritePending(before))
        return false;
    const bool renamed =
        host_.Rename({NameChange::What::Table, {}, before, name}, [&](const DesignRun::LastStep& last) {
            return Finish(run_.RenameTable(design_, name, last));
        });
    if (!renamed)
        return false;
    design_.table = name;
    (void)Open(name);
    host_.TableChanged(before);
    prompt_.Show({Str::DesignTableRenamed, {before, name}});
    return true;
}

bool TableDesigner::DropTable()
{
    if (!host_.WritePending(design_.table) || !Finish(run_.DropTable(design_.table)))
        return false;
    host_.TableDropped(design_.table);
    return true;
}

bool TableDesigner::Finish(DesignRun::Outcome outcome)
{
    if (outcome != DesignRun::Outcome::Stale)
        return outcome == DesignRun::Outcome::Done;
    const QString table = design_.table;
    if (Open(table)) {
        host_.TableChanged(table);
        prompt_.Show({Str::DesignStale, {table}});
    }
    return false;
}

bool TableDesigner::Apply(const std::vector<FieldDesign>& wanted, const QString& name,
                          const DesignRun::LastStep& last)
{
    if (isNew_) {
        design_.fields = wanted;
        SelectName(name);
        return true;
    }
    if (!Finish(run_.Apply(design_, wanted, last)))
        return false;
    (void)Open(design_.table);
    SelectName(name);
    host_.TableChanged(design_.table);
    return true;
}

bool TableDesigner::AddField(FieldDesign field)
{
    field.name = field.name.trimmed();
    field.was.clear();
    std::vector<FieldDesign> wanted = design_.fields;
    wanted.push_back(field);
    return Tell(FaultOfFields(wanted)) && (isNew_ || host_.WritePending(Table())) && Apply(wanted, field.name);
}

bool TableDesigner::RenameField(int row, const QString& newName)
{
    std::vector<FieldDesign> wanted = design_.fields;
    const QString before = wanted[size_t(row)].name;
    wanted[size_t(row)].name = newName;
    if (isNew_)
        return Apply(wanted, newName);
    return host_.Rename({NameChange::What::Field, Table(), before, newName},
                        [&](const DesignRun::LastStep& last) { return Apply(wanted, newName, last); });
}

bool TableDesigner::ChangeField(int row, FieldDesign field)
{
    if (!HasRow(row))
        return false;
    field.name = field.name.trimmed();
    field.was = design_.fields[size_t(row)].was;
    std::vector<FieldDesign> wanted = design_.fields;
    wanted[size_t(row)] = field;
    if (!Tell(FaultOfFields(wanted)) || !(isNew_ || host_.WritePending(Table())))
        return false;
    if (field.name != design_.fields[size_t(row)].name && !RenameField(row, field.name))
        return false;
    // Each by itself: a type that is refused does not take the new name along.
    for (const bool storage : {true, false}) {
        wanted = design_.fields;
        const auto current = std::ranges::find(wanted, field.name, &FieldDesign::name);
        if (current == wanted.end())
            return false;
        if (storage ? current->SameStorage(field) : current->index == field.index)
            continue;
        if (storage) {
            current->type = field.type;
            current->size = field.size;
        } else {
            current->index = field.index;
        }
        if (!Apply(wanted, field.name))
            return false;
    }
    return true;
}

bool TableDesigner::DropField(int row)
{
    if (!HasRow(row))
        return false;
    std::vector<FieldDesign> wanted = design_.fields;
    wanted.erase(wanted.begin() + row);
    if (!isNew_ && wanted.empty())
        return Tell(UserMessage{Str::DesignLastField, {design_.fields.front().name}});
    if (!isNew_ && !host_.WritePending(Table()))
        return false;
    const QString next = wanted.empty() ? QString() : wanted[size_t(std::min(row, int(wanted.size()) - 1))].name;
    return Apply(wanted, next);
}

bool TableDesigner::Exchange(int upper, int selectedAfterwards)
{
    if (!HasRow(upper) || !HasRow(upper + 1))
        return false;
    std::vector<FieldDesign> wanted = design_.fields;
    std::swap(wanted[size_t(upper)], wanted[size_t(upper) + 1]);
    return (isNew_ || host_.WritePending(Table())) && Apply(wanted, wanted[size_t(selectedAfterwards)].name);
}

std::vector<QStringList> TableDesigner::FirstValues(int count) const
{
    std::vector<QStringList> values(design_.fields.size());
    if (isNew_)
        return values;
    DbRecordset rows(connection_);
    if (!rows.Open(u"SELECT * FROM "_s + NameInBrackets(Table()), database_, CursorType::ForwardOnly,
                   LockType::ReadOnly))
        return values;
    for (int record = 0; record < count && !rows.IsEof(); ++record) {
        for (size_t field = 0; field < values.size(); ++field)
            values[field] += rows.ValueText(int(field));
        if (!rows.MoveNext())
            break;
    }
    return values;
}

} // namespace mirel
