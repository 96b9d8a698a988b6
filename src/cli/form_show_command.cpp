#include "app/form_view_options.h"
#include "cli/cell_text.h"
#include "cli/commands.h"
#include "cli/form_json.h"
#include "cli/run.h"
#include "forms/running_form.h"
#include "resources/string_table.h"

#include <algorithm>
#include <array>

namespace mirel::cli {
namespace {

using namespace Qt::StringLiterals;

// The forms that run one above the other: CALL FORM puts one on top, closing one takes it away.
class FormRun : public FormHost {
public:
    explicit FormRun(Run& run)
        : run_(run)
    {
    }

    bool Start(const FormCall& call)
    {
        Push(call);
        return forms_.back()->Open();
    }

    bool Carry(const Arguments::Given& given)
    {
        if (given.option != Opt::Set && given.option != Opt::Press)
            return true;
        if (forms_.empty()) {
            run_.Prompt().Show({Str::CliNoFormRuns, {}});
            return false;
        }
        return given.option == Opt::Set ? Set(given.value) : Press(given.value);
    }

    // The form on top, or the one that was closed last.
    RunningForm& Shown() { return forms_.empty() ? *closed_.back() : *forms_.back(); }

    void CallForm(const FormCall& call) override
    {
        caller_ = forms_.size() - 1;
        Push(call);
        opened_ = forms_.back()->Open();
    }
    void CloseForm() override
    {
        const auto form = forms_.begin() + std::ptrdiff_t(caller_.value_or(forms_.size() - 1));
        closed_.push_back(std::move(*form)); // it is on the way out of one of its calls: it goes at the end
        forms_.erase(form);
    }
    void DataChanged() override {}

private:
    void Push(const FormCall& call)
    {
        const Settings settings(run_.Folder().OpenProfile());
        forms_.push_back(std::make_unique<RunningForm>(call, FormEnvironment{run_.Connection(),
                                                                             run_.Session().Location(),
                                                                             run_.Session().Store(),
                                                                             run_.Prompt(),
                                                                             *this,
                                                                             ReadFormViewSettings(settings),
                                                                             {}}));
    }

    bool Set(const QString& pair)
    {
        const qsizetype equals = pair.indexOf(u'=');
        const QString name = pair.left(equals);
        const int control = forms_.back()->FindControl(name);
        if (control < 0) {
            run_.Prompt().Show({Str::NoSuchControl, {name}});
            return false;
        }
        if (SetControl(control, pair.mid(equals + 1)))
            return true;
        run_.Prompt().Show({Str::CliCannotSet, {pair.mid(equals + 1), name}});
        return false;
    }

    bool SetControl(int index, const QString& text)
    {
        RunningForm& form = *forms_.back();
        const YesNoWords& words = form.Settings().words;
        const ControlType type = form.Controls()[size_t(index)].type;
        if (Has(type, ShowsText)) {
            form.SetText(index, text);
            return true;
        }
        if (Has(type, IsTicked)) {
            form.SetTicked(index, text == u"1" || text == words.yes);
            return text == u"1" || text == u"0" || text == words.yes || text == words.no;
        }
        if (Has(type, HasRows)) // a row, from 1
            return form.SelectListRow(index, text.toLongLong() - 1) != RunningForm::Outcome::Failed;
        return false;
    }

    bool Press(const QString& name)
    {
        RunningForm& form = *forms_.back();
        const auto controls = form.Controls();
        const auto button = std::ranges::find_if(controls, [&name](const ControlRun& control) {
            return Has(control.type, IsPressed) && control.name == name;
        });
        if (button == controls.end()) {
            run_.Prompt().Show({Str::NoSuchButton, {name}});
            return false;
        }
        opened_ = true;
        caller_.reset();
        const bool failed = form.PressButton(int(button - controls.begin())) == RunningForm::Outcome::Failed;
        caller_.reset();
        if (failed && form.WhyPressFailed().isEmpty())
            run_.Prompt().Show({Str::PressFailed, {name}});
        else if (failed)
            run_.Prompt().ShowError(form.WhyPressFailed());
        return !failed && opened_;
    }

    Run& run_;
    std::vector<std::unique_ptr<RunningForm>> forms_;
    std::vector<std::unique_ptr<RunningForm>> closed_;
    std::optional<size_t> caller_; // which form's button called another one
    bool opened_ = true;           // the called form's result
};

// What is wrong with the options; empty when nothing is.
QString FaultOf(const Arguments& arguments)
{
    for (const Arguments::Given& given : arguments.options) {
        if (given.option == Opt::Set && given.value.indexOf(u'=') < 1)
            return StringText(Str::CliSetWithoutValue, {given.value});
    }
    return {};
}

void WriteTable(Run& run, RunningForm& form)
{
    const std::array columns = {ResultField{u"name"_s, FieldType::Text, kMaxTextSize, {}, {}},
                                ResultField{u"type"_s, FieldType::Integer, 4, {}, {}},
                                ResultField{u"text"_s, FieldType::Memo, -1, {}, {}}};
    const std::unique_ptr<RecordWriter> writer = run.MakeWriter();
    writer->Begin(columns);
    for (size_t i = 0; i < form.Controls().size(); ++i) {
        const ControlRun& control = form.Controls()[i];
        const std::array texts = {control.name.toUtf8(), form.ShownText(int(i)).toUtf8()};
        const std::array cells = {Cell::OfText(View(texts[0])), Cell::Of(qint64(control.type)),
                                  Cell::OfText(View(texts[1]))};
        if (!writer->Record(cells))
            return;
    }
    writer->End();
    run.Out().WriteLine(u"record %1"_s.arg(form.CurrentRecord() + 1));
    run.Out().WriteLine(u"records %1"_s.arg(form.RecordCount()));
}

bool RunForms(Run& run, FormRun& forms, const FormDef& form)
{
    const Arguments& args = run.Args();
    FormCall call{form, args.Text(Opt::Query), args.Count(Opt::Record, 0) - 1};
    if (!forms.Start(call))
        return false;
    if (args.Has(Opt::Record) && forms.Shown().CurrentRecord() != call.record) {
        run.Prompt().Show({Str::CliNoSuchRecord, {QString::number(call.record + 1)}});
        return false;
    }
    return std::ranges::all_of(args.options,
                               [&forms](const Arguments::Given& given) { return forms.Carry(given); });
}

} // namespace

ExitStatus RunFormsShow(Run& run)
{
    if (const QString fault = FaultOf(run.Args()); !fault.isEmpty())
        return run.Refuse(fault);
    if (!run.OpenDatabase())
        return ExitStatus::Failed;
    const FormDef* form = run.Session().Store().FindForm(run.Argument(1));
    if (!form) {
        const bool noStore = run.Session().Store().Path().isEmpty();
        run.Prompt().Show(noStore ? UserMessage{Str::StoreMissing, {}}
                                  : UserMessage{Str::NoSuchForm, {run.Argument(1)}});
        return ExitStatus::Failed;
    }
    FormRun forms(run);
    if (!RunForms(run, forms, *form))
        return ExitStatus::Failed;
    if (run.Args().Text(Opt::Format) == u"json")
        WriteRunningFormJson(run.Out(), forms.Shown());
    else
        WriteTable(run, forms.Shown());
    run.Times().rows = forms.Shown().RecordCount();
    return ExitStatus::Done;
}

} // namespace mirel::cli
