#pragma once

#include "tableview/block_text.h"
#include "tableview/record_browser.h"

#include <optional>

namespace mirel {

enum class FieldNames { Without, With };

// What the clipboard does to the selected cells of a record browser, and Del to a block of them. Browser and
// prompt must outlive it.
class BlockCommands {
public:
    BlockCommands(RecordBrowser& browser, UserPrompt& prompt)
        : browser_(browser)
        , prompt_(prompt)
    {
    }

    // The texts of the selected cells, whole; with the fields' names as a first row. None: the user stopped it,
    // or reading failed, which was told.
    std::optional<TextRows> Copy(FieldNames names);

    // Puts texts over the cells from the selected one, or the first of the block, on, as one step to undo. Where
    // the block is a multiple of them they are repeated to fill it: one text fills all of it. In the detail the
    // texts go to the fields of its record, one after the other.
    //
    // Nothing is left out and no record added without a question. An empty text is NULL (of a Yes/No: false). A
    // value that its field cannot keep whole ends it: the user is told where; what came before is written.
    bool Paste(TextRows rows);
    bool Clear(); // the selected cells, to NULL

private:
    bool IsDetail() const { return browser_.CurrentPresentation() == Presentation::Detail; }
    std::vector<int> FieldsFrom(int column) const;
    bool AskAboutRoom(TextRows& rows, qint64 width, qint64 room);
    bool AskAboutRecords(qint64 first, qint64 records);
    bool Tell(const OpenResult::ManyWritten& changed, qint64 first, qint64 records, int firstField);
    bool Write(qint64 first, const std::vector<SeenRecord>& asked, const std::vector<int>& fields,
               const TextRows& rows, qint64 records);

    RecordBrowser& browser_;
    UserPrompt& prompt_;
};

} // namespace mirel
