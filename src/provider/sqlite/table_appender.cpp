#include "provider/sqlite/table_appender.h"

#include "provider/sqlite/cell_checker.h"
#include "provider/sqlite/plan.h"
#include "provider/sqlite/record_feed.h"
#include "provider/sqlite/record_writer.h"
#include "provider/sqlite/sql_writer.h"
#include "provider/sqlite/transaction.h"

#include <QRegularExpression>

#include <algorithm>

namespace mirel::sqlite {

using namespace Qt::StringLiterals;

namespace {

// Whether the file takes every record that fits its columns. Where it may refuse one, records go in one by one,
// so that a refusal is told of the right one.
bool TakesEveryRecord(DatabaseFile& file, const dialect::Table& table)
{
    constexpr const char* kNothingRefuses =
        "SELECT NOT EXISTS (SELECT 1 FROM pragma_table_xinfo(@) WHERE [notnull] OR pk OR hidden)"
        " AND NOT EXISTS (SELECT 1 FROM pragma_index_list(@) WHERE [unique] OR partial)"
        " AND NOT EXISTS (SELECT 1 FROM pragma_index_list(@) AS l, pragma_index_info(l.name) WHERE cid=-2)"
        " AND NOT EXISTS (SELECT 1 FROM sqlite_schema WHERE type='trigger' AND tbl_name=@ COLLATE NOCASE)";
    const QByteArray name = QuoteText(table.storedName);
    if (file.Number(QByteArray(kNothingRefuses).replace('@', name)) == 0)
        return false;
    Outcome outcome;
    Statement statement =
        file.Prepare("SELECT sql FROM sqlite_schema WHERE type='table' AND name=" + name, outcome);
    if (!statement || statement.Step() != SQLITE_ROW)
        return false;
    static const QRegularExpression quoted(u"\\[[^]]*\\]|\"[^\"]*\"|`[^`]*`|'[^']*'"_s);
    static const QRegularExpression refusing(u"\\b(CHECK|STRICT)\\b"_s, QRegularExpression::CaseInsensitiveOption);
    return !statement.Text(0).remove(quoted).contains(refusing);
}

class TableAppender : public RecordAppender {
public:
    TableAppender(std::shared_ptr<DatabaseFile> file, QString table, std::vector<ResultField> fields)
        : file_(std::move(file))
        , table_(std::move(table))
        , fields_(std::move(fields))
        , checkers_(fields_.begin(), fields_.end())
        , transaction_(*file_)
        , feed_(*file_)
    {
    }
    ~TableAppender() override { file_->NoteChange(table_); }
    Q_DISABLE_COPY_MOVE(TableAppender)

    Outcome Begin(const dialect::Table& table);

    std::span<const ResultField> Fields() const override { return fields_; }
    Hr Append(std::span<const Cell> cells) override;
    int RefusedField() const override { return refusedField_; }
    QString ErrorContext() const override { return context_; }
    Hr Commit() override;

private:
    Hr Refuse(Hr hr, int field, QString context = {})
    {
        refusedField_ = field;
        context_ = std::move(context);
        return hr;
    }
    Hr Refuse(const Outcome& outcome) { return Refuse(outcome.code, -1, outcome.context); }

    std::shared_ptr<DatabaseFile> file_;
    QString table_;
    std::vector<ResultField> fields_;
    std::vector<CellChecker> checkers_;
    WriteTransaction transaction_;
    RecordFeed feed_;
    bool oneByOne_ = true;
    Outcome lost_; // why records that were taken could not be written
    int refusedField_ = -1;
    QString context_;
};

Outcome TableAppender::Begin(const dialect::Table& table)
{
    std::vector<QByteArray> columns;
    for (const ResultField& field : fields_)
        columns.push_back(QuoteName(field.column));
    Outcome outcome = transaction_.Begin();
    if (!outcome.Ok())
        return outcome;
    oneByOne_ = !TakesEveryRecord(*file_, table);
    return feed_.Open(QuoteName(table.storedName), columns);
}

Hr TableAppender::Append(std::span<const Cell> cells)
{
    if (!file_->IsOpen())
        return Refuse(Hr::NotOpen, -1);
    if (!lost_.Ok())
        return Refuse(lost_);
    if (cells.size() != fields_.size())
        return Refuse(Hr::SyntaxError, -1);
    for (size_t i = 0; i < cells.size(); ++i) {
        Cell stored;
        if (const Hr hr = checkers_[i].Check(cells[i], stored); Failed(hr)) {
            feed_.DropUnfinished();
            return Refuse(hr, int(i));
        }
        feed_.Put(stored);
    }
    if (!oneByOne_ && !feed_.IsFull())
        return Refuse(Hr::Ok, -1);
    const Outcome outcome = feed_.Insert();
    if (!outcome.Ok() && (!oneByOne_ || !file_->InTransaction()))
        lost_ = outcome;
    return Refuse(outcome);
}

Hr TableAppender::Commit()
{
    if (!file_->IsOpen())
        return Refuse(Hr::NotOpen, -1);
    if (lost_.Ok())
        lost_ = feed_.Insert();
    return Refuse(lost_.Ok() ? transaction_.Commit() : lost_);
}

} // namespace

std::unique_ptr<RecordAppender> OpenAppender(std::shared_ptr<DatabaseFile> file, const QString& table,
                                             const QStringList& columns, Outcome& outcome)
{
    const dialect::Table* target = FindWritableTable(*file, table, outcome);
    if (!target)
        return {};
    std::vector<ResultField> fields;
    if (columns.isEmpty()) {
        for (const dialect::Column& column : target->columns)
            fields.push_back(ResultFieldOf(*target, column));
    }
    for (const QString& name : columns) {
        const dialect::Column* column = target->FindColumn(name);
        if (!column || std::ranges::count(fields, column->name, &ResultField::column)) {
            outcome = {column ? Hr::DuplicateColumn : Hr::NoSuchColumn, {}};
            return {};
        }
        fields.push_back(ResultFieldOf(*target, *column));
    }
    auto appender = std::make_unique<TableAppender>(file, target->name, std::move(fields));
    outcome = appender->Begin(*target);
    if (!outcome.Ok())
        return {};
    return appender;
}

} // namespace mirel::sqlite
