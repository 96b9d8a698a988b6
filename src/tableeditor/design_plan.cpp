#include "tableeditor/design_plan.h"

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// Follows a table through the statements as it writes them.
class DesignPlanner {
public:
    DesignPlanner(const TableDesign& current, const std::vector<FieldDesign>& wanted)
        : table_(current)
        , wanted_(wanted)
    {
    }

    DesignPlan Plan()
    {
        DropMissing();
        Rename();
        Convert();
        Add();
        DropLeftover();
        Order();
        Index();
        return std::move(plan_);
    }

private:
    // The table's field that a wanted one was; its `was` never changes on the way.
    FieldDesign* Find(const QString& was)
    {
        const auto field = std::ranges::find(table_.fields, was, &FieldDesign::was);
        return was.isEmpty() || field == table_.fields.end() ? nullptr : &*field;
    }
    bool IsWanted(const FieldDesign& field) const
    {
        return std::ranges::any_of(wanted_, [&](const FieldDesign& each) { return each.was == field.was; });
    }
    bool IsTaken(const QString& name) const
    {
        return std::ranges::any_of(table_.fields,
                                   [&](const FieldDesign& each) { return SameDesignName(each.name, name); });
    }
    // A name that no field has, neither now nor in the end.
    QString FreeFieldName(const QString& name) const
    {
        QStringList taken;
        for (const std::vector<FieldDesign>* fields : {&table_.fields, &wanted_}) {
            for (const FieldDesign& field : *fields)
                taken += field.name;
        }
        return FreeName(name, taken);
    }

    void DropMissing();
    void Rename();
    void Convert();
    void Add();
    void DropLeftover();
    void Order();
    void Index();

    void Drop(const QString& name);
    void RenameField(FieldDesign& field, const QString& name);
    void ConvertField(const FieldDesign& wanted);
    void AddField(const FieldDesign& field);
    void DropIndex(const QString& name);
    void CreateIndex(const IndexDefinition& index);

    TableDesign table_; // as it is after the statements so far
    const std::vector<FieldDesign>& wanted_;
    DesignPlan plan_;
    std::vector<IndexDefinition> lost_; // indexes that went with a field that came back
};

void DesignPlanner::Drop(const QString& name)
{
    plan_.statements += DropFieldStatement(table_.table, name);
    std::erase_if(table_.fields, [&](const FieldDesign& each) { return each.name == name; });
    std::erase_if(table_.indexes, [&](const IndexDefinition& each) {
        return std::ranges::any_of(each.parts, [&](const auto& part) { return part.field == name; });
    });
}

// A table has a field at any time: the last one goes when the new ones are there.
void DesignPlanner::DropMissing()
{
    const std::vector<FieldDesign> fields = table_.fields;
    for (const FieldDesign& field : fields) {
        if (IsWanted(field))
            continue;
        plan_.dropped += field.was;
        if (table_.fields.size() > 1)
            Drop(field.name);
    }
}

void DesignPlanner::DropLeftover()
{
    const auto leftover = std::ranges::find_if(
        table_.fields, [this](const FieldDesign& each) { return !each.was.isEmpty() && !IsWanted(each); });
    if (leftover != table_.fields.end())
        Drop(QString(leftover->name));
}

void DesignPlanner::RenameField(FieldDesign& field, const QString& name)
{
    plan_.statements += RenameFieldStatement(table_.table, field.name, name);
    for (IndexDefinition& index : table_.indexes) {
        for (IndexDefinition::Part& part : index.parts) {
            if (part.field == field.name)
                part.field = name;
        }
    }
    field.name = name;
}

// Each takes its name once that is free. Where names go round in a circle, one steps aside.
void DesignPlanner::Rename()
{
    for (;;) {
        FieldDesign* waiting = nullptr;
        bool renamed = false;
        for (const FieldDesign& wanted : wanted_) {
            FieldDesign* field = Find(wanted.was);
            if (!field || field->name == wanted.name)
                continue;
            waiting = field;
            if (IsTaken(wanted.name) && !SameDesignName(field->name, wanted.name))
                continue;
            RenameField(*field, wanted.name);
            renamed = true;
        }
        if (!waiting)
            return;
        if (!renamed)
            RenameField(*waiting, FreeFieldName(waiting->name));
    }
}

void DesignPlanner::AddField(const FieldDesign& field)
{
    plan_.statements += AddFieldStatement(table_.table, field.Definition());
    table_.fields.push_back(field);
    table_.fields.back().index = IndexOrder::None;
}

