#include "csvimport/reader_fault.h"

#include "platform/system_reason.h"
#include "resources/string_table.h"

namespace mirel {

UserMessage MessageOfFault(const CsvReader& reader, const QIODevice& file)
{
    switch (reader.LastFault()) {
    case CsvReader::Fault::None:
    case CsvReader::Fault::CannotRead:
        break;
    case CsvReader::Fault::NotText:
        return {Str::ImportNotText, {reader.Encoding()}};
    case CsvReader::Fault::RecordTooLong:
        return {Str::ImportRecordTooLong, {}};
    case CsvReader::Fault::QuoteNeverClosed:
        return {Str::ImportQuoteNeverClosed, {}};
    }
    return {Str::ImportCannotRead, {SystemReason(file)}};
}

QStringList TextsOf(std::span<const std::string_view> utf8)
{
    QStringList texts;
    for (const std::string_view text : utf8)
        texts += QString::fromUtf8(text.data(), qsizetype(text.size()));
    return texts;
}

} // namespace mirel
