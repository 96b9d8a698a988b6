#include "csvimport/csv_import.h"

#include "csvimport/csv_reader.h"
#include "csvimport/import_check.h"
#include "csvimport/import_lines.h"
#include "csvimport/import_target.h"
#include "csvimport/reader_fault.h"
#include "csvimport/skipped_lines.h"
#include "csvimport/type_guess.h"
#include "platform/system_reason.h"
#include "resources/string_table.h"

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// Between two looks at the progress display, whichever comes first: lines may be long.
constexpr qint64 kLinesPerProgress = 1024;
constexpr qint64 kBytesPerProgress = 4 << 20;

// A failure of the reader outside of a run, with its line.
bool TellFault(const CsvReader& reader, const QIODevice& file, UserPrompt& prompt)
{
    prompt.Show({Str::ImportFailedOnLine,
                 {MessageOfFault(reader, file).Text(), QString::number(reader.Line()), QString::number(0)}});
    return false;
}

// One import under way: hands the file's lines to the table, and names the place of a failure.
class ImportRun {
public:
    ImportRun(ImportTarget& target, QIODevice& file, const ImportPlan& plan, UserPrompt& prompt,
              ImportReport& report)
        : target_(target)
        , size_(file.size())
        , plan_(plan)
        , prompt_(prompt)
        , report_(report)
        , lines_(file, plan, target.Fields())
    {
    }

    // False when a line ended the run, which was told.
    bool PutAll()
    {
        const std::unique_ptr<Progress> progress = prompt_.StartProgress({Str::ImportProgress, {}}, size_);
        qint64 shownBytes = 0;
        for (qint64 lines = 1;; ++lines) {
            const qint64 bytes = lines_.BytesConsumed();
            if (lines % kLinesPerProgress == 0 || bytes - shownBytes >= kBytesPerProgress) {
                shownBytes = bytes;
                if (!progress->Advance(bytes)) {
                    report_.stopped = true;
                    return true;
                }
            }
            switch (lines_.Next()) {
            case ImportLines::Result::End:
                return true;
            case ImportLines::Result::Failed:
                if (!Skip())
                    return false;
                break;
            case ImportLines::Result::Record:
                if (!Put())
                    return false;
                break;
            }
        }
    }

    // The file of skipped lines is whole before the records are: none is in neither.
    bool Finish()
    {
        lines_.CountWhatWasCut(report_);
        if (!skipped_ || skipped_->Commit()) {
            report_.skipped = skipped_ ? skipped_->Count() : 0;
            return true;
        }
        prompt_.Show({Str::FileWriteFail, {plan_.skipTo, skipped_->ErrorText()}});
        return false;
    }

private:
    bool Put()
    {
        switch (target_.Put(lines_.Cells(), lines_.Line())) {
        case ImportTarget::Taken::Added:
            ++report_.records;
            return true;
        case ImportTarget::Taken::Updated:
            ++report_.updated;
            return true;
        case ImportTarget::Taken::Superseded:
            return true;
        case ImportTarget::Taken::Refused:
            break;
        }
        lines_.Refuse(target_.ErrorText(), target_.RefusedField());
        return Skip();
    }

    bool Skip()
    {
        const LineFailure failure = lines_.Failure();
        if (plan_.skipTo.isEmpty() || !lines_.StepOver())
            return Tell(failure);
        if (!skipped_)
            skipped_.emplace(plan_.skipTo, lines_.ByteOrderMark());
        if (skipped_->Add(lines_.RawLine()))
            return true;
        prompt_.Show({Str::FileWriteFail, {plan_.skipTo, skipped_->ErrorText()}});
        return Tell(failure);
    }

    bool Tell(const LineFailure& failure)
    {
        const QString line = QString::number(failure.line);
        const QString records = QString::number(report_.records + report_.updated);
        if (failure.column < 0 || size_t(failure.column) >= plan_.columns.size())
            prompt_.ShowError(StringText(Str::ImportFailedOnLine, {failure.why, line, records}));
        else
            prompt_.ShowError(
                StringText(Str::ImportFailedAt, {failure.why, line, QString::number(failure.column + 1),
                                                 NameOfColumn(size_t(failure.column)), records}));
        return false;
    }

    QString NameOfColumn(size_t column) const
    {
        return plan_.columns[column].ignored ? u"-"_s : plan_.columns[column].field;
    }

    ImportTarget& target_;
    qint64 size_;
    const ImportPlan& plan_;
    UserPrompt& prompt_;
    ImportReport& report_;
    ImportLines lines_;
    std::optional<SkippedLines> skipped_;
};

