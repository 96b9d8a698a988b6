#pragma once

#include "forms/form_records.h"

#include <QString>

#include <optional>

namespace mirel {

// A form file (*.pfs): one form on its way from one database to another. It is a store file with that form alone.

// Writes a copy of the form; an existing file is replaced in one step. False with `error` set, and the file as it
// was, when it cannot be written.
[[nodiscard]] bool ExportForm(const FormDef& form, const QString& path, QString& error);

// The first form of the file, others and queries are left out. Empty with `error` set when the file cannot be
// read or holds no form.
std::optional<FormDef> ImportForm(const QString& path, QString& error);

} // namespace mirel
