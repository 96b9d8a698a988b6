#include "provider/sqlite/table_appender.h"

#include "provider/sqlite/cell_binder.h"
#include "provider/sqlite/plan.h"
#include "provider/sqlite/sql_writer.h"
#include "provider/sqlite/transaction.h"

#include <algorithm>

namespace mirel::sqlite {
namespace {

class TableAppender : public RecordAppender {
public:
    TableAppender(std::shared_ptr<DatabaseFile> file, QString table, std::vector<ResultField> fields)
        : file_(std::move(file))
        , table_(std::move(table))
        , fields_(std::move(fields))
        , binders_(fields_.begin(), fields_.end())
        , transaction_(*file_)
    {
    }
    ~TableAppender() override { file_->NoteChange(table_); }
    Q_DISABLE_COPY_MOVE(TableAppender)

    Outcome Begin(const QByteArray& storedTable);

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

    std::shared_ptr<DatabaseFile> file_;
    QString table_;
    std::vector<ResultField> fields_;
    std::vector<CellBinder> binders_;
    WriteTransaction transaction_;
    std::optional<Statement> insert_; // kept for the whole run
    int refusedField_ = -1;
    QString context_;
};

Outcome TableAppender::Begin(const QByteArray& storedTable)
{
    QByteArray names;
    QByteArray places;
    for (const ResultField& field : fields_) {
        names += (names.isEmpty() ? "" : ",") + QuoteName(field.column);
        places += places.isEmpty() ? "?" : ",?";
    }
    Outcome outcome = transaction_.Begin();
    if (!outcome.Ok())
        return outcome;
    insert_.emplace(
        file_->Prepare("INSERT INTO " + storedTable + '(' + names + ") VALUES (" + places + ')', outcome));
    return outcome;
}

Hr TableAppender::Append(std::span<const Cell> cells)
{
    if (!insert_ || !file_->IsOpen())
        return Refuse(Hr::NotOpen, -1);
    if (cells.size() != fields_.size())
        return Refuse(Hr::SyntaxError, -1);
    for (size_t i = 0; i < cells.size(); ++i) {
        if (const Hr hr = binders_[i].Bind(*insert_, int(i) + 1, cells[i]); Failed(hr))
            return Refuse(hr, int(i));
    }
    const int result = insert_->Step();
    insert_->Reset();
    if (result == SQLITE_DONE)
        return Refuse(Hr::Ok, -1);
    Outcome outcome = file_->OutcomeOf(result);
    return Refuse(outcome.code, -1, std::move(outcome.context));
}

Hr TableAppender::Commit()
{
    insert_.reset();
    if (!file_->IsOpen())
        return Refuse(Hr::NotOpen, -1);
    Outcome outcome = transaction_.Commit();
    return Refuse(outcome.code, -1, std::move(outcome.context));
}

} // namespace

std::unique_ptr<RecordAppender> OpenAppender(std::shared_ptr<DatabaseFile> file, const QString& table,
                                             const QStringList& columns, Outcome& outcome)
{
    outcome = file->RefreshSchema();
    if (!outcome.Ok())
        return {};
    const dialect::Table* target = file->Schema().FindTable(table);
    if (!target) {
        outcome = {Hr::NoSuchTable, {}};
        return {};
    }
    if (!target->writable) {
        outcome = {Hr::ReadOnly, {}};
        return {};
    }
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
    outcome = appender->Begin(QuoteName(target->storedName));
    if (!outcome.Ok())
        return {};
    return appender;
}

} // namespace mirel::sqlite
