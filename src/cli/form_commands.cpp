#include "cli/cell_text.h"
#include "cli/commands.h"
#include "cli/form_json.h"
#include "cli/form_json_reader.h"
#include "cli/run.h"
#include "forms/default_form.h"
#include "forms/form_file.h"
#include "platform/shared_file.h"
#include "platform/system_reason.h"
#include "resources/string_table.h"

#include <QFile>
#include <QFileInfo>

#include <array>

namespace mirel::cli {
namespace {

using namespace Qt::StringLiterals;

// The forms of the database that the first argument names; null, and the reason told, when there is no place for
// them or the database does not open.
FormStore* OpenStore(Run& run)
{
    if (!run.OpenDatabase())
        return nullptr;
    if (!run.Session().Store().Path().isEmpty())
        return &run.Session().Store();
    run.Prompt().Show({Str::StoreMissing, {}});
    return nullptr;
}

const FormDef* FindForm(Run& run, const FormStore& store, const QString& name)
{
    const FormDef* form = store.FindForm(name);
    if (!form)
        run.Prompt().Show({Str::NoSuchForm, {name}});
    return form;
}

// Whether the change was made and saved; a change that refused has told why itself.
bool Apply(Run& run, FormStore& store, const std::function<bool(FormStore&)>& change)
{
    if (store.Apply(change))
        return true;
    if (!store.LastError().isEmpty())
        run.Prompt().ShowError(store.LastError());
    return false;
}

bool IsDatabase(const QString& path)
{
    QFile file(path);
    const QByteArray kMark = QByteArrayLiteral("SQLite format 3");
    // What is not there, and what is empty, is for the database to judge.
    return !file.open(QIODevice::ReadOnly) || file.size() == 0 || file.peek(kMark.size()) == kMark;
}

} // namespace

ExitStatus RunFormsList(Run& run)
{
    const FormStore* store = OpenStore(run);
    if (!store)
        return ExitStatus::Failed;
    const std::array columns = {ResultField{u"name"_s, FieldType::Text, kMaxTextSize, {}, {}},
                                ResultField{u"table"_s, FieldType::Text, kMaxTextSize, {}, {}},
                                ResultField{u"controls"_s, FieldType::Integer, 4, {}, {}}};
    const std::unique_ptr<RecordWriter> writer = run.MakeWriter();
    writer->Begin(columns);
    for (const FormDef& form : store->Forms()) {
        const std::array texts = {form.name.Text().toUtf8(), form.tableName.Text().toUtf8()};
        const std::array cells = {Cell::OfText(View(texts[0])), Cell::OfText(View(texts[1])),
                                  Cell::Of(qint64(form.controls.size()))};
        if (!writer->Record(cells))
            return ExitStatus::Failed;
        ++run.Times().rows;
    }
    writer->End();
    return ExitStatus::Done;
}

ExitStatus RunFormsDefault(Run& run)
{
    FormStore* store = OpenStore(run);
    if (!store)
        return ExitStatus::Failed;
    std::optional<FormDef> form =
        DefaultFormOf(run.Connection(), run.Session().Location(), run.Argument(1), run.Prompt());
    if (!form)
        return ExitStatus::Failed;
    const bool stored = Apply(run, *store, [&form](FormStore& forms) {
        form->SetName(FreeFormName(forms, form->name.Text()));
        forms.AddForm(*form);
        return true;
    });
    if (!stored)
        return ExitStatus::Failed;
    run.Out().WriteLine(form->name.Text());
    return ExitStatus::Done;
}

ExitStatus RunFormsDump(Run& run)
{
    const QString path = run.PathArgument(0);
    if (IsDatabase(path)) {
        const FormStore* store = OpenStore(run);
        if (store)
            WriteStoreJson(run.Out(), *store);
        return store ? ExitStatus::Done : ExitStatus::Failed;
    }
    FormStore file(path);
    if (!file.Load()) {
        run.Prompt().ShowError(file.LastError());
        return ExitStatus::Failed;
    }
    WriteStoreJson(run.Out(), file);
    return ExitStatus::Done;
}

ExitStatus RunFormsExport(Run& run)
{
    const FormStore* store = OpenStore(run);
    const FormDef* form = store ? FindForm(run, *store, run.Argument(1)) : nullptr;
    if (!form)
        return ExitStatus::Failed;
    const QString path = run.PathArgument(2);
    if (QFileInfo::exists(path) && !run.Args().Has(Opt::Yes)) {
        run.Prompt().Show({Str::CliFileExists, {path}});
        return ExitStatus::BadArguments;
    }
    if (IsSameFile(path, run.Session().Location().FilePath()) || IsSameFile(path, store->Path())) {
        run.Prompt().Show({Str::FileCreationFail, {path}});
        return ExitStatus::Failed;
    }
    QString error;
    if (ExportForm(*form, path, error))
        return ExitStatus::Done;
    run.Prompt().ShowError(error);
    return ExitStatus::Failed;
}

ExitStatus RunFormsImport(Run& run)
{
    FormStore* store = OpenStore(run);
    if (!store)
        return ExitStatus::Failed;
    QString error;
    std::optional<FormDef> form = ImportForm(run.PathArgument(1), error);
    if (!form) {
        run.Prompt().ShowError(error);
        return ExitStatus::Failed;
    }
    if (run.Args().Has(Opt::Name))
        form->SetName(run.Args().Text(Opt::Name));
    if (form->name.Text().trimmed().isEmpty()) {
        run.Prompt().Show({Str::CliFormWithoutName, {}});
        return ExitStatus::Failed;
    }
    const bool stored = Apply(run, *store, [&](FormStore& forms) {
        const bool isFree = !forms.FindForm(form->name.Text());
        if (isFree)
            forms.AddForm(*form);
        else
            run.Prompt().Show({Str::FormNameTaken, {form->name.Text()}});
        return isFree;
    });
    return stored ? ExitStatus::Done : ExitStatus::Failed;
}

ExitStatus RunFormsEdit(Run& run)
{
    FormStore* store = OpenStore(run);
    if (!store)
        return ExitStatus::Failed;
    QFile file(run.PathArgument(2));
    if (!file.open(QIODevice::ReadOnly)) {
        run.Prompt().Show({Str::CliFormFileUnreadable, {run.Argument(2), SystemReason(file)}});
        return ExitStatus::Failed;
    }
    UserMessage fault;
    const std::optional<FormDef> form = ReadFormJson(file.readAll(), fault);
    if (!form) {
        run.Prompt().Show(fault);
        return ExitStatus::Failed;
    }
    const QString name = run.Argument(1);
    const QString newName = form->name.Text();
    if (newName.trimmed().isEmpty()) {
        run.Prompt().Show({Str::CliFormWithoutName, {}});
        return ExitStatus::Failed;
    }
    const bool stored = Apply(run, *store, [&](FormStore& forms) {
        if (!FindForm(run, forms, name))
            return false;
        if (newName != name && forms.FindForm(newName)) {
            run.Prompt().Show({Str::FormNameTaken, {newName}});
            return false;
        }
        *forms.FindForm(name) = *form;
        return true;
    });
    return stored ? ExitStatus::Done : ExitStatus::Failed;
}

ExitStatus RunFormsDelete(Run& run)
{
    FormStore* store = OpenStore(run);
    if (!store)
        return ExitStatus::Failed;
    const QString name = run.Argument(1);
    const bool deleted =
        Apply(run, *store, [&](FormStore& forms) { return FindForm(run, forms, name) && forms.RemoveForm(name); });
    return deleted ? ExitStatus::Done : ExitStatus::Failed;
}

} // namespace mirel::cli
