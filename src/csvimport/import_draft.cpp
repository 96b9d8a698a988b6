#include "csvimport/import_draft.h"

#include "csvimport/csv_import.h"
#include "csvimport/csv_reader.h"
#include "csvimport/import_target.h"
#include "csvimport/reader_fault.h"
#include "csvimport/utf8_source.h"
#include "data/catalog.h"
#include "data/db_recordset.h"
#include "data/provider_error.h"
#include "resources/string_table.h"
#include "tableeditor/table_design.h"

#include <QDir>
#include <QFileInfo>

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

bool SameName(const QString& a, const QString& b)
{
    return a.compare(b, Qt::CaseInsensitive) == 0;
}

// What the file is called, as far as a table may be called that.
QString TableNameOf(const ImportSource& source, const QStringList& taken)
{
    constexpr qsizetype kRoomForNumber = 4;
    QString base =
        source.IsFile() ? QFileInfo(source.Path()).completeBaseName() : StringText(Str::ImportPastedName);
    base = base.simplified().replace(u'[', u'(').replace(u']', u')');
    base = base.left(kMaxNewTableName - kRoomForNumber).trimmed();
    if (FaultOfTableName(base))
        base = StringText(Str::ImportPastedName);
    QString name = base;
    for (int number = 2; taken.contains(name, Qt::CaseInsensitive); ++number)
        name = base + u' ' + QString::number(number);
    return name;
}

QString Bracketed(const QString& table)
{
    return u'[' + QString(table).replace(u']', u"]]"_s) + u']';
}

} // namespace

ImportDraft::ImportDraft(DbConnection& connection, DatabaseLocation database, UserPrompt& prompt)
    : connection_(connection)
    , database_(std::move(database))
    , prompt_(prompt)
{
}

bool ImportDraft::Tell(const UserMessage& message) const
{
    prompt_.Show(message);
    return false;
}

std::unique_ptr<QIODevice> ImportDraft::OpenSource() const
{
    QString fault;
    std::unique_ptr<QIODevice> device = source_.Open(fault);
    if (!device)
        prompt_.Show({Str::ImportCannotOpen, {QDir::toNativeSeparators(source_.Path()), fault}});
    return device;
}

bool ImportDraft::Choose(const ImportSource& source)
{
    const ImportSource before = source_;
    source_ = source;
    if (!Detect()) {
        source_ = before;
        return false;
    }
    newTable_ = TableNameOf(source_, Tables());
    return true;
}

bool ImportDraft::Detect()
{
    const std::unique_ptr<QIODevice> device = OpenSource();
    if (!device)
        return false;
    CsvGiven given;
    if (!source_.IsFile()) {
        // As spreadsheets put it on the clipboard, unless it is no table of theirs.
        given.encoding = u"UTF-8"_s;
        if (device->peek(1 << 16).contains('\t')) {
            given.separator = u'\t';
            given.quote = u'"';
            given.doubledQuotes = true;
        }
    }
    CsvFound found;
    if (!DetectCsv(*device, given, found, prompt_))
        return false;
    found_ = found;
    format_ = found.format;
    columns_ = found.columns;
    columnsFormat_.reset();
    return true;
}

std::vector<ImportDraft::PreviewRow> ImportDraft::Preview(int mostRows) const
{
    std::vector<PreviewRow> rows;
    QString fault;
    const std::unique_ptr<QIODevice> device = source_.Open(fault);
    if (!device)
        return rows;
    CsvReader reader(*device, format_);
    while (int(rows.size()) < mostRows) {
        const CsvReader::Result result = reader.Next();
        if (result == CsvReader::Result::End)
            break;
        if (result == CsvReader::Result::Record) {
            rows.push_back({TextsOf(reader.Texts()), {}});
            continue;
        }
        const QString why = MessageOfFault(reader, *device).Text();
        const bool goesOn = reader.StepOverFault();
        const std::string_view raw = goesOn ? reader.RawRecord() : std::string_view();
        rows.push_back({{QString::fromUtf8(raw.data(), qsizetype(raw.size())).trimmed()}, why});
        if (!goesOn)
            break;
    }
    return rows;
}

QStringList ImportDraft::Tables() const
{
    QStringList tables;
    Catalog(connection_, prompt_).ListTables(database_, tables);
    return tables;
}

bool ImportDraft::ReadTableFields()
{
    DbRecordset table(connection_);
    if (!table.Open(Bracketed(existingTable_), database_, CursorType::ForwardOnly, LockType::ReadOnly)) {
        ReportProviderError(prompt_, &table, table.LastResult());
        return false;
    }
    tableFields_.assign(table.Fields().begin(), table.Fields().end());
    return true;
}

