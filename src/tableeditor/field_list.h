#pragma once

#include "tableeditor/table_design.h"

#include <QByteArray>

#include <optional>
#include <vector>

namespace mirel {

// A field as a list in JSON names it: {"name": "Qty", "type": "Integer", "size": 40, "index": "ASC", "was": "N"}.
// Size (255) and index (NO) may be left out; `was` is the field's former name, empty or null for a new field.
struct ListedField {
    FieldDesign field;               // its `was` is not yet known
    std::optional<QString> was = {}; // empty: not said
};

// The fields that a list in JSON names. Empty, with the reason, when something in it is not understood.
std::optional<std::vector<ListedField>> ReadFieldList(const QByteArray& json, UserMessage& fault);

// Finds what each of the fields was in a table: what the list says, else the field of its name that no other one
// claims. `current` null: there is no table yet. Empty, with the reason, when the list says what cannot be.
std::optional<std::vector<FieldDesign>> FieldsOfList(const std::vector<ListedField>& list,
                                                     const TableDesign* current, UserMessage& fault);

} // namespace mirel
