#pragma once

#include "forms/record_context.h"
#include "platform/cell.h"

#include <QHash>

#include <functional>
#include <span>
#include <vector>

namespace mirel {

// Marks the Yes/No fields that the tree compares with a number: a form's check box then sees their 0 or 1, where
// expressions else see a word, which never equals a number. For trees that a FormContext evaluates.
void CompareYesNoAsNumber(ExprNode& tree);

// The current record as the expressions of a form see it.
class FormContext : public RecordContext {
public:
    using Clock = std::function<QDateTime()>;

    FormContext(DbRecordset& records, YesNoWords words, ControlTexts controlTexts, Clock clock);

    int FindColumn(QStringView name) override;
    FieldType TypeOfColumn(int column) override;
    const Value& FieldValue(int column) override;
    QDateTime Now() override { return clock_(); }
    int FieldCount() const { return records_.FieldCount(); }

private:
    DbRecordset& records_;
    Clock clock_;
};

// Any record of the result, as Read hands it over: for what is computed over many records without moving the
// current one. Made again for each result; the form's context must outlive it.
class RowContext : public EvalContext {
public:
    // Prepares for these trees: they may name no field that was not collected before the first record is lent.
    RowContext(FormContext& form, qint64 recordCount);
    void Collect(const ExprNode& tree);
    const std::vector<int>& Columns() const { return columns_; } // to be read, in this order

    // The record that is evaluated next; the cells in the order of Columns(), borrowed as long as it is.
    void Lend(qint64 position, std::span<const Cell> cells);

    qint64 Position() override { return position_; }
    qint64 RecordCount() override { return recordCount_; }
    int FindColumn(QStringView name) override { return names_.value(name.toString(), -1); }
    FieldType TypeOfColumn(int column) override { return types_[size_t(column)]; }
    const Value& FieldValue(int column) override;
    const Cell* FieldCell(int column) override { return &cells_[size_t(column)]; }
    QStringView YesNoWord(bool truth) override { return form_.YesNoWord(truth); }
    QString ControlText(QStringView name) override { return form_.ControlText(name); }
    QDateTime Now() override { return form_.Now(); }

private:
    FormContext& form_;
    qint64 recordCount_;
    qint64 position_ = -1;
    QHash<QString, int> names_; // to the place in the vectors below
    std::vector<int> columns_;  // of the result
    std::vector<FieldType> types_;
    std::vector<Value> values_; // of the cells that were asked for as such
    std::span<const Cell> cells_;
};

} // namespace mirel
