#include "cli/record_writer.h"

#include "cli/cell_text.h"
#include "cli/json_writer.h"
#include "cli/table_writer.h"

#include <algorithm>
#include <array>
#include <cstring>
#include <vector>

namespace mirel::cli {
namespace {

// Up to four bytes, none of them zero, that a line cannot contain unchanged: a text with one of them needs quotes
// or escapes.
class SpecialBytes {
public:
    constexpr explicit SpecialBytes(std::string_view bytes)
    {
        for (size_t i = 0; i < bytes_.size(); ++i)
            bytes_[i] = bytes[std::min(i, bytes.size() - 1)];
    }

    // Most texts contain none, so the search takes sixteen bytes at a time.
    bool StandIn(std::string_view text) const
    {
        constexpr size_t kWidth = sizeof(Block);
        if (text.size() < kWidth)
            return !text.empty() && StandInBlock(text.data(), text.size());
        for (size_t at = 0; at + kWidth < text.size(); at += kWidth) {
            if (StandInBlock(text.data() + at))
                return true;
        }
        return StandInBlock(text.data() + text.size() - kWidth);
    }

private:
    using Block = char __attribute__((vector_size(16)));

    bool StandInBlock(const char* at, size_t size = sizeof(Block)) const
    {
        Block block{};
        std::memcpy(&block, at, size);
        const auto found =
            (block == bytes_[0]) | (block == bytes_[1]) | (block == bytes_[2]) | (block == bytes_[3]);
        std::array<quint64, 2> halves;
        std::memcpy(halves.data(), &found, sizeof halves);
        return (halves[0] | halves[1]) != 0;
    }

    std::array<char, 4> bytes_{};
};

// Quoting as in RFC 4180: a text with a separator, a quote or a line end is quoted, its own quotes are doubled.
void WriteCsvText(Output& output, std::string_view text)
{
    static constexpr SpecialBytes kNeedMarks(",\"\r\n");
    if (!kNeedMarks.StandIn(text)) {
        output.Write(text);
        return;
    }
    output.Write('"');
    for (size_t mark; (mark = text.find('"')) != std::string_view::npos; text.remove_prefix(mark + 1)) {
        output.Write(text.substr(0, mark + 1));
        output.Write('"');
    }
    output.Write(text);
    output.Write('"');
}

// Characters that a line of tab-separated texts cannot contain are written as \t, \n, \r and \\.
void WriteTsvText(Output& output, std::string_view text)
{
    static constexpr std::string_view kEscaped = "\t\n\r\\";
    static constexpr std::string_view kLetters = "tnr\\";
    static constexpr SpecialBytes kNeedEscape(kEscaped);
    if (!kNeedEscape.StandIn(text)) {
        output.Write(text);
        return;
    }
    for (const char byte : text) {
        const size_t escape = kEscaped.find(byte);
        if (escape != std::string_view::npos)
            output.Write('\\');
        output.Write(escape == std::string_view::npos ? byte : kLetters[escape]);
    }
}

// A header line, then one line per record, with a separator between the texts.
class DelimitedWriter : public RecordWriter {
public:
    using WriteText = void (*)(Output& output, std::string_view text);

    DelimitedWriter(Output& output, const YesNoWords& words, char separator, WriteText writeText)
        : output_(output)
        , cellText_(words)
        , separator_(separator)
        , writeText_(writeText)
    {
    }

    void Begin(std::span<const ResultField> fields) override
    {
        fields_ = fields;
        for (size_t i = 0; i < fields.size(); ++i) {
            WriteSeparator(i);
            writeText_(output_, View(fields[i].name.toUtf8()));
        }
        output_.Write('\n');
    }

    bool Record(std::span<const Cell> cells) override
    {
        for (size_t i = 0; i < cells.size(); ++i) {
            WriteSeparator(i);
            const std::string_view text = cellText_.Of(cells[i], fields_[i].type);
            if (IsPlain(cells[i], fields_[i].type))
                output_.Write(text);
            else
                writeText_(output_, text);
        }
        output_.Write('\n');
        return !output_.HasFailed();
    }

    void End() override {}

private:
    // Numbers need no quotes and no escapes; the words of Yes and No may.
    static bool IsPlain(const Cell& cell, FieldType type)
    {
        return cell.kind == Cell::Kind::Real || cell.kind == Cell::Kind::Null ||
               (cell.kind == Cell::Kind::Integer && type != FieldType::YesNo);
    }
    void WriteSeparator(size_t column)
    {
        if (column > 0)
            output_.Write(separator_);
    }

    Output& output_;
    CellText cellText_;
    char separator_;
    WriteText writeText_;
    std::span<const ResultField> fields_;
};

struct FormatName {
    QLatin1StringView name;
    OutputFormat format;
};
constexpr std::array kFormats = {
    FormatName{QLatin1StringView("table"), OutputFormat::Table},
    FormatName{QLatin1StringView("csv"), OutputFormat::Csv},
    FormatName{QLatin1StringView("tsv"), OutputFormat::Tsv},
    FormatName{QLatin1StringView("json"), OutputFormat::Json},
    FormatName{QLatin1StringView("jsonl"), OutputFormat::JsonLines},
};

} // namespace

std::optional<OutputFormat> FormatOfName(QStringView name)
{
    const auto row = std::ranges::find_if(kFormats, [name](const FormatName& each) { return name == each.name; });
    return row == kFormats.end() ? std::nullopt : std::optional(row->format);
}

std::unique_ptr<RecordWriter> MakeRecordWriter(OutputFormat format, Output& output, const YesNoWords& words)
{
    switch (format) {
    case OutputFormat::Table:
        return std::make_unique<TableWriter>(output, words);
    case OutputFormat::Csv:
        return std::make_unique<DelimitedWriter>(output, words, ',', WriteCsvText);
    case OutputFormat::Tsv:
        return std::make_unique<DelimitedWriter>(output, words, '\t', WriteTsvText);
    case OutputFormat::Json:
        return std::make_unique<JsonWriter>(output, JsonWriter::Shape::Array);
    case OutputFormat::JsonLines:
        return std::make_unique<JsonWriter>(output, JsonWriter::Shape::Lines);
    }
    return nullptr;
}

} // namespace mirel::cli
