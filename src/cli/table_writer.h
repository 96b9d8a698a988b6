#pragma once

#include "cli/cell_text.h"
#include "cli/record_writer.h"

#include <string>
#include <vector>

namespace mirel::cli {

// Records in aligned columns under a header, numbers to the right. The first
// kMeasuredRecords determine the widths; a wider text further down shifts the rest of its line. Control
// characters, line ends included, are written as blanks: the contents of a database must not control the terminal.
class TableWriter : public RecordWriter {
public:
    static constexpr size_t kMeasuredRecords = 500;

    TableWriter(Output& output, const YesNoWords& words)
        : output_(output)
        , cellText_(words)
    {
    }

    void Begin(std::span<const ResultField> fields) override;
    bool Record(std::span<const Cell> cells) override;
    void End() override;

private:
    struct Text {
        std::string text;
        int width; // in columns of a terminal
        bool right;
    };

    Text MakeText(std::string_view utf8, bool right) const;
    void WriteLine(std::span<const Text> texts);
    void WriteHeld();

    Output& output_;
    CellText cellText_;
    std::span<const ResultField> fields_;
    std::vector<int> widths_;
    std::vector<std::vector<Text>> held_; // until the widths are known; the first is the header
    bool measuring_ = true;
};

// How many columns of a terminal a text takes: combining marks none, East Asian wide characters two.
int TerminalWidth(QStringView text);

} // namespace mirel::cli
