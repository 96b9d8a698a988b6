#include "forms/design/form_maker.h"

#include "data/catalog.h"
#include "data/db_recordset.h"
#include "forms/default_form.h"
#include "forms/design/new_controls.h"
#include "forms/design/quiet_prompt.h"
#include "forms/form_file.h"
#include "platform/shared_file.h"
#include "resources/string_table.h"

#include <QFileInfo>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qsizetype kMostLossesShown = 6;

} // namespace

FormMaker::FormMaker(FormDef form, Start start, MakerSurroundings surroundings)
    : design_(form)
    , surroundings_(surroundings)
{
    if (start == Start::Stored) {
        storedName_ = form.name.Text();
        stored_ = std::move(form);
    } else {
        design_.MarkUnsaved();
    }
}

bool FormMaker::Tell(Str message, const QStringList& arguments)
{
    surroundings_.prompt.Show({message, arguments});
    return false;
}

// --- the form's table ---------------------------------------------------------------------------------------

const std::vector<ResultField>& FormMaker::Fields()
{
    const QString table = design_.Form().tableName.Text();
    if (fields_ && fieldsTable_ == table)
        return *fields_;
    fields_.emplace();
    fieldsTable_ = table;
    DbRecordset records(surroundings_.connection);
    if (!table.isEmpty() && records.Open(u"SELECT * FROM "_s + FieldReference(table), surroundings_.database,
                                         CursorType::ForwardOnly, LockType::ReadOnly)) {
        const std::span<const ResultField> fields = records.Fields();
        fields_->assign(fields.begin(), fields.end());
    }
    return *fields_;
}

QStringList FormMaker::Tables()
{
    QuietPrompt quiet;
    QStringList tables;
    (void)Catalog(surroundings_.connection, quiet).ListTables(surroundings_.database, tables);
    return tables;
}

// --- saving -------------------------------------------------------------------------------------------------

bool FormMaker::Save()
{
    return storedName_.isEmpty() ? SaveAs() : SaveUnder(design_.Form().name.Text());
}

bool FormMaker::SaveAs()
{
    QString preset = design_.Form().name.Text();
    if (storedName_.isEmpty())
        preset = FreeFormName(surroundings_.store, preset);
    const std::optional<QString> name =
        surroundings_.prompt.AskText({Str::MakerSaveAsTitle, {}}, {Str::MakerNamePrompt, {}}, preset);
    return name && SaveUnder(name->trimmed().left(kMaxNameLength));
}

// Questions are asked while the store is not locked; then all is looked at again.
bool FormMaker::SaveUnder(const QString& name)
{
    if (name.trimmed().isEmpty())
        return Tell(Str::MakerNameEmpty);
    if (surroundings_.store.Path().isEmpty())
        return Tell(Str::MakerStoreMissing);
    if (!AcceptsLosses())
        return false;
    FormDef form;
    form.CopyFrom(design_.Form());
    form.SetName(name);
    enum class Conflict { None, Exists, Changed };
    bool mayReplace = false;
    bool mayOverwrite = false;
    for (;;) {
        Conflict conflict = Conflict::None;
        const bool saved = surroundings_.store.Apply([&](FormStore& store) {
            const bool isOwn = name == storedName_;
            FormDef* there = store.FindForm(name);
            if (there && !isOwn && !mayReplace)
                conflict = Conflict::Exists;
            else if (there && isOwn && !(*there == stored_) && !mayOverwrite)
                conflict = Conflict::Changed;
            if (conflict != Conflict::None)
                return false;
            if (there)
                *there = form;
            else
                store.AddForm(form);
            return true;
        });
        if (saved)
            break;
        if (conflict == Conflict::None) {
            surroundings_.prompt.ShowError(surroundings_.store.LastError());
            return false;
        }
        const Str question = conflict == Conflict::Exists ? Str::FormExists : Str::MakerChangedMeanwhile;
        if (!surroundings_.prompt.AskYesNo({question, {name}}))
            return false;
        (conflict == Conflict::Exists ? mayReplace : mayOverwrite) = true;
    }
    storedName_ = name;
    stored_ = form;
    if (!(design_.Form().name == form.name))
        design_.Change([&form](FormDef& own) { own.name = form.name; });
    design_.MarkSaved();
    return true;
}

