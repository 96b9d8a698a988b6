#pragma once

#include "cli/record_writer.h"
#include "tableview/json_records.h"

#include <QByteArray>

#include <optional>
#include <string>

namespace mirel::cli {

// Records as JSON on the standard output.
class JsonWriter : public RecordWriter {
public:
    using Shape = JsonRecords::Shape;

    JsonWriter(Output& output, Shape shape)
        : output_(output)
        , shape_(shape)
    {
    }

    void Begin(std::span<const ResultField> fields) override;
    bool Record(std::span<const Cell> cells) override;
    void End() override;

private:
    void Write();

    Output& output_;
    Shape shape_;
    std::optional<JsonRecords> records_;
    std::string pending_;
};

// A text in quotes, as JSON writes it. Bytes that are not UTF-8 become the replacement character.
void WriteJsonText(Output& output, std::string_view utf8);
QByteArray JsonText(const QString& text);

} // namespace mirel::cli
