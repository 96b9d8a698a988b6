#pragma once

#include "expr/expr_node.h"
#include "forms/control_source.h"
#include "forms/form_context.h"
#include "forms/form_records.h"
#include "platform/record_id.h"

#include <QString>

#include <vector>

namespace mirel {

// What a control computes: the trees of its ControlSource, made once when the form is opened.
struct ControlBinding {
    struct Column {
        QString name;
        ExprTree tree; // null: the column is empty
    };
    struct Aggregate {
        ExprNode* node; // in `tree`
    };

    ExprTree tree; // null: the control shows what is put into it
    bool wholeResult = false;
    std::vector<Aggregate> aggregates; // the outermost ones of `tree`
    std::vector<Column> columns;       // of a list
    DropDownSource dropDown;
    // Of a drop-down box whose data is one name: the name is an item where no field bears it, see IsItem.
    bool isMaybeItem = false;
    ExprTree ownField; // what such a box then shows; null: what is put into it

    QString recordText; // what the record gave it last
    bool recordTicked = false;
    RecordId shownRecord; // whose value the control was given; null: none
};

ControlBinding BindControl(const ControlDef& control);

// Whether `tree`, in this result, is a drop-down box's item and not what the box shows.
bool IsItem(const ControlBinding& binding, EvalContext& context);

// The result's column when the tree is a field's name and nothing else; -1 otherwise.
int ColumnOf(const ExprNode* tree, EvalContext& context);
// The field that the control shows: its tree when that is a field's name and nothing else, and for a check box the
// field that its condition compares. Null: none.
const ExprNode* ShownField(const ControlBinding& binding, ControlType type);
// The same as a column of the result; -1: none.
int ShownColumn(const ControlBinding& binding, ControlType type, FormContext& context);

// The tree's value on the context's record as a control shows it. A field alone shows its number as the store
// has it, not through six decimals: saving it back changes nothing.
QString TextOnRecord(ExprNode& tree, EvalContext& context);
// Whether a check box is ticked: its condition holds, or its value is the true word or a number other than 0.
bool HoldsOnRecord(ExprNode& tree, EvalContext& context);

} // namespace mirel
