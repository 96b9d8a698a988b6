#pragma once

#include "forms/form_records.h"
#include "provider/provider.h"

#include <QPoint>
#include <QString>

#include <span>
#include <vector>

namespace mirel {

// What the form maker puts onto a form, in the form's pixels. New controls have the form's font, and no id yet;
// they lie within the form's width where that is possible.

ControlDef NewControl(const FormDef& form, ControlType type, const QString& name, QPoint at);
// The box that shows "3/12", at the right of the form's top.
ControlDef NewRecordCounter(const FormDef& form);
// A label and the control that fits the field: a tick for Yes/No, a calendar for a date, several lines for a memo.
std::vector<ControlDef> FieldControls(const FormDef& form, const ResultField& field, QPoint at);

// The form for a table that looks good without work: a title, the counter, every field in the order of the table
// with its label beside it, and the buttons to save and to delete. Takes name, font and colors of `like`.
FormDef LayOutAllFields(const FormDef& like, const QString& table, std::span<const ResultField> fields);

// A field of the form's table as the form's expressions and assignments write it.
QString FieldSource(const QString& table, const QString& field);

} // namespace mirel
