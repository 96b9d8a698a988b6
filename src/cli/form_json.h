#pragma once

#include "cli/output.h"
#include "forms/form_store.h"
#include "forms/running_form.h"

namespace mirel::cli {

// Every form, control and saved query of a store as one JSON object, with all fields that the file keeps. Colours
// are numbers, -1 for the default one; a missing text is null.
void WriteStoreJson(Output& output, const FormStore& store);

// What a running form shows.
void WriteRunningFormJson(Output& output, RunningForm& form);

} // namespace mirel::cli
