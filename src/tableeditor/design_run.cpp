#include "tableeditor/design_run.h"

#include "data/db_recordset.h"
#include "data/field_names.h"
#include "data/provider_error.h"
#include "data/db_transaction.h"
#include "resources/string_table.h"
#include "tableeditor/held_prompt.h"

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// "Text (40)", "Integer".
QString TypeText(FieldType type, int size)
{
    QString name;
    TypeNameOfField(type, name);
    return type == FieldType::Text ? u"%1 (%2)"_s.arg(name).arg(size) : name;
}

const FieldDesign& FieldNamed(const TableDesign& design, const QString& name)
{
    return *std::ranges::find(design.fields, name, &FieldDesign::name);
}

// A text field that only gets longer.
bool OnlyGrows(const FieldDesign& field, const DesignPlan::Conversion& conversion)
{
    return field.type == FieldType::Text && conversion.type == FieldType::Text && conversion.size > field.size;
}

} // namespace

bool DesignRun::Stake::Exceeds(const Stake& told) const
{
    for (size_t i = 0; i < dropped.size(); ++i) {
        if (dropped[i] > told.dropped[i])
            return true;
    }
    for (size_t i = 0; i < converted.size(); ++i) {
        if (converted[i].altered > told.converted[i].altered || converted[i].unfit > 0)
            return true;
    }
    return false;
}

template <typename Steps>
DesignRun::Outcome DesignRun::InTransaction(Steps steps)
{
    HeldPrompt held(prompt_); // outlives the transaction
    DbTransaction transaction(connection_, database_);
    if (!transaction.Begin()) {
        transaction.Report(held);
        return Outcome::Refused;
    }
    const Outcome outcome = steps(held);
    if (outcome != Outcome::Done || transaction.Commit())
        return outcome;
    transaction.Report(held);
    return Outcome::Refused;
}

DesignRun::Outcome DesignRun::Execute(const QStringList& statements, UserPrompt& prompt)
{
    for (const QString& statement : statements) {
        DbRecordset recordset(connection_);
        if (recordset.Open(statement, database_, CursorType::ForwardOnly, LockType::ReadOnly))
            continue;
        ReportProviderError(prompt, &recordset, recordset.LastResult());
        return Outcome::Refused;
    }
    return Outcome::Done;
}

bool DesignRun::Create(const TableDesign& design)
{
    return InTransaction([&](UserPrompt& prompt) { return Execute(StatementsOfNewTable(design), prompt); }) ==
           Outcome::Done;
}

std::optional<DesignRun::Stake> DesignRun::Survey(const TableDesign& current, const DesignPlan& plan,
                                                  UserPrompt& prompt)
{
    Stake stake;
    for (const QString& field : plan.dropped) {
        stake.dropped.push_back(CountValues(connection_, database_, current.table, field, prompt));
        if (stake.dropped.back() < 0)
            return {};
    }
    for (const DesignPlan::Conversion& conversion : plan.conversions) {
        const qint64 records = CountRecords(connection_, database_, current.table, prompt);
        if (records < 0)
            return {};
        const std::unique_ptr<Progress> progress =
            prompt.StartProgress({Str::DesignLooking, {conversion.field}}, records);
        const std::optional<ValuesAtStake> values =
            SurveyConversion(connection_, database_, current.table, conversion.field, conversion.type,
                             conversion.size, prompt, *progress);
        if (!values)
            return {};
        stake.converted.push_back(*values);
    }
    return stake;
}

bool DesignRun::AllConvert(const TableDesign& current, const DesignPlan& plan, const Stake& stake)
{
    for (size_t i = 0; i < stake.converted.size(); ++i) {
        const ValuesAtStake& values = stake.converted[i];
        const DesignPlan::Conversion& conversion = plan.conversions[i];
        if (values.unfit == 0)
            continue;
        prompt_.Show({Str::DesignValuesUnfit,
                      {QString::number(values.unfit), QString::number(values.values), current.table,
                       conversion.field, TypeText(conversion.type, conversion.size), values.firstUnfit.left(60)}});
        return false;
    }
    return true;
}

