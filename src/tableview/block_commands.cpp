#include "tableview/block_commands.h"

#include "data/provider_error.h"
#include "resources/string_table.h"
#include "result/cell_text.h"

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qint64 kCopiedAStep = 1024;

// The words that stand for the two values elsewhere; the user's own come first.
constexpr std::array<std::u16string_view, 4> kTrueWords = {u"yes", u"true", u"1", u"-1"};
constexpr std::array<std::u16string_view, 3> kFalseWords = {u"no", u"false", u"0"};

bool IsOneOf(const QString& text, std::span<const std::u16string_view> words)
{
    return std::ranges::any_of(words, [&text](std::u16string_view word) {
        return text.compare(QStringView(word), Qt::CaseInsensitive) == 0;
    });
}

// A text that is none of its field's values goes on as it is, for the store to refuse.
Value PastedValue(const QString& text, FieldType type, const YesNoWords& words)
{
    if (type == FieldType::YesNo) {
        const QString word = text.trimmed();
        const bool isYes = word.compare(words.yes, Qt::CaseInsensitive) == 0;
        const bool isNo = word.compare(words.no, Qt::CaseInsensitive) == 0;
        if (isYes || (!isNo && IsOneOf(word, kTrueWords)))
            return Value::Bool(true);
        return word.isEmpty() || isNo || IsOneOf(word, kFalseWords) ? Value::Bool(false) : Value::Text(text);
    }
    if (text.isEmpty())
        return Value::Null();
    return Value::Text(IsNumber(type) || type == FieldType::Date ? text.trimmed() : text);
}

QStringList AllOf(const TextRows& rows)
{
    QStringList all;
    for (const QStringList& row : rows)
        all += row;
    return all;
}

} // namespace

std::optional<TextRows> BlockCommands::Copy(FieldNames names)
{
    const RecordPage& page = browser_.Page();
    const CellBlock block = browser_.Block();
    if (block.IsEmpty())
        return {};
    TextRows rows;
    if (IsDetail() || block.IsOneCell()) {
        if (names == FieldNames::With)
            rows.push_back({browser_.FieldName(browser_.SelectedField())});
        rows.push_back({browser_.SelectedText()});
        return rows;
    }
    std::vector<int> fields;
    QStringList titles;
    for (int column = block.firstColumn; column <= block.lastColumn; ++column) {
        fields.push_back(page.columns[size_t(column)].field);
        titles += page.columns[size_t(column)].title;
    }
    if (names == FieldNames::With)
        rows.push_back(titles);
    const std::unique_ptr<Progress> progress = prompt_.StartProgress({Str::CopyingCells, {}}, block.Records());
    bool stopped = false;
    qint64 done = 0;
    const ReadRange range{.first = block.firstRecord, .count = block.Records(), .fields = fields};
    const bool read = browser_.Recordset().Read(range, [&](std::span<const Cell> cells) {
        if (done++ % kCopiedAStep == 0)
            stopped = !progress->Advance(done);
        QStringList row;
        for (size_t i = 0; i < cells.size(); ++i) {
            row += GridText(cells[i], browser_.TypeOfField(fields[i]), browser_.Settings().words,
                            TableViewSettings::kNoColumnLimit);
        }
        rows.push_back(std::move(row));
        return !stopped;
    });
    if (!read)
        ReportProviderError(prompt_, &browser_.Recordset(), browser_.Recordset().LastResult());
    return read && !stopped ? std::optional(std::move(rows)) : std::nullopt;
}

// The list's fields from a column on; of a single record the fields from the selected one on.
std::vector<int> BlockCommands::FieldsFrom(int column) const
{
    std::vector<int> fields;
    if (IsDetail()) {
        for (int field = std::max(browser_.SelectedField(), 0); field < browser_.FieldCount(); ++field)
            fields.push_back(field);
        return fields;
    }
    const std::vector<PageColumn>& columns = browser_.Page().columns;
    for (size_t i = size_t(std::max(column, 0)); i < columns.size(); ++i)
        fields.push_back(columns[i].field);
    return fields;
}

bool BlockCommands::AskAboutRoom(TextRows& rows, qint64 width, qint64 room)
{
    if (width <= room)
        return true;
    if (!prompt_.AskYesNo({Str::PasteTooWide, {QString::number(width), QString::number(room)}}))
        return false;
    for (QStringList& row : rows)
        row = row.first(std::min<qsizetype>(row.size(), room));
    return true;
}

