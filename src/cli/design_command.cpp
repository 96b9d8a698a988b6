#include "app/renaming.h"
#include "cli/commands.h"
#include "cli/run.h"
#include "platform/system_reason.h"
#include "resources/string_table.h"
#include "tableeditor/design_run.h"
#include "tableeditor/field_list.h"

#include <QFile>

namespace mirel::cli {
namespace {

// The command line has said what it wants: what is left to ask is answered Yes.
class Determined : public UserPrompt {
public:
    explicit Determined(UserPrompt& prompt)
        : prompt_(prompt)
    {
    }

    bool AskYesNo(const UserMessage&) override { return true; }
    void Show(const UserMessage& message) override { prompt_.Show(message); }
    void ShowError(const QString& text) override { prompt_.ShowError(text); }
    std::optional<QString> AskText(const UserMessage&, const UserMessage&, const QString&) override { return {}; }
    std::unique_ptr<Progress> StartProgress(const UserMessage& what, qint64 total) override
    {
        return prompt_.StartProgress(what, total);
    }

private:
    UserPrompt& prompt_;
};

// The fields that the list calls otherwise than the table does.
std::vector<NameChange> NewNames(const QString& table, const std::vector<FieldDesign>& fields)
{
    std::vector<NameChange> changes;
    for (const FieldDesign& field : fields) {
        if (!field.was.isEmpty() && field.was != field.name)
            changes.push_back({NameChange::What::Field, table, field.was, field.name});
    }
    return changes;
}

// One design, from the file to the table.
class DesignCommand {
public:
    explicit DesignCommand(Run& run)
        : run_(run)
        , prompt_(run.Prompt())
        , table_(run.Argument(1))
        , design_(run.Connection(), run.Session().Location(), prompt_)
    {
    }

    ExitStatus Execute()
    {
        std::vector<ListedField> list;
        QStringList tables;
        if (!ReadList(list) || !run_.Session().ListTables(tables))
            return ExitStatus::Failed;
        return tables.contains(table_, Qt::CaseInsensitive) ? Change(list) : Make(list);
    }

private:
    bool Tell(const UserMessage& message)
    {
        prompt_.Show(message);
        return false;
    }
    bool IsFaultless(const std::optional<UserMessage>& fault) { return fault ? Tell(*fault) : true; }

    bool ReadList(std::vector<ListedField>& list)
    {
        QFile file(run_.PathArgument(2));
        if (!file.open(QIODevice::ReadOnly))
            return Tell({Str::DesignFileUnreadable, {run_.Argument(2), SystemReason(file)}});
        UserMessage fault;
        std::optional<std::vector<ListedField>> read = ReadFieldList(file.readAll(), fault);
        if (!read)
            return Tell(fault);
        list = std::move(*read);
        return true;
    }

    ExitStatus Make(const std::vector<ListedField>& list)
    {
        UserMessage fault;
        const std::optional<std::vector<FieldDesign>> fields = FieldsOfList(list, nullptr, fault);
        const bool made = (fields || Tell(fault)) && IsFaultless(FaultOfTableName(table_)) &&
                          IsFaultless(FaultOfFields(*fields)) && design_.Create({table_, *fields, {}});
        return made ? ExitStatus::Done : ExitStatus::Failed;
    }

    ExitStatus Change(const std::vector<ListedField>& list)
    {
        const std::optional<TableDesign> current =
            ReadTableDesign(run_.Connection(), run_.Session().Location(), table_, prompt_);
        if (!current)
            return ExitStatus::Failed;
        UserMessage fault;
        const std::optional<std::vector<FieldDesign>> fields = FieldsOfList(list, &*current, fault);
        if (!(fields || Tell(fault)) || !IsFaultless(FaultOfFields(*fields)))
            return ExitStatus::Failed;
        const QStringList dropped = PlanDesign(*current, *fields).dropped;
        if (!dropped.isEmpty() && !run_.Args().Has(Opt::Yes))
            return run_.Refuse(StringText(Str::DesignNeedsYes, {dropped.join(QStringLiteral(", "))}));
        DesignRun::Outcome outcome = DesignRun::Outcome::Refused;
        Renaming(run_.Session())
            .RenameAndMend(NewNames(current->table, *fields), [&](const DesignRun::LastStep& last) {
                outcome = design_.Apply(*current, *fields, last);
                return outcome == DesignRun::Outcome::Done;
            });
        switch (outcome) {
        case DesignRun::Outcome::Done:
            return ExitStatus::Done;
        case DesignRun::Outcome::Stale:
            Tell({Str::DesignStale, {current->table}});
            break;
        case DesignRun::Outcome::Refused:
            break;
        }
        return ExitStatus::Failed;
    }

    Run& run_;
    Determined prompt_;
    QString table_;
    DesignRun design_;
};

} // namespace

ExitStatus RunDesign(Run& run)
{
    return run.OpenDatabase() ? DesignCommand(run).Execute() : ExitStatus::Failed;
}

} // namespace mirel::cli
