#include "cli/cell_text.h"
#include "cli/commands.h"
#include "cli/json_writer.h"
#include "cli/run.h"
#include "data/provider_error.h"
#include "expr/explain.h"
#include "expr/expr_number.h"
#include "expr/expr_parser.h"
#include "expr/function_library.h"
#include "forms/form_context.h"
#include "resources/string_table.h"

#include <QHash>

#include <algorithm>
#include <array>
#include <charconv>

namespace mirel::cli {
namespace {

// The names of an expression's controls with their texts; empty when one of the options is no pair.
std::optional<QHash<QString, QString>> ControlsOf(const Arguments& arguments, QString& fault)
{
    QHash<QString, QString> controls;
    for (const Arguments::Given& given : arguments.options) {
        if (given.option != Opt::Control)
            continue;
        const qsizetype equals = given.value.indexOf(u'=');
        if (equals < 1) {
            fault = StringText(Str::CliControlWithoutValue, {given.value});
            return {};
        }
        controls[given.value.left(equals)] = given.value.mid(equals + 1);
    }
    return controls;
}

QString NameOf(Opt option)
{
    return QString::fromLatin1(DefinitionOf(option).name);
}

// What is wrong with the options together; empty when nothing is.
QString FaultOf(const Arguments& arguments)
{
    constexpr std::array kNeeds = {std::pair{Opt::Database, Opt::Source}, std::pair{Opt::Source, Opt::Database},
                                   std::pair{Opt::Record, Opt::Database}, std::pair{Opt::All, Opt::Database}};
    for (const auto& [option, needed] : kNeeds) {
        if (arguments.Has(option) && !arguments.Has(needed))
            return StringText(Str::CliOptionsTogether, {NameOf(option), NameOf(needed)});
    }
    if (arguments.Has(Opt::Record) && arguments.Has(Opt::All))
        return StringText(Str::CliOptionsExclude, {NameOf(Opt::Record), NameOf(Opt::All)});
    return {};
}

// One expression over the records of one result, written value by value.
class EvalRun {
public:
    EvalRun(Run& run, QHash<QString, QString> controls)
        : run_(run)
        , records_(run.Connection())
        , controls_(std::move(controls))
        , mode_(run.Args().Has(Opt::Condition) ? ExprMode::Condition : ExprMode::Value)
        , isMeasured_(run.Args().Has(Opt::Timing))
        , isExplained_(run.Args().Has(Opt::Explain))
        , asJson_(run.Args().Text(Opt::Format) == u"json")
        , onAll_(run.Args().Has(Opt::All))
        , tree_(ParseExpression(run.Argument(0), mode_))
    {
    }

    void WriteTree()
    {
        QString dump;
        DumpExpression(tree_.get(), dump);
        run_.Out().WriteLine(dump);
    }

    bool Evaluate()
    {
        if (run_.Args().Has(Opt::Database) && !OpenSource())
            return false;
        FormContext context(
            records_, run_.Words(), [this](QStringView name) { return controls_.value(name.toString()); },
            [] { return QDateTime::currentDateTime(); });
        if (onAll_ && !EvaluateAll(context))
            return false;
        if (!onAll_)
            WriteValue(context);
        if (evaluations_ > 0)
            run_.Times().nsPerEval = double(evaluationNs_) / double(evaluations_);
        return true;
    }

private:
    bool Report()
    {
        ReportProviderError(run_.Prompt(), &records_, records_.LastResult());
        return false;
    }

    // Only a static cursor counts and moves. On a whole table it also reads no more columns than are asked for;
    // of a SELECT the other one hands over the records sooner.
    CursorType CursorToUse(const QString& source)
    {
        return onAll_ && !AsksForCount() && !run_.IsTable(source) ? CursorType::ForwardOnly : CursorType::Static;
    }

    bool AsksForCount() const { return tree_ && AsksForRecordCount(*tree_); }

    // All records in one pass, without moving from one to the next.
    bool EvaluateAll(FormContext& context)
    {
        RowContext rows(context, AsksForCount() ? records_.RecordCount() : 0);
        if (tree_)
            rows.Collect(*tree_);
        ReadRange range;
        range.fields = rows.Columns();
        if (range.fields.empty())
            range.fields = {0}; // none would be all of them
        qint64 done = 0;
        bool isStopped = false;
        const bool read = records_.Read(range, [&](std::span<const Cell> cells) {
            rows.Lend(done++, cells);
            WriteValue(rows);
            isStopped = run_.Out().HasFailed() || WasInterrupted();
            return !isStopped;
        });
        return read ? !isStopped : Report();
    }