bool ImportDraft::MakeColumns()
{
    const bool isNew = destination_ == Destination::NewTable;
    const QString table = isNew ? QString() : existingTable_;
    if (columnsFormat_ == format_ && SameName(columnsTable_, table) && !columns_.empty())
        return isNew || ReadTableFields();
    if (format_ != found_.format) { // the user knows better: names and types follow
        const std::unique_ptr<QIODevice> device = OpenSource();
        const CsvGiven given{.separator = format_.separator,
                             .quote = format_.quote,
                             .doubledQuotes = format_.doubledQuotes,
                             .namesInFirstLine = format_.namesInFirstLine,
                             .encoding = format_.encoding,
                             .dates = format_.dates,
                             .decimal = format_.decimal};
        CsvFound found;
        if (!device || !DetectCsv(*device, given, found, prompt_))
            return false;
        found.format = format_;
        found_ = found;
    }
    columns_ = found_.columns;
    key_.clear();
    if (!isNew) {
        if (!ReadTableFields())
            return false;
        for (size_t i = 0; i < columns_.size(); ++i) {
            const auto named = std::ranges::find_if(
                tableFields_, [&](const ResultField& each) { return SameName(each.name, columns_[i].field); });
            const int field = format_.namesInFirstLine ? int(named - tableFields_.begin()) : int(i);
            FillField(i, size_t(field) < tableFields_.size() && !columns_[i].ignored ? field : -1);
        }
    }
    columnsFormat_ = format_;
    columnsTable_ = table;
    return true;
}

void ImportDraft::FillField(size_t column, int field)
{
    ImportColumn& filled = columns_[column];
    SetKey(column, false);
    filled.ignored = field < 0;
    if (filled.ignored)
        return;
    filled.field = tableFields_[size_t(field)].name;
    filled.type = tableFields_[size_t(field)].type;
    filled.size = tableFields_[size_t(field)].size;
}

void ImportDraft::SetKey(size_t column, bool isKey)
{
    key_.removeAll(columns_[column].field);
    if (isKey && !columns_[column].ignored)
        key_ += columns_[column].field;
}

bool ImportDraft::IsKey(size_t column) const
{
    return !columns_[column].ignored && key_.contains(columns_[column].field);
}

QString ImportDraft::SkipPath() const
{
    const QFileInfo file(source_.IsFile() ? source_.Path() : database_.FilePath());
    const QString base = file.dir().absoluteFilePath(file.completeBaseName() + u".skipped"_s);
    QString path = base + u".csv"_s;
    for (int number = 2; QFileInfo::exists(path); ++number)
        path = base + u' ' + QString::number(number) + u".csv"_s;
    return path;
}

std::optional<UserMessage> ImportDraft::FaultOfFormat() const
{
    if (format_.separator == 0 || QChar::isSurrogate(format_.separator))
        return UserMessage{Str::ImportEnterSeparator, {}};
    if (!Utf8Source::IsKnownEncoding(format_.encoding))
        return UserMessage{Str::ImportUnknownEncoding, {format_.encoding}};
    return {};
}

std::optional<UserMessage> ImportDraft::FaultOfDestination() const
{
    if (destination_ == Destination::ExistingTable)
        return existingTable_.isEmpty() ? std::optional(UserMessage{Str::ImportChooseTable, {}}) : std::nullopt;
    if (newTable_.trimmed().isEmpty())
        return UserMessage{Str::ImportEnterTable, {}};
    return FaultOfTableName(newTable_);
}

std::optional<UserMessage> ImportDraft::FaultOfColumns() const
{
    UserMessage fault{};
    ImportColumns checked = columns_;
    const bool fits = destination_ == Destination::NewTable
                          ? CheckNewColumns(checked, fault)
                          : MatchByName(existingTable_, tableFields_, checked, fault);
    return fits ? std::nullopt : std::optional(fault);
}

ImportPlan ImportDraft::Plan() const
{
    ImportPlan plan{.format = format_,
                    .table = destination_ == Destination::NewTable ? newTable_ : existingTable_,
                    .columns = columns_,
                    .longTexts = found_.longTexts};
    if (destination_ == Destination::ExistingTable)
        plan.key = key_;
    if (skipsFailing_)
        plan.skipTo = SkipPath();
    return plan;
}

