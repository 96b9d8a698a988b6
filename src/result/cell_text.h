#pragma once

#include "platform/cell.h"
#include "platform/field_type.h"
#include "platform/value.h"
#include "platform/yes_no_words.h"

#include <QString>

namespace mirel {

// What a value looks like to the user, whole: NULL as the empty text, a date in the user's form, a Yes/No in
// the user's words, all else as VariantText has it.
QString DisplayText(const Value& value, FieldType type, const YesNoWords& words);

// The same for a cell of a page, cut for the grid: a text longer than `maxChars` (-1: no limit) is its first
// `maxChars` characters and "~". Of a long text only what is shown is ever converted.
QString GridText(const Cell& cell, FieldType type, const YesNoWords& words, int maxChars);

// What stands for bytes, which nobody reads: how many they are.
QString BlobText(qint64 bytes);

QString CutForGrid(const QString& text, int maxChars);

constexpr bool IsRightAligned(FieldType type)
{
    return IsNumber(type);
}

// What a text that the user typed stores in a field of that type: nothing is NULL; a number is the whole text, as
// numbers are shown here or as the user's locale writes them; a date as the user writes it. What reads as neither,
// and a number that does not fit, are passed on as text, for the store to refuse. Not for Yes/No.
Value TypedValue(const QString& text, FieldType type);

// The number that a text begins with, as a text for TypedValue: "12.7" is "12" for an integer, "abc" is "0".
// Another type's text stays as it is, and so does the empty one.
QString LeadingNumber(const QString& text, FieldType type);

// Whether TypedValue keeps all of the text: what an editor marks before anything is written. `size` is the
// field's, -1 for none.
bool IsKeptWhole(const QString& text, FieldType type, int size);

} // namespace mirel
