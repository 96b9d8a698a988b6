#pragma once

#include "cli/record_writer.h"

#include <QByteArray>

#include <vector>

namespace mirel::cli {

// Records as JSON objects: numbers as numbers, Yes/No as true and false, a date as "YYYY-MM-DDTHH:MM:SS", binary
// as base64, NULL as null. A second column of one name has the key "Table.Field".
class JsonWriter : public RecordWriter {
public:
    enum class Shape { Array, Lines }; // one array of objects, or one object per line

    JsonWriter(Output& output, Shape shape)
        : output_(output)
        , shape_(shape)
    {
    }

    void Begin(std::span<const ResultField> fields) override;
    bool Record(std::span<const Cell> cells) override;
    void End() override;

private:
    void WriteCell(const Cell& cell, FieldType type);

    Output& output_;
    Shape shape_;
    std::span<const ResultField> fields_;
    std::vector<QByteArray> keys_; // in quotes, with the colon
    bool first_ = true;
};

// A text in quotes, as JSON writes it. Bytes that are not UTF-8 become the replacement character.
void WriteJsonText(Output& output, std::string_view utf8);
QByteArray JsonText(const QString& text);

} // namespace mirel::cli