bool DesignRun::Ask(const TableDesign& current, const DesignPlan& plan, const Stake& stake)
{
    for (size_t i = 0; i < stake.dropped.size(); ++i) {
        const Str question = stake.dropped[i] > 0 ? Str::DesignDropField : Str::DesignDropEmptyField;
        const QString count = QString::number(stake.dropped[i]);
        if (!prompt_.AskYesNo({question, {plan.dropped[qsizetype(i)], count}}))
            return false;
    }
    for (size_t i = 0; i < stake.converted.size(); ++i) {
        const ValuesAtStake& values = stake.converted[i];
        const DesignPlan::Conversion& conversion = plan.conversions[i];
        const FieldDesign& field = FieldNamed(current, conversion.field);
        if (values.values == 0 || OnlyGrows(field, conversion))
            continue;
        const Str question = values.altered == 0 ? Str::DesignConvertSame : Str::DesignConvertAltered;
        if (!prompt_.AskYesNo(
                {question,
                 {field.name, TypeText(field.type, field.size), TypeText(conversion.type, conversion.size),
                  QString::number(values.values), QString::number(values.altered)}}))
            return false;
    }
    return true;
}

DesignRun::Outcome DesignRun::CheckUnchanged(const TableDesign& current, UserPrompt& prompt)
{
    const std::optional<TableDesign> now = ReadTableDesign(connection_, database_, current.table, prompt);
    if (!now)
        return Outcome::Refused;
    return *now == current ? Outcome::Done : Outcome::Stale;
}

DesignRun::Outcome DesignRun::Apply(const TableDesign& current, const std::vector<FieldDesign>& wanted,
                                    const LastStep& last)
{
    // First of all: a survey of fields that are gone would report nothing but that.
    if (const Outcome unchanged = CheckUnchanged(current, prompt_); unchanged != Outcome::Done)
        return unchanged;
    const DesignPlan plan = PlanDesign(current, wanted);
    bool grew = false;
    Outcome outcome = Outcome::Refused;
    do {
        const std::optional<Stake> told = Survey(current, plan, prompt_);
        if (!told || !AllConvert(current, plan, *told) || !Ask(current, plan, *told))
            return Outcome::Refused;
        outcome = InTransaction([&](UserPrompt& prompt) {
            if (const Outcome unchanged = CheckUnchanged(current, prompt); unchanged != Outcome::Done)
                return unchanged;
            const std::optional<Stake> now = Survey(current, plan, prompt);
            grew = now && now->Exceeds(*told);
            if (!now || grew)
                return Outcome::Refused;
            const Outcome done = Execute(plan.statements, prompt);
            return done == Outcome::Done && last && !last() ? Outcome::Refused : done;
        });
    } while (grew);
    return outcome;
}

DesignRun::Outcome DesignRun::RenameTable(const TableDesign& current, const QString& newName, const LastStep& last)
{
    return InTransaction([&](UserPrompt& prompt) {
        if (const Outcome unchanged = CheckUnchanged(current, prompt); unchanged != Outcome::Done)
            return unchanged;
        const Outcome done = Execute({RenameTableStatement(current.table, newName)}, prompt);
        return done == Outcome::Done && last && !last() ? Outcome::Refused : done;
    });
}

DesignRun::Outcome DesignRun::DropTable(const QString& table)
{
    bool grew = false;
    Outcome outcome = Outcome::Refused;
    do {
        const qint64 told = CountRecords(connection_, database_, table, prompt_);
        const Str question = told > 0 ? Str::DesignDropTable : Str::DropTable;
        if (told < 0 || !prompt_.AskYesNo({question, {table, QString::number(told)}}))
            return Outcome::Refused;
        outcome = InTransaction([&](UserPrompt& prompt) {
            const qint64 now = CountRecords(connection_, database_, table, prompt);
            grew = now > told;
            return now < 0 || grew ? Outcome::Refused : Execute({DropTableStatement(table)}, prompt);
        });
    } while (grew);
    return outcome;
}

} // namespace mirel
