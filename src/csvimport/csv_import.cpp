#include "csvimport/csv_import.h"

#include "csvimport/type_guess.h"
#include "data/provider_error.h"
#include "resources/string_table.h"

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qint64 kLinesPerProgress = 1024;

UserMessage MessageOf(const CsvReader& reader, const QIODevice& file)
{
    switch (reader.LastFault()) {
    case CsvReader::Fault::None:
    case CsvReader::Fault::CannotRead:
        break;
    case CsvReader::Fault::NotText:
        return {Str::ImportNotText, {reader.Encoding()}};
    case CsvReader::Fault::RecordTooLong:
        return {Str::ImportRecordTooLong, {}};
    case CsvReader::Fault::QuoteNeverClosed:
        return {Str::ImportQuoteNeverClosed, {}};
    }
    return {Str::ImportCannotRead, {file.errorString()}};
}

// A failure of the reader outside of a run, with its line.
bool TellFault(const CsvReader& reader, const QIODevice& file, UserPrompt& prompt)
{
    prompt.Show({Str::ImportFailedOnLine,
                 {MessageOf(reader, file).Text(), QString::number(reader.Line()), QString::number(0)}});
    return false;
}

QString FromUtf8(std::string_view utf8)
{
    return QString::fromUtf8(utf8.data(), qsizetype(utf8.size()));
}

QStringList TextsOf(const CsvReader& reader)
{
    QStringList texts;
    for (const std::string_view text : reader.Texts())
        texts += FromUtf8(text);
    return texts;
}

// One import under way: takes lines, hands records to the provider, knows how to name the place of a failure.
class ImportRun {
public:
    ImportRun(RecordAppender& appender, QIODevice& file, const ImportPlan& plan, UserPrompt& prompt,
              ImportReport& report)
        : appender_(appender)
        , file_(file)
        , plan_(plan)
        , prompt_(prompt)
        , report_(report)
        , reader_(file, plan.format)
        , cells_(appender.Fields().size())
    {
        for (size_t i = 0; i < plan.columns.size(); ++i) {
            if (plan.columns[i].ignored)
                continue;
            const ImportColumn& column = plan.columns[i];
            const FieldType type = appender.Fields()[targets_.size()].type;
            targets_.push_back({i, CellReader(type, column.dates.value_or(plan.format.dates), plan.longTexts)});
        }
    }

    // False when a line failed, which was told.
    bool AppendAll()
    {
        const std::unique_ptr<Progress> progress = prompt_.StartProgress({Str::ImportProgress, {}}, file_.size());
        const int columns = int(plan_.columns.size());
        CsvReader::Result result = CsvReader::Result::Record;
        if (plan_.format.namesInFirstLine)
            result = reader_.Next(columns);
        for (qint64 lines = 1; result == CsvReader::Result::Record; ++lines) {
            if (lines % kLinesPerProgress == 0 && !progress->Advance(reader_.BytesConsumed())) {
                report_.stopped = true;
                return true;
            }
            result = reader_.Next(columns);
            if (result == CsvReader::Result::Record && !AppendLine())
                return false;
        }
        return result == CsvReader::Result::End || FailAt(MessageOf(reader_, file_).Text(), reader_.FaultText());
    }

    void CountWhatWasCut()
    {
        for (const Target& target : targets_) {
            report_.cutTexts += target.reader.CutTexts();
            report_.cutNumbers += target.reader.CutNumbers();
        }
    }

private:
    struct Target {
        size_t column; // of the file
        CellReader reader;
    };

    bool AppendLine()
    {
        const std::span<const std::string_view> texts = reader_.Texts();
        // An empty line is a record only where a record may be an empty line.
        if (texts.empty() && plan_.columns.size() > 1)
            return true;
        for (size_t i = 0; i < targets_.size(); ++i) {
            Target& target = targets_[i];
            cells_[i] = Cell();
            if (target.column >= texts.size())
                continue;
            const Hr read = target.reader.Read(texts[target.column], cells_[i]);
            if (Failed(read))
                return FailAt(ReadingError(target.reader.Type(), read), int(target.column));
        }
        const Hr appended = appender_.Append(cells_);
        if (!Failed(appended)) {
            ++report_.records;
            return true;
        }
        const int refused = appender_.RefusedField();
        const bool isKnown = refused >= 0 && size_t(refused) < targets_.size();
        return FailAt(ProviderErrorText(nullptr, appended, appender_.ErrorContext()),
                      isKnown ? int(targets_[size_t(refused)].column) : -1);
    }

    static QString ReadingError(FieldType type, Hr read)
    {
        return type == FieldType::Date ? StringText(Str::InvalidDateTime) : ProviderErrorText(nullptr, read, {});
    }

    // Tells why and where; column -1: the line as a whole.
    bool FailAt(const QString& why, int column)
    {
        const QString line = QString::number(reader_.Line());
        const QString records = QString::number(report_.records);
        if (column < 0 || size_t(column) >= plan_.columns.size())
            prompt_.ShowError(StringText(Str::ImportFailedOnLine, {why, line, records}));
        else
            prompt_.ShowError(StringText(Str::ImportFailedAt, {why, line, QString::number(column + 1),
                                                               NameOfColumn(size_t(column)), records}));
        return false;
    }

    QString NameOfColumn(size_t column) const
    {
        return plan_.columns[column].ignored ? u"-"_s : plan_.columns[column].field;
    }

    RecordAppender& appender_;
    QIODevice& file_;
    const ImportPlan& plan_;
    UserPrompt& prompt_;
    ImportReport& report_;
    CsvReader reader_;
    std::vector<Target> targets_; // in the order of the appender's fields
    std::vector<Cell> cells_;
};

QStringList FieldsToFill(const ImportColumns& columns)
{
    QStringList fields;
    for (const ImportColumn& column : columns) {
        if (!column.ignored)
            fields += column.field;
    }
    return fields;
}

} // namespace

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
    texts = TextsOf(reader);
    return true;
}

bool GuessColumns(QIODevice& file, const CsvFormat& format, ImportColumns& columns, UserPrompt& prompt)
{
    const std::unique_ptr<Progress> progress = prompt.StartProgress({Str::ImportScanProgress, {}}, file.size());
    CsvReader reader(file, format);
    CsvReader::Result result = reader.Next();
    const QStringList first = result == CsvReader::Result::Record ? TextsOf(reader) : QStringList();
    std::vector<TypeGuess> guesses(size_t(first.size()), TypeGuess(format.dates));
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
               UserPrompt& prompt, ImportReport& report)
{
    report = {};
    Hr result = Hr::Unexpected;
    QString context;
    const std::unique_ptr<RecordAppender> appender =
        connection.Provider() ? connection.Provider()->CreateAppender(database, plan.table,
                                                                      FieldsToFill(plan.columns), result, context)
                              : nullptr;
    if (!appender) {
        prompt.ShowError(ProviderErrorText(nullptr, result, context));
        return false;
    }
    ImportRun run(*appender, file, plan, prompt, report);
    const bool complete = run.AppendAll();
    run.CountWhatWasCut();
    const Hr committed = appender->Commit();
    if (!Failed(committed))
        return complete;
    prompt.ShowError(ProviderErrorText(nullptr, committed, appender->ErrorContext()));
    report = {};
    return false;
}

} // namespace mirel
