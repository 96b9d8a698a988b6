#pragma once

#include "csvimport/csv_reader.h"
#include "platform/user_prompt.h"

#include <QIODevice>
#include <QStringList>

#include <span>
#include <string_view>

namespace mirel {

// The reader's last fault in words.
UserMessage MessageOfFault(const CsvReader& reader, const QIODevice& file);

QStringList TextsOf(std::span<const std::string_view> utf8);

} // namespace mirel