void DesignPlanner::ConvertField(const FieldDesign& wanted)
{
    const QString name = wanted.name;
    FieldDesign converted = wanted;
    converted.name = FreeFieldName(name + u" (new)"_s);
    plan_.conversions.push_back({wanted.was, wanted.type, wanted.size});
    for (const IndexDefinition& index : table_.indexes) {
        if (std::ranges::any_of(index.parts, [&](const auto& part) { return part.field == name; }))
            lost_.push_back(index);
    }
    AddField(converted);
    plan_.statements += CopyFieldStatement(table_.table, converted.name, name);
    Drop(name);
    RenameField(table_.fields.back(), name);
}

void DesignPlanner::Convert()
{
    for (const FieldDesign& wanted : wanted_) {
        const FieldDesign* field = Find(wanted.was);
        if (field && !field->SameStorage(wanted))
            ConvertField(wanted);
    }
}

void DesignPlanner::Add()
{
    for (const FieldDesign& wanted : wanted_) {
        if (!wanted.was.isEmpty())
            continue;
        // Only a field that is still to go can be in the way.
        const auto inTheWay = std::ranges::find_if(
            table_.fields, [&](const FieldDesign& each) { return SameDesignName(each.name, wanted.name); });
        if (inTheWay != table_.fields.end())
            RenameField(*inTheWay, FreeFieldName(inTheWay->name));
        AddField(wanted);
    }
}

void DesignPlanner::Order()
{
    std::vector<FieldDesign>& fields = table_.fields;
    for (size_t i = 0; i < wanted_.size(); ++i) {
        if (fields[i].name == wanted_[i].name)
            continue;
        plan_.statements += MoveFieldStatement(table_.table, wanted_[i].name, fields[i].name);
        const auto from = std::ranges::find(fields, wanted_[i].name, &FieldDesign::name);
        std::rotate(fields.begin() + qsizetype(i), from, from + 1);
    }
}

void DesignPlanner::DropIndex(const QString& name)
{
    plan_.statements += DropIndexStatement(table_.table, name);
    std::erase_if(table_.indexes, [&](const IndexDefinition& each) { return each.name == name; });
}

void DesignPlanner::CreateIndex(const IndexDefinition& index)
{
    const bool isThere = std::ranges::any_of(
        table_.indexes, [&](const IndexDefinition& each) { return SameDesignName(each.name, index.name); });
    if (isThere)
        return;
    plan_.statements += CreateIndexStatement(table_.table, index);
    table_.indexes.push_back(index);
}

void DesignPlanner::Index()
{
    for (const IndexDefinition& index : lost_) {
        const auto wanted = std::ranges::find(wanted_, index.parts.front().field, &FieldDesign::name);
        if (index.parts.size() > 1 || wanted->index != IndexOrder::None)
            CreateIndex(index);
    }
    for (const FieldDesign& wanted : wanted_) {
        const bool descending = wanted.index == IndexOrder::Descending;
        const IndexDefinition* own = OwnIndex(table_, wanted.name);
        if (own && wanted.index != IndexOrder::None && own->parts.front().descending == descending)
            continue;
        QStringList taken;
        for (const IndexDefinition& index : table_.indexes)
            taken += index.name;
        IndexDefinition made{FreeName(IndexNameOfField(table_.table, wanted.name), taken), {}, false};
        if (own)
            made = *own; // it keeps its name, and whether it is unique
        while ((own = OwnIndex(table_, wanted.name)))
            DropIndex(QString(own->name));
        made.parts = {{wanted.name, descending}};
        if (wanted.index != IndexOrder::None)
            CreateIndex(made);
    }
}

} // namespace

QStringList StatementsOfNewTable(const TableDesign& design)
{
    std::vector<FieldDefinition> fields;
    for (const FieldDesign& field : design.fields)
        fields.push_back(field.Definition());
    QStringList statements = {CreateTableStatement(design.table, fields)};
    for (const FieldDesign& field : design.fields) {
        if (field.index == IndexOrder::None)
            continue;
        const bool descending = field.index == IndexOrder::Descending;
        statements += CreateIndexStatement(
            design.table, {IndexNameOfField(design.table, field.name), {{field.name, descending}}, false});
    }
    return statements;
}

DesignPlan PlanDesign(const TableDesign& current, const std::vector<FieldDesign>& wanted)
{
    return DesignPlanner(current, wanted).Plan();
}

} // namespace mirel
