#include "forms/design/expression_desk.h"

#include "data/catalog.h"
#include "expr/explain.h"
#include "expr/expr_parser.h"
#include "forms/aggregate_pass.h"
#include "forms/assignment.h"
#include "forms/control_binding.h"
#include "forms/control_types.h"
#include "forms/design/expression_words.h"
#include "resources/string_table.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qsizetype kDeepestReference = 20;

// What depends on the record alone.
constexpr std::array kOfThisRecord = {Str::ExplainNoRecord, Str::ExplainFieldIsNull, Str::ExplainNullWord,
                                      Str::ExplainDivisionByZero, Str::ExplainNoValue};

bool DependsOnRecord(const ExprSlip& slip)
{
    return std::ranges::find(kOfThisRecord, slip.reason) != kOfThisRecord.end();
}

bool HasAggregate(const ExprNode& node)
{
    if (node.code == OpCode::Sum || node.code == OpCode::Avg || node.code == OpCode::Min ||
        node.code == OpCode::Max)
        return true;
    return std::ranges::any_of(node.args, [](const ExprTree& arg) { return arg && HasAggregate(*arg); });
}

// The first that can hold a value, as the running form finds it; null: none.
const ControlDef* InputOf(const FormDef& form, QStringView name)
{
    const auto found = std::ranges::find_if(form.controls, [name](const ControlDef& control) {
        return Has(control.type, HoldsValue) && control.name.Text().trimmed() == name.trimmed();
    });
    return found == form.controls.end() ? nullptr : &*found;
}

QStringList NamesIn(const ControlDef& control)
{
    QStringList names;
    for (const DeskQuestion& question : ExpressionsOf(control)) {
        if (const ExprTree tree = ParseExpression(question.text, question.mode))
            CollectControlNames(*tree, names);
    }
    return names;
}

QString Listed(const ControlDef& control, const QString& what)
{
    const QString name = control.name.Text();
    const ControlTypeDef& type = TypeOf(control.type);
    return StringText(
        Str::MakerLoss,
        {name.isEmpty() ? StringText(type.title, {QString::number(int(control.type))}) : name, what});
}

} // namespace

std::vector<DeskQuestion> ExpressionsOf(const ControlDef& control)
{
    const QString source = control.source.Text();
    const bool overAll = control.sourceScope == SourceScope::WholeResult;
    std::vector<DeskQuestion> found;
    switch (SourceKindOf(control.type)) {
    case SourceKind::Expression:
        if (control.hasSource != 0)
            found.push_back({source, ExprMode::Condition, overAll, false, Has(control.type, IsTicked)});
        break;
    case SourceKind::Items: {
        const QString data = SplitDropDown(source).data;
        // One word alone is an item, or a field; both are well.
        if (control.hasSource != 0 && DropDownItems(data).size() == 1 && data.contains(u'('))
            found.push_back({data, ExprMode::Condition, overAll, false, false});
        break;
    }
    case SourceKind::Columns:
        for (const SourceColumn& column : SplitListColumns(source))
            found.push_back({column.expression, ExprMode::Value, false, true, false});
        break;
    case SourceKind::Function:
        for (const SourceAssignment& assignment : SplitAssignments(source))
            found.push_back({assignment.value, ExprMode::Condition, false, false, false});
        break;
    case SourceKind::None:
        break;
    }
    return found;
}

ExpressionDesk::ExpressionDesk(DbConnection& connection, DatabaseLocation database, YesNoWords words)
    : source_(
          connection, std::move(database), quiet_, std::move(words),
          [this](QStringView name) { return TextOfControl(name); }, &QDateTime::currentDateTime)
{
}

void ExpressionDesk::Open(const QString& table)
{
    if (source_.IsOpen() && table_ == table)
        return;
    Close();
    table_ = table;
    if (!table.isEmpty() && source_.Result().Open(u"SELECT * FROM "_s + FieldReference(table)))
        record_ = source_.Result().Position();
}

void ExpressionDesk::Close()
{
    source_.Result().Close();
    record_ = -1;
}