bool BlockCommands::AskAboutRecords(qint64 first, qint64 records)
{
    const qint64 count = browser_.Recordset().RecordCount();
    const qint64 added = IsDetail() ? 0 : first + records - count;
    return added <= 0 ||
           prompt_.AskYesNo({Str::PasteAddsRecords,
                             {QString::number(records), QString::number(count - first), QString::number(added)}});
}

bool BlockCommands::Paste(TextRows rows)
{
    if (!browser_.CanUpdate() || rows.empty() || !browser_.WriteEdit())
        return false;
    if (IsDetail())
        rows = {AllOf(rows)};
    if (!browser_.IsEmpty() && browser_.SelectedRecord() >= 0 && !browser_.IsRecordStillThere())
        return false;
    const CellBlock block = browser_.Block();
    const qint64 first = IsDetail() ? browser_.SelectedRecord() : std::max<qint64>(block.firstRecord, 0);
    std::vector<int> fields = FieldsFrom(block.IsEmpty() ? 0 : block.firstColumn);
    const qint64 width = std::ranges::max(rows, {}, &QStringList::size).size();
    if (width == 0 || fields.empty() || !AskAboutRoom(rows, width, qint64(fields.size())))
        return false;
    qint64 records = qint64(rows.size());
    qint64 columns = std::min<qint64>(width, qint64(fields.size()));
    if (!IsDetail() && block.Records() % records == 0 && block.Columns() % width == 0) {
        records = std::max(records, block.Records());
        columns = std::max<qint64>(columns, block.Columns());
    }
    fields.resize(size_t(columns));
    const auto fixed = std::ranges::find_if(fields, [this](int field) { return !browser_.IsWritable(field); });
    if (fixed != fields.end()) {
        prompt_.Show({Str::PasteReadOnly, {browser_.FieldName(*fixed)}});
        return false;
    }
    const std::vector<SeenRecord> asked = browser_.SeenFrom(first, records);
    return AskAboutRecords(first, records) && Write(first, asked, fields, rows, records);
}

bool BlockCommands::Clear()
{
    const CellBlock block = browser_.Block();
    if (!browser_.CanUpdate() || block.IsEmpty())
        return false;
    return Paste({{QString()}});
}

bool BlockCommands::Write(qint64 first, const std::vector<SeenRecord>& asked, const std::vector<int>& fields,
                          const TextRows& rows, qint64 records)
{
    const qsizetype width = std::ranges::max(rows, {}, &QStringList::size).size();
    const auto valuesOf = [&](qint64 record) {
        const QStringList& row = rows[size_t(record % qint64(rows.size()))];
        std::vector<FieldChange> values;
        for (size_t i = 0; i < fields.size(); ++i) {
            const qsizetype at = qsizetype(i) % width;
            if (at < row.size()) { // a shorter row leaves the cells behind it alone
                values.push_back(
                    {fields[i], PastedValue(row[at], browser_.TypeOfField(fields[i]), browser_.Settings().words)});
            }
        }
        return values;
    };
    if (records * qint64(fields.size()) > ChangeLog::kMostCells && !prompt_.AskYesNo({Str::BeyondUndo, {}}))
        return false;
    OpenResult::ManyWritten changed;
    {
        const std::unique_ptr<Progress> progress = prompt_.StartProgress({Str::PastingCells, {}}, records);
        changed = browser_.ChangeRecords(asked, records, valuesOf, *progress);
    }
    if (changed.records > 0 && !IsDetail()) {
        const int column = browser_.Page().ColumnOfField(fields.front());
        browser_.SelectBlock({first, first + changed.records - 1, column, column + int(fields.size()) - 1});
    }
    if (changed.leftAlone > 0)
        prompt_.Show({Str::LeftAlone, {QString::number(changed.leftAlone)}});
    return changed.records + changed.leftAlone == records || Tell(changed, first, records, fields.front());
}

// Why not all was written; the refused cell is the selected one then.
bool BlockCommands::Tell(const OpenResult::ManyWritten& changed, qint64 first, qint64 records, int firstField)
{
    const QStringList counts = {QString::number(changed.records), QString::number(records)};
    if (changed.failure.isEmpty()) {
        prompt_.Show({Str::PasteStopped, counts});
        return false;
    }
    const int refused = changed.refusedField < 0 ? firstField : changed.refusedField;
    (void)browser_.GoToCell(std::min(first + changed.records, browser_.Recordset().RecordCount() - 1), refused);
    const QString place =
        StringText(Str::PasteFailedAt, {browser_.FieldName(refused), QString::number(first + changed.records + 1),
                                        counts[0], counts[1]});
    prompt_.ShowError(changed.failure + u'\n' + place);
    return false;
}

} // namespace mirel
