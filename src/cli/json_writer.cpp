#include "cli/json_writer.h"

namespace mirel::cli {

void WriteJsonText(Output& output, std::string_view utf8)
{
    std::string text;
    AppendJsonText(text, utf8);
    output.Write(text);
}

QByteArray JsonText(const QString& text)
{
    std::string quoted;
    AppendJsonText(quoted, text.toStdString());
    return QByteArray::fromStdString(quoted);
}

void JsonWriter::Begin(std::span<const ResultField> fields)
{
    records_.emplace(shape_, fields);
    records_->Begin(pending_);
    Write();
}

bool JsonWriter::Record(std::span<const Cell> cells)
{
    records_->Record(cells, pending_);
    Write();
    return !output_.HasFailed();
}

void JsonWriter::End()
{
    records_->End(pending_);
    Write();
}

void JsonWriter::Write()
{
    output_.Write(pending_);
    pending_.clear();
}

} // namespace mirel::cli