bool FormMaker::AcceptsLosses()
{
    const QStringList found = losses ? losses(design_.Form()) : QStringList();
    QStringList fresh;
    for (const QString& loss : found) {
        if (!acceptedLosses_.contains(loss))
            fresh += loss;
    }
    if (fresh.isEmpty())
        return true;
    QStringList shown = fresh.first(std::min(fresh.size(), kMostLossesShown));
    if (shown.size() < fresh.size())
        shown += u"…"_s;
    if (!surroundings_.prompt.AskYesNo({Str::MakerLossesQuestion, {shown.join(u'\n')}}))
        return false;
    acceptedLosses_ += fresh;
    return true;
}

bool FormMaker::MayClose()
{
    if (!design_.IsModified())
        return true;
    switch (surroundings_.prompt.AskYesNoCancel({Str::SaveChangesQuestion, {}})) {
    case UserPrompt::Answer::Yes:
        return Save();
    case UserPrompt::Answer::No:
        return true;
    case UserPrompt::Answer::Third:
        break;
    }
    return false;
}

// --- replacing and deleting ---------------------------------------------------------------------------------

bool FormMaker::DeleteSelected()
{
    const size_t count = design_.Selection().size();
    if (count == 0)
        return false;
    const UserMessage question = count == 1 ? UserMessage{Str::DeleteControlQuestion, {}}
                                            : UserMessage{Str::MakerDeleteSeveral, {QString::number(count)}};
    if (!surroundings_.prompt.AskYesNo(question))
        return false;
    design_.DeleteSelected();
    return true;
}

bool FormMaker::DeleteAll()
{
    if (design_.Count() == 0 || !surroundings_.prompt.AskYesNo({Str::DeleteAllControlsQuestion, {}}))
        return false;
    design_.DeleteAll();
    return true;
}

bool FormMaker::MayReplace(Str question)
{
    return design_.Count() == 0 || surroundings_.prompt.AskYesNo({question, {}});
}

bool FormMaker::CreateDefaultForm()
{
    if (Fields().empty())
        return Tell(Str::MakerNoFields, {design_.Form().tableName.Text()});
    if (!MayReplace(Str::MakerDefaultQuestion))
        return false;
    const FormDef& form = design_.Form();
    design_.ReplaceBy(MakeDefaultForm(form.tableName.Text(), Fields(), form.textStyle),
                      storedName_.isEmpty() ? FormDesign::Name::Take : FormDesign::Name::Keep);
    return true;
}

bool FormMaker::LayOutAllFields()
{
    if (Fields().empty())
        return Tell(Str::MakerNoFields, {design_.Form().tableName.Text()});
    if (!MayReplace(Str::MakerLayOutQuestion))
        return false;
    const FormDef& form = design_.Form();
    design_.ReplaceBy(mirel::LayOutAllFields(form, form.tableName.Text(), Fields()), FormDesign::Name::Keep);
    return true;
}

bool FormMaker::MayImport()
{
    return MayReplace(Str::MakerImportQuestion);
}

bool FormMaker::Import(const QString& path)
{
    QString error;
    const std::optional<FormDef> form = ImportForm(path, error);
    if (!form) {
        surroundings_.prompt.ShowError(error);
        return false;
    }
    design_.ReplaceBy(*form, storedName_.isEmpty() ? FormDesign::Name::Take : FormDesign::Name::Keep);
    return true;
}

bool FormMaker::Export(const QString& path)
{
    UserPrompt& prompt = surroundings_.prompt;
    if (IsSameFile(path, surroundings_.database.FilePath()) || IsSameFile(path, surroundings_.store.Path()))
        return Tell(Str::FileCreationFail, {path});
    if (QFileInfo::exists(path) && !prompt.AskYesNo({Str::MakerFileExists, {path}}))
        return false;
    QString error;
    if (ExportForm(design_.Form(), path, error))
        return true;
    prompt.ShowError(error);
    return false;
}

} // namespace mirel
