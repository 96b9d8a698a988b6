#include "cli/json_writer.h"

#include "cli/cell_text.h"
#include "platform/ole_date.h"

#include <QStringList>

#include <charconv>
#include <cmath>

namespace mirel::cli {
namespace {

using namespace Qt::StringLiterals;

constexpr std::string_view kHexDigits = "0123456789abcdef";

bool NeedsEscape(char byte)
{
    return static_cast<unsigned char>(byte) < 0x20 || byte == '"' || byte == '\\' || byte == 0x7F;
}

// Calls `write` with the pieces that make up the text in JSON.
template <typename Write>
void EscapeJson(std::string_view text, Write write)
{
    size_t plainFrom = 0;
    for (size_t i = 0; i < text.size(); ++i) {
        if (!NeedsEscape(text[i]))
            continue;
        write(text.substr(plainFrom, i - plainFrom));
        plainFrom = i + 1;
        constexpr std::string_view kShort = "\"\\\n\r\t";
        constexpr std::string_view kLetters = "\"\\nrt";
        const auto byte = static_cast<unsigned char>(text[i]);
        if (const size_t at = kShort.find(text[i]); at != std::string_view::npos) {
            const std::array escape = {'\\', kLetters[at]};
            write({escape.data(), escape.size()});
        } else {
            const std::array escape = {'\\', 'u', '0', '0', kHexDigits[byte >> 4], kHexDigits[byte & 15]};
            write({escape.data(), escape.size()});
        }
    }
    write(text.substr(plainFrom));
}

QStringList KeysOf(std::span<const ResultField> fields)
{
    QStringList keys;
    for (const ResultField& field : fields) {
        QString key = field.name;
        if (keys.contains(key) && !field.table.isEmpty())
            key = field.table + u'.' + field.column;
        // Duplicates that remain get a number: a reader would keep only one of two equal keys.
        for (int number = 2; keys.contains(key); ++number)
            key = field.name + u' ' + QString::number(number);
        keys += key;
    }
    return keys;
}

// Shortest form that reads back as the same number.
void WriteReal(Output& output, double number)
{
    if (std::isnan(number)) {
        output.Write("null");
        return;
    }
    if (std::isinf(number)) {
        output.Write(number > 0 ? "1e999" : "-1e999"); // read back as infinite; JSON has no word for it
        return;
    }
    std::array<char, 32> text;
    const auto end = std::to_chars(text.begin(), text.end(), number).ptr;
    output.Write({text.data(), size_t(end - text.begin())});
}

void WriteDate(Output& output, std::string_view stored)
{
    constexpr size_t kDateLength = 10; // "2001-07-04"
    if (!HasStoredDateForm(stored)) {  // another program's text that is not a date
        WriteJsonText(output, stored);
        return;
    }
    output.Write('"');
    output.Write(stored.substr(0, kDateLength));
    output.Write(stored.size() > kDateLength ? "T" : "T00:00:00");
    if (stored.size() > kDateLength)
        output.Write(stored.substr(kDateLength + 1));
    output.Write('"');
}

} // namespace

void WriteJsonText(Output& output, std::string_view utf8)
{
    const QByteArrayView bytes(utf8.data(), qsizetype(utf8.size()));
    QByteArray repaired;
    if (!bytes.isValidUtf8()) {
        repaired = QString::fromUtf8(bytes).toUtf8();
        utf8 = View(repaired);
    }
    output.Write('"');
    EscapeJson(utf8, [&output](std::string_view piece) { output.Write(piece); });
    output.Write('"');
}

QByteArray JsonText(const QString& text)
{
    QByteArray quoted = "\"";
    EscapeJson(View(text.toUtf8()),
               [&quoted](std::string_view piece) { quoted.append(piece.data(), qsizetype(piece.size())); });
    return quoted + '"';
}

void JsonWriter::Begin(std::span<const ResultField> fields)
{
    fields_ = fields;
    for (const QString& key : KeysOf(fields))
        keys_.push_back(JsonText(key) + ':');
    if (shape_ == Shape::Array)
        output_.Write('[');
}

bool JsonWriter::Record(std::span<const Cell> cells)
{
    if (!first_ && shape_ == Shape::Array)
        output_.Write(",\n");
    first_ = false;
    for (size_t i = 0; i < cells.size(); ++i) {
        output_.Write(i == 0 ? '{' : ',');
        output_.Write(View(keys_[i]));
        WriteCell(cells[i], fields_[i].type);
    }
    output_.Write(shape_ == Shape::Array ? "}" : "}\n");
    return !output_.HasFailed();
}

void JsonWriter::End()
{
    if (shape_ == Shape::Array)
        output_.Write("]\n");
}

void JsonWriter::WriteCell(const Cell& cell, FieldType type)
{
    switch (cell.kind) {
    case Cell::Kind::Null:
        output_.Write("null");
        return;
    case Cell::Kind::Integer:
        if (type == FieldType::YesNo)
            output_.Write(cell.integer != 0 ? "true" : "false");
        else
            output_.Write(NumberBuffer(cell.integer).Text());
        return;
    case Cell::Kind::Real:
        WriteReal(output_, cell.real);
        return;
    case Cell::Kind::Text:
        if (type == FieldType::Date)
            WriteDate(output_, cell.bytes);
        else
            WriteJsonText(output_, cell.bytes);
        return;
    case Cell::Kind::Binary:
        output_.Write('"');
        output_.Write(View(QByteArray::fromRawData(cell.bytes.data(), qsizetype(cell.bytes.size())).toBase64()));
        output_.Write('"');
        return;
    }
}

} // namespace mirel::cli