void ExpressionDesk::GoTo(qint64 record)
{
    if (!source_.IsOpen() || record < 0)
        return;
    source_.Result().TakeUpChanges();
    if (source_.Result().MoveTo(record))
        record_ = source_.Result().Position();
}

// The texts that the named controls would show on the current record; what they name first.
void ExpressionDesk::CollectTexts(const ExprNode& tree, const FormDef& form, QStringList visited)
{
    QStringList names;
    CollectControlNames(tree, names);
    for (const QString& name : names) {
        const ControlDef* control = InputOf(form, name);
        if (!control || visited.contains(name) || visited.size() > kDeepestReference ||
            texts_.contains(name.trimmed()))
            continue;
        ControlBinding binding = BindControl(*control);
        if (!binding.tree) {
            texts_[name.trimmed()] = control->defaultValue.Text();
            continue;
        }
        CollectTexts(*binding.tree, form, visited + QStringList(name));
        const bool ticks = Has(control->type, IsTicked);
        texts_[name.trimmed()] = ticks ? QString(HoldsOnRecord(*binding.tree, source_.Context()) ? u'1' : u'0')
                                       : TextOnRecord(*binding.tree, source_.Context());
    }
}

DeskAnswer ExpressionDesk::Evaluate(const DeskQuestion& question, const FormDef& form)
{
    DeskAnswer answer;
    ControlDef control;
    control.type = question.ticks ? ControlType::CheckBox : ControlType::EditBox;
    control.hasSource = 1;
    control.sourceScope = question.overAll ? SourceScope::WholeResult : SourceScope::Record;
    control.SetSource(question.text);
    ControlBinding binding = BindControl(control);
    if (question.mode == ExprMode::Value) {
        binding.tree = ParseExpression(question.text, ExprMode::Value);
        binding.aggregates.clear();
    }
    if (!binding.tree)
        return answer;
    answer.meaning = ExpressionInWords(*binding.tree);
    if (!source_.IsOpen()) {
        answer.state = DeskAnswer::State::NoResult;
        return answer;
    }
    texts_.clear();
    CollectTexts(*binding.tree, form, {});
    if (binding.wholeResult)
        (void)ComputeAggregates(source_.Records(), source_.Context(), quiet_, std::span(&binding, 1));
    else if (record_ < 0) {
        answer.state = DeskAnswer::State::NoRecord;
        return answer;
    }
    answer.value = question.ticks ? QString(HoldsOnRecord(*binding.tree, source_.Context()) ? u'1' : u'0')
                                  : TextOnRecord(*binding.tree, source_.Context());
    // A condition that is null does not hold, and that is all a box shows of it.
    const bool isNull = !question.ticks && (binding.tree->null || binding.tree->suppressed);
    answer.state = isNull ? DeskAnswer::State::Null : DeskAnswer::State::Value;
    return answer;
}

DeskAnswer ExpressionDesk::Read(const DeskQuestion& question, const FormDef& form)
{
    DeskAnswer answer = Evaluate(question, form);
    if (answer.state == DeskAnswer::State::Nothing && question.text.trimmed().isEmpty())
        return answer;
    const ExprTree tree = ParseExpression(question.text, question.mode);
    for (const ExprSlip& slip : ExplainExpression(question.text, question.mode, source_.Context())) {
        if (slip.reason == Str::ExplainAggregate) {
            if (question.isColumn)
                answer.losses += StringText(Str::DeskColumnAggregate, {slip.arguments.value(0)});
            else if (!question.overAll)
                answer.losses += StringText(Str::DeskNoAggregateHere, {slip.arguments.value(0)});
        } else if (DependsOnRecord(slip)) {
            // Over all records nulls are left out; which one of them is current says nothing.
            if (!question.overAll && answer.state == DeskAnswer::State::Null)
                answer.reasons += slip.Text();
        } else if (slip.reason != Str::ExplainUnknownName || source_.IsOpen()) {
            // A check box's Yes/No field compares as a number, see CompareYesNoAsNumber.
            if (!(question.ticks && slip.reason == Str::ExplainYesNoAndNumber))
                answer.losses += slip.Text();
        }
    }
    QStringList names;
    if (tree)
        CollectControlNames(*tree, names);
    for (const QString& name : names) {
        if (!InputOf(form, name))
            answer.losses += StringText(Str::DeskUnknownControl, {name});
    }
    return answer;
}

