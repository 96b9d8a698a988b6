#pragma once

#include "data/db_connection.h"
#include "forms/form_store.h"
#include "platform/user_prompt.h"
#include "provider/provider.h"

#include <QString>

#include <optional>
#include <span>

namespace mirel {

// The form that shows and saves the first five fields of a table: a counter, a label and a box for each field, a
// SAVE button. Its name is "DefaultForm". Measures come from the style's point size, not from a screen: the
// window and the command line make the same form.
FormDef MakeDefaultForm(const QString& table, std::span<const ResultField> fields, const TextStyle& style = {});

// The same for a table of a database, whose fields are read first. Empty, and the reason reported, when that
// fails.
std::optional<FormDef> DefaultFormOf(DbConnection& connection, const DatabaseLocation& database,
                                     const QString& table, UserPrompt& prompt, const TextStyle& style = {});

// `name`, or `name` with the least number from 2 on behind it that no form of the store has.
QString FreeFormName(const FormStore& store, const QString& name);

} // namespace mirel
