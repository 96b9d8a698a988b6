#include "tableview/json_records.h"

#include "platform/number_text.h"
#include "platform/ole_date.h"

#include <QStringList>

#include <array>
#include <charconv>
#include <cmath>

namespace mirel {
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
void AppendReal(std::string& out, double number)
{
    if (std::isnan(number)) {
        out += "null";
        return;
    }
    if (std::isinf(number)) {
        out += number > 0 ? "1e999" : "-1e999"; // read back as infinite; JSON has no word for it
        return;
    }
    std::array<char, 32> text;
    const auto end = std::to_chars(text.begin(), text.end(), number).ptr;
    out.append(text.data(), size_t(end - text.begin()));
}

void AppendDate(std::string& out, std::string_view stored)
{
    constexpr size_t kDateLength = 10; // "2001-07-04"
    if (!HasStoredDateForm(stored)) {  // another program's text that is not a date
        AppendJsonText(out, stored);
        return;
    }
    out += '"';
    out += stored.substr(0, kDateLength);
    out += stored.size() > kDateLength ? "T" : "T00:00:00";
    if (stored.size() > kDateLength)
        out += stored.substr(kDateLength + 1);
    out += '"';
}

void AppendCell(std::string& out, const Cell& cell, FieldType type)
{
    switch (cell.kind) {
    case Cell::Kind::Null:
        out += "null";
        return;
    case Cell::Kind::Integer:
        if (type == FieldType::YesNo)
            out += cell.integer != 0 ? "true" : "false";
        else
            out += NumberBuffer(cell.integer).Text();
        return;
    case Cell::Kind::Real:
        AppendReal(out, cell.real);
        return;
    case Cell::Kind::Text:
        if (type == FieldType::Date)
            AppendDate(out, cell.bytes);
        else
            AppendJsonText(out, cell.bytes);
        return;
    case Cell::Kind::Binary:
        out += '"';
        out += QByteArray::fromRawData(cell.bytes.data(), qsizetype(cell.bytes.size())).toBase64().toStdString();
        out += '"';
        return;
    }
}

} // namespace

void AppendJsonText(std::string& out, std::string_view utf8)
{
    const QByteArrayView bytes(utf8.data(), qsizetype(utf8.size()));
    std::string repaired;
    if (!bytes.isValidUtf8()) {
        repaired = QString::fromUtf8(bytes).toStdString();
        utf8 = repaired;
    }
    out += '"';
    EscapeJson(utf8, [&out](std::string_view piece) { out += piece; });
    out += '"';
}

JsonRecords::JsonRecords(Shape shape, std::span<const ResultField> fields)
    : shape_(shape)
    , fields_(fields)
{
    for (const QString& key : KeysOf(fields)) {
        std::string text;
        AppendJsonText(text, key.toStdString());
        keys_.push_back(text + ':');
    }
}

void JsonRecords::Begin(std::string& out) const
{
    if (shape_ == Shape::Array)
        out += '[';
}

void JsonRecords::Record(std::span<const Cell> cells, std::string& out)
{
    if (!first_ && shape_ == Shape::Array)
        out += ",\n";
    first_ = false;
    for (size_t i = 0; i < cells.size(); ++i) {
        out += i == 0 ? '{' : ',';
        out += keys_[i];
        AppendCell(out, cells[i], fields_[i].type);
    }
    out += shape_ == Shape::Array ? "}" : "}\n";
}

void JsonRecords::End(std::string& out) const
{
    if (shape_ == Shape::Array)
        out += "]\n";
}

} // namespace mirel
