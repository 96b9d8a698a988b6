#include "cli/table_writer.h"

#include "platform/utf8_bytes.h"

#include <QList>

#include <algorithm>
#include <array>

namespace mirel::cli {
namespace {

struct CodePoints {
    char32_t first;
    char32_t last;
};

// The blocks that terminals show two columns wide.
constexpr std::array kWide = {
    CodePoints{0x1100, 0x115F},   CodePoints{0x2E80, 0x303E},   CodePoints{0x3041, 0xA4CF},
    CodePoints{0xAC00, 0xD7A3},   CodePoints{0xF900, 0xFAFF},   CodePoints{0xFE30, 0xFE6F},
    CodePoints{0xFF00, 0xFF60},   CodePoints{0xFFE0, 0xFFE6},   CodePoints{0x1F300, 0x1F64F},
    CodePoints{0x1F900, 0x1F9FF}, CodePoints{0x20000, 0x3FFFD},
};

int WidthOf(char32_t character)
{
    switch (QChar::category(character)) {
    case QChar::Mark_NonSpacing:
    case QChar::Mark_Enclosing:
    case QChar::Other_Format:
        return 0;
    default:
        break;
    }
    const auto block = std::ranges::lower_bound(kWide, character, {}, &CodePoints::last);
    return block != kWide.end() && character >= block->first ? 2 : 1;
}

QString WithoutControls(QString text)
{
    for (QChar& character : text) {
        if (character.category() == QChar::Other_Control)
            character = u' ';
    }
    return text;
}

bool IsNumberColumn(const ResultField& field)
{
    return IsNumber(field.type);
}

} // namespace

int TerminalWidth(QStringView text)
{
    int width = 0;
    for (const char32_t character : text.toUcs4())
        width += WidthOf(character);
    return width;
}

TableWriter::Text TableWriter::MakeText(std::string_view utf8, bool right) const
{
    const auto isControl = [](char byte) { return static_cast<unsigned char>(byte) < 0x20 || byte == 0x7F; };
    if (IsAscii(utf8)) {
        std::string text(utf8);
        std::ranges::replace_if(text, isControl, ' ');
        return {text, int(text.size()), right};
    }
    const QString text = WithoutControls(QString::fromUtf8(utf8.data(), qsizetype(utf8.size())));
    return {text.toStdString(), TerminalWidth(text), right};
}

void TableWriter::Begin(std::span<const ResultField> fields)
{
    fields_ = fields;
    std::vector<Text> names;
    for (const ResultField& field : fields)
        names.push_back(MakeText(View(field.name.toUtf8()), IsNumberColumn(field)));
    held_.push_back(std::move(names));
}

bool TableWriter::Record(std::span<const Cell> cells)
{
    std::vector<Text> texts;
    texts.reserve(cells.size());
    for (size_t i = 0; i < cells.size(); ++i) {
        const bool isNumber = cells[i].kind == Cell::Kind::Real ||
                              (cells[i].kind == Cell::Kind::Integer && fields_[i].type != FieldType::YesNo);
        texts.push_back(MakeText(cellText_.Of(cells[i], fields_[i].type), isNumber));
    }
    if (!measuring_) {
        WriteLine(texts);
        return !output_.HasFailed();
    }
    held_.push_back(std::move(texts));
    if (held_.size() > kMeasuredRecords)
        WriteHeld();
    return !output_.HasFailed();
}

void TableWriter::End()
{
    if (measuring_)
        WriteHeld();
}

void TableWriter::WriteHeld()
{
    measuring_ = false;
    widths_.assign(fields_.size(), 0);
    for (const std::vector<Text>& texts : held_) {
        for (size_t i = 0; i < texts.size(); ++i)
            widths_[i] = std::max(widths_[i], texts[i].width);
    }
    WriteLine(held_.front());
    std::vector<Text> rules;
    for (const int width : widths_)
        rules.push_back({std::string(size_t(width), '-'), width, false});
    WriteLine(rules);
    for (size_t record = 1; record < held_.size(); ++record)
        WriteLine(held_[record]);
    held_.clear();
}

void TableWriter::WriteLine(std::span<const Text> texts)
{
    for (size_t i = 0; i < texts.size(); ++i) {
        const std::string blanks(size_t(std::max(0, widths_[i] - texts[i].width)), ' ');
        if (i > 0)
            output_.Write("  ");
        if (texts[i].right)
            output_.Write(blanks);
        output_.Write(texts[i].text);
        if (!texts[i].right && i + 1 < texts.size())
            output_.Write(blanks);
    }
    output_.Write('\n');
}

} // namespace mirel::cli
