#include "cli/cell_text.h"
#include "cli/commands.h"
#include "cli/json_writer.h"
#include "cli/run.h"
#include "data/provider_error.h"
#include "expr/explain.h"
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
            records_, Settings(Profile(run_.Folder().ProfileFile())).Words(),
            [this](QStringView name) { return controls_.value(name.toString()); }, &QDateTime::currentDateTime);
        if (!run_.Args().Has(Opt::All))
            WriteValue(context);
        else if (!records_.IsEof() && !WriteAll(context))
            return false;
        if (run_.Args().Has(Opt::Timing) && evaluations_ > 0)
            run_.Times().nsPerEval = double(evaluationNs_) / double(evaluations_);
        return true;
    }

private:
    bool WriteAll(FormContext& whole)
    {
        RowContext context(whole, tree_ && AsksForCount(*tree_) ? records_.RecordCount() : -1);
        if (tree_)
            context.Collect(*tree_);
        ReadRange range{.fields = context.Columns()};
        if (range.fields.empty())
            range.fields = {0}; // none would be all of them
        qint64 position = 0;
        const bool read = records_.Read(range, [&](std::span<const Cell> cells) {
            context.Lend(position++, cells);
            WriteValue(context);
            return !run_.Out().HasFailed() && !WasInterrupted();
        });
        return read ? !run_.Out().HasFailed() && !WasInterrupted() : Report();
    }

    // Counting takes a walk of its own.
    static bool AsksForCount(const ExprNode& node)
    {
        constexpr std::array<QStringView, 3> kCounts = {u"RECCOUNT", u"COUNT", u"SEEKTOTAL"};
        const bool isCount = std::ranges::any_of(
            kCounts, [&node](QStringView name) { return int(node.code) == FindFunction(name)->code; });
        return isCount || std::ranges::any_of(node.args, [](const ExprTree& argument) {
                   return argument && AsksForCount(*argument);
               });
    }

    bool Report()
    {
        ReportProviderError(run_.Prompt(), &records_, records_.LastResult());
        return false;
    }

    // The first record is current unless --record names another. A result without records has none to name.
    bool OpenSource()
    {
        if (!run_.OpenDatabase(run_.Args().Text(Opt::Database)))
            return false;
        const QString source = run_.Args().Text(Opt::Source);
        if (!records_.Open(source, run_.Session().Path(), CursorType::Static, LockType::ReadOnly))
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
        if (tree_ && run_.Args().Has(Opt::Timing))
            Measure(context);
        std::vector<ExprSlip> slips;
        if (run_.Args().Has(Opt::Explain))
            slips = ExplainExpression(run_.Argument(0), mode_, context);
        if (run_.Args().Text(Opt::Format) == u"json") {
            WriteJson(holds, slips);
            return;
        }
        run_.Out().WriteLine(tree_ ? ShownText(*tree_) : QString());
        for (const ExprSlip& slip : slips)
            run_.Out().WriteLine(slip.Text());
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
        if (run_.Args().Has(Opt::Explain))
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