// Takes the file's lines into the target's keys. False when nothing is to be written, which was told or is in the
// report.
bool CountKeys(KeyedTarget& target, QIODevice& file, const ImportPlan& plan, UserPrompt& prompt,
               ImportReport& report, const std::optional<KeyCounts>& confirmed)
{
    using OnFailure = ImportCheck::OnFailure;
    ImportCheck check(file, plan, target.Fields(), &target.Keys(),
                      plan.skipTo.isEmpty() ? OnFailure::Stop : OnFailure::GoOn);
    {
        const std::unique_ptr<Progress> progress =
            prompt.StartProgress({Str::ImportScanProgress, {}}, file.size());
        while (check.Step(kLinesPerProgress)) {
            if (!progress->Advance(check.BytesConsumed())) {
                report.stopped = true;
                return false;
            }
        }
    }
    if (check.LineOfSeveral() > 0) {
        prompt.Show({Str::ImportKeyOfSeveral, {QString::number(check.LineOfSeveral())}});
        return false;
    }
    report.otherCounts = confirmed && *confirmed != target.Keys().Counts();
    if (report.otherCounts)
        return false;
    if (file.seek(0))
        return true;
    prompt.Show({Str::ImportCannotRead, {SystemReason(file)}});
    return false;
}

} // namespace

UserMessage ImportReport::Count() const
{
    const QString added = QString::number(records);
    const QString changed = QString::number(updated);
    if (keyed && skips)
        return {Str::RecordsImportedUpdatedSkipped, {added, changed, QString::number(skipped)}};
    if (keyed)
        return {Str::RecordsImportedUpdated, {added, changed}};
    if (skips)
        return {Str::RecordsImportedSkipped, {added, QString::number(skipped)}};
    return {Str::RecordsImported, {added}};
}

std::vector<UserMessage> ImportReport::Warnings() const
{
    std::vector<UserMessage> warnings;
    if (cutTexts > 0)
        warnings.push_back(
            {Str::ImportTextsCut, {QString::number(cutTexts), QString::number(CellReader::kMaxTextUnits)}});
    if (cutNumbers > 0)
        warnings.push_back({Str::ImportNumbersCut, {QString::number(cutNumbers)}});
    return warnings;
}

bool ReadFirstLine(QIODevice& file, const CsvFormat& format, QStringList& texts, UserPrompt& prompt)
{
    CsvReader reader(file, format);
    const CsvReader::Result result = reader.Next();
    if (result == CsvReader::Result::Fault)
        return TellFault(reader, file, prompt);
    texts = TextsOf(reader.Texts());
    return true;
}

bool GuessColumns(QIODevice& file, const CsvFormat& format, ImportColumns& columns, UserPrompt& prompt)
{
    const std::unique_ptr<Progress> progress = prompt.StartProgress({Str::ImportScanProgress, {}}, file.size());
    CsvReader reader(file, format);
    CsvReader::Result result = reader.Next();
    const QStringList first = result == CsvReader::Result::Record ? TextsOf(reader.Texts()) : QStringList();
    std::vector<TypeGuess> guesses(size_t(first.size()), TypeGuess(format.dates, format.decimal));
    if (result == CsvReader::Result::Record && format.namesInFirstLine)
        result = reader.Next(int(std::max<size_t>(guesses.size(), 1)));
    for (qint64 lines = 1; result == CsvReader::Result::Record; ++lines) {
        const std::span<const std::string_view> texts = reader.Texts();
        for (size_t i = 0; i < std::min(texts.size(), guesses.size()); ++i)
            guesses[i].Add(texts[i]);
        if (lines % kLinesPerProgress == 0 && !progress->Advance(reader.BytesConsumed()))
            return false;
        result = reader.Next(int(std::max<size_t>(guesses.size(), 1)));
    }
    if (result == CsvReader::Result::Fault)
        return TellFault(reader, file, prompt);

    columns = format.namesInFirstLine ? ColumnsNamed(first) : NumberedColumns(int(first.size()));
    for (size_t i = 0; i < columns.size(); ++i) {
        const QString name = columns[i].field;
        columns[i] = guesses[i].Column();
        columns[i].field = name;
    }
    return true;
}

bool ImportCsv(DbConnection& connection, const DatabaseLocation& database, QIODevice& file, const ImportPlan& plan,
               UserPrompt& prompt, ImportReport& report, const std::optional<KeyCounts>& confirmed)
{
    report = {.keyed = !plan.key.isEmpty(), .skips = !plan.skipTo.isEmpty()};
    QString fault;
    std::unique_ptr<ImportTarget> target;
    if (report.keyed) {
        std::unique_ptr<KeyedTarget> keyed = KeyedTarget::Open(connection, database, plan, fault);
        if (keyed && !CountKeys(*keyed, file, plan, prompt, report, confirmed))
            return false;
        target = std::move(keyed);
    } else {
        target = AppendTarget::Open(connection, database, plan, fault);
    }
    if (!target) {
        prompt.ShowError(fault);
        return false;
    }
    ImportRun run(*target, file, plan, prompt, report);
    const bool complete = run.PutAll();
    if (!run.Finish()) {
        report.records = report.updated = 0;
        return false;
    }
    if (!Failed(target->Commit()))
        return complete;
    prompt.ShowError(target->ErrorText());
    report = {};
    return false;
}

} // namespace mirel
