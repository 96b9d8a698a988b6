#pragma once

#include "platform/cell.h"
#include "platform/yes_no_words.h"
#include "provider/provider.h"
#include "tableview/date_texts.h"

#include <span>
#include <string>

namespace mirel {

// Records as the table of a web page, to be read by people: numbers to the right, line ends kept, NULL empty. Each
// call appends to `out`.
class HtmlRecords {
public:
    // The fields must outlive it.
    HtmlRecords(const DateFormat& dates, YesNoWords words, std::span<const ResultField> fields);

    void Begin(const QString& title, std::string& out) const;
    void Record(std::span<const Cell> cells, std::string& out);
    static void End(std::string& out);

private:
    void AppendCell(const Cell& cell, FieldType type, std::string& out);

    std::string yes_;
    std::string no_;
    DateTexts dates_;
    std::span<const ResultField> fields_;
};

} // namespace mirel