QString ExpressionDesk::ValueOn(qint64 record, const DeskQuestion& question, const FormDef& form)
{
    if (!source_.IsOpen() || record < 0 || record >= source_.Count())
        return {};
    const qint64 here = record_;
    GoTo(record);
    const QString value = Evaluate(question, form).value;
    GoTo(here);
    return value;
}

// --- the whole form -----------------------------------------------------------------------------------------

void ExpressionDesk::AddLosses(const ControlDef& control, const DeskQuestion& question, const FormDef& form,
                               QStringList& all)
{
    for (const QString& loss : Read(question, form).losses)
        all += Listed(control, loss);
}

void ExpressionDesk::AddAssignmentLosses(const ControlDef& control, const FormDef& form, QStringList& all)
{
    const bool isOnTable = control.buttonFunction == ButtonFunction::Update ||
                           control.buttonFunction == ButtonFunction::UpdateAll ||
                           control.buttonFunction == ButtonFunction::Insert;
    if (!isOnTable || !source_.IsOpen())
        return;
    for (const SourceAssignment& assignment : SplitAssignments(control.source.Text())) {
        const TargetName target = SplitTarget(assignment.target);
        const bool isOther =
            !target.table.isEmpty() && target.table.compare(form.tableName.Text(), Qt::CaseInsensitive) != 0;
        const std::span<const ResultField> fields = source_.Records().Fields();
        if (!isOther && std::ranges::none_of(fields, [&target](const ResultField& field) {
                return field.name.compare(target.field, Qt::CaseInsensitive) == 0;
            }))
            all += Listed(control, StringText(Str::DeskNoSuchTarget, {target.field}));
    }
}

QStringList ExpressionDesk::LossesOf(const FormDef& form)
{
    Open(form.tableName.Text());
    quiet_.SetPatience(0); // what sums come to tells nothing here
    QStringList all;
    for (const ControlDef& control : form.controls) {
        for (const DeskQuestion& question : ExpressionsOf(control)) {
            if (!question.text.trimmed().isEmpty())
                AddLosses(control, question, form, all);
        }
        if (Has(control.type, IsPressed))
            AddAssignmentLosses(control, form, all);
    }
    for (const QString& circle : CirclesOf(form))
        all += StringText(Str::DeskCircle, {circle});
    quiet_.SetPatience(QuietPrompt::kUsualPatienceMs);
    return all;
}

// --- circles ------------------------------------------------------------------------------------------------

namespace {

// Goes from control to control along their references; a control that is met again on the way closes a circle.
class CircleFinder {
public:
    explicit CircleFinder(const FormDef& form)
    {
        for (const ControlDef& control : form.controls) {
            const QString name = control.name.Text().trimmed();
            if (Has(control.type, HoldsValue) && !references_.contains(name)) {
                order_ += name;
                references_[name] = NamesIn(control);
            }
        }
        for (const QString& name : order_)
            Follow(name);
    }

    QStringList Take() { return std::move(circles_); }

private:
    void Follow(const QString& name)
    {
        if (done_.contains(name))
            return;
        if (const qsizetype met = way_.indexOf(name); met >= 0) {
            circles_ += (way_.sliced(met) << name).join(u" → "_s);
            return;
        }
        way_ += name;
        for (const QString& next : references_.value(name)) {
            if (references_.contains(next.trimmed()))
                Follow(next.trimmed());
        }
        way_.removeLast();
        done_ += name;
    }

    QStringList order_;
    QHash<QString, QStringList> references_;
    QStringList way_;
    QStringList done_;
    QStringList circles_;
};

} // namespace

QStringList CirclesOf(const FormDef& form)
{
    return CircleFinder(form).Take();
}

} // namespace mirel
