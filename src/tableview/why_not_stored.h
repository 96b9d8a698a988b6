#pragma once

#include "platform/field_type.h"

#include <QString>

namespace mirel {

// What is wrong with a typed text in a field of that type and size (-1: none), in plain words: "not a date:
// 31.31.99", "at most 60 characters, this has 71". Empty: all of it is stored. Not for Yes/No.
QString WhyNotStored(const QString& text, FieldType type, int size);

// How a message quotes a text: on one line, its middle left out where it is long.
QString Quoted(const QString& text);

} // namespace mirel