std::vector<ResultField> ImportDraft::FieldsToBe() const
{
    std::vector<ResultField> fields;
    for (const ImportColumn& column : columns_) {
        if (column.ignored)
            continue;
        const auto field = std::ranges::find(tableFields_, column.field, &ResultField::name);
        if (destination_ == Destination::ExistingTable && field != tableFields_.end())
            fields.push_back(*field);
        else
            fields.push_back({.name = column.field, .type = column.type, .size = column.size});
    }
    return fields;
}

ImportDraft::Rehearsal::Rehearsal(std::unique_ptr<QIODevice> device, ImportPlan plan,
                                  std::span<const ResultField> fields)
    : device_(std::move(device))
    , plan_(std::move(plan))
    , check_(*device_, plan_, fields, nullptr, ImportCheck::OnFailure::GoOn)
{
}

std::unique_ptr<ImportDraft::Rehearsal> ImportDraft::Rehearse() const
{
    QString fault;
    std::unique_ptr<QIODevice> device = source_.Open(fault);
    return device ? std::make_unique<Rehearsal>(std::move(device), Plan(), FieldsToBe()) : nullptr;
}

// The database may give a field another name than the one that was asked for.
bool ImportDraft::CreateTable()
{
    if (!Catalog(connection_, prompt_).ExecuteStatement(database_, CreateTableStatement(newTable_, columns_)))
        return false;
    existingTable_ = newTable_;
    if (!ReadTableFields())
        return false;
    size_t field = 0;
    for (ImportColumn& column : columns_) {
        if (!column.ignored && field < tableFields_.size())
            column.field = tableFields_[field++].name;
    }
    // From here on it is there: another try fills it.
    destination_ = Destination::ExistingTable;
    columnsTable_ = existingTable_;
    return true;
}

std::optional<KeyCounts> ImportDraft::ConfirmKeys(const ImportPlan& plan, bool& told)
{
    KeyIndex keys;
    DbRecordset table(connection_);
    QString fault;
    told = true;
    if (!ReadKeys(table, database_, plan, keys, fault)) {
        prompt_.ShowError(fault);
        return {};
    }
    const std::unique_ptr<QIODevice> device = OpenSource();
    if (!device)
        return {};
    constexpr qint64 kLinesPerStep = 1024;
    const std::vector<ResultField> fields = FieldsToBe();
    ImportCheck check(*device, plan, fields, &keys,
                      skipsFailing_ ? ImportCheck::OnFailure::GoOn : ImportCheck::OnFailure::Stop);
    {
        const std::unique_ptr<Progress> progress =
            prompt_.StartProgress({Str::ImportScanProgress, {}}, device->size());
        while (check.Step(kLinesPerStep)) {
            if (!progress->Advance(check.BytesConsumed()))
                return {};
        }
    }
    if (check.LineOfSeveral() > 0) {
        prompt_.Show({Str::ImportKeyOfSeveral, {QString::number(check.LineOfSeveral())}});
        return {};
    }
    told = false;
    const KeyCounts counts = keys.Counts();
    const bool confirmed = prompt_.AskYesNo(
        {Str::ImportKeyQuestion, {QString::number(counts.added), QString::number(counts.updated), plan.table}});
    return confirmed ? std::optional(counts) : std::nullopt;
}

ImportDraft::Outcome ImportDraft::Run()
{
    if (destination_ == Destination::NewTable && !CreateTable())
        return Outcome::Nothing;
    table_ = existingTable_;
    const ImportPlan plan = Plan();
    for (;;) {
        std::optional<KeyCounts> confirmed;
        bool told = false;
        if (!plan.key.isEmpty()) {
            confirmed = ConfirmKeys(plan, told);
            if (!confirmed)
                return Outcome::Nothing;
        }
        const std::unique_ptr<QIODevice> device = OpenSource();
        if (!device)
            return Outcome::Nothing;
        ImportReport report;
        const bool complete = ImportCsv(connection_, database_, *device, plan, prompt_, report, confirmed);
        if (report.otherCounts)
            continue; // others changed the table meanwhile: asked again with what is there now
        for (const UserMessage& warning : report.Warnings())
            prompt_.Show(warning);
        if ((complete || report.stopped) && report.DidSomething())
            prompt_.Show(report.Count());
        if (report.skipped > 0)
            prompt_.Show({Str::ImportSkippedTo, {QDir::toNativeSeparators(plan.skipTo)}});
        if (complete)
            return Outcome::Done;
        return report.records + report.updated > 0 ? Outcome::Failed : Outcome::Nothing;
    }
}

} // namespace mirel