    // The first record is current unless --record names another. A result without records has none to name.
    bool OpenSource()
    {
        if (!run_.OpenDatabase(run_.Args().Text(Opt::Database)))
            return false;
        const QString source = run_.Args().Text(Opt::Source);
        const CursorType cursor = CursorToUse(source);
        if (!records_.OpenSource(run_.SourceOf(source), run_.Session().Location(), cursor, LockType::ReadOnly))
            return Report();
        if (!run_.Args().Has(Opt::Record))
            return true;
        const qint64 number = run_.Args().Count(Opt::Record, 1);
        if (number > 0 && !records_.MoveTo(number - 1))
            return Report();
        if (number > 0 && !records_.IsEof())
            return true;
        WriteMessage(StringText(Str::CliNoSuchRecord, {QString::number(number)}));
        return false;
    }

    void WriteValue(EvalContext& context)
    {
        ++run_.Times().rows;
        const bool holds = tree_ && EvaluateExpression(context, *tree_);
        if (tree_ && isMeasured_)
            Measure(context);
        std::vector<ExprSlip> slips;
        if (isExplained_)
            slips = ExplainExpression(run_.Argument(0), mode_, context);
        if (asJson_) {
            WriteJson(holds, slips);
            return;
        }
        WriteShownText();
        for (const ExprSlip& slip : slips)
            run_.Out().WriteLine(slip.Text());
    }

    // ShownText without a QString: this is what a million records spend their time on.
    void WriteShownText()
    {
        Output& out = run_.Out();
        if (tree_ && !tree_->null && !tree_->suppressed) {
            if (tree_->isText) {
                out.WriteText(TextOf(*tree_));
            } else {
                const ExprNumberChars number = NumberChars(*tree_);
                const QLatin1StringView text = number.Text();
                out.Write({text.data(), size_t(text.size())});
            }
        }
        out.Write('\n');
    }

    // The evaluation alone: the record's values were fetched by the one before.
    void Measure(EvalContext& context)
    {
        constexpr int kRepeats = 16;
        QElapsedTimer timer;
        timer.start();
        for (int i = 0; i < kRepeats; ++i)
            EvaluateExpression(context, *tree_);
        evaluationNs_ += timer.nsecsElapsed();
        evaluations_ += kRepeats;
    }

    void WriteJson(bool holds, const std::vector<ExprSlip>& slips)
    {
        Output& out = run_.Out();
        const bool isNull = !tree_ || tree_->null;
        const auto truth = [](bool value) { return value ? "true" : "false"; };
        std::array<char, 32> number;
        const auto written = std::to_chars(number.begin(), number.end(), isNull ? 0 : tree_->valueNumber);
        out.Write("{\"null\":");
        out.Write(truth(isNull));
        out.Write(",\"isText\":");
        out.Write(truth(!isNull && tree_->isText));
        out.Write(",\"text\":");
        out.Write(View(JsonText(tree_ ? ShownText(*tree_) : QString())));
        out.Write(",\"number\":");
        out.Write({number.data(), size_t(written.ptr - number.data())});
        out.Write(",\"fieldType\":");
        out.Write(View(QByteArray::number(tree_ ? int(tree_->fieldType) : 0)));
        if (tree_ && tree_->kind == NodeKind::Condition)
            out.Write(holds && !isNull ? ",\"holds\":1" : ",\"holds\":0");
        if (isExplained_)
            WriteSlips(slips);
        out.Write("}\n");
    }

    void WriteSlips(const std::vector<ExprSlip>& slips)
    {
        run_.Out().Write(",\"explanation\":[");
        for (const ExprSlip& slip : slips) {
            if (&slip != &slips.front())
                run_.Out().Write(',');
            run_.Out().Write(View(JsonText(slip.Text())));
        }
        run_.Out().Write(']');
    }

    Run& run_;
    DbRecordset records_; // stays closed without a database: then every field name is unknown
    QHash<QString, QString> controls_;
    ExprMode mode_;
    bool isMeasured_;
    bool isExplained_;
    bool asJson_;
    bool onAll_;
    ExprTree tree_;
    qint64 evaluationNs_ = 0;
    qint64 evaluations_ = 0;
};

} // namespace

ExitStatus RunEval(Run& run)
{
    QString fault = FaultOf(run.Args());
    const std::optional<QHash<QString, QString>> controls = ControlsOf(run.Args(), fault);
    if (!fault.isEmpty())
        return run.Refuse(fault);
    EvalRun eval(run, *controls);
    if (run.Args().Has(Opt::Tree)) {
        eval.WriteTree();
        return ExitStatus::Done;
    }
    return eval.Evaluate() ? ExitStatus::Done : ExitStatus::Failed;
}

} // namespace mirel::cli
