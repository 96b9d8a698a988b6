#pragma once

#include "platform/user_prompt.h"
#include "tableview/aggregate.h"
#include "tableview/record_browser.h"

namespace mirel {

// The commands of the table view that work on all records of its result: sums, "Update all", "Delete all". Each
// first writes the pending edit, and does nothing when that is refused or there is no record. Browser and prompt
// must outlive this.
class BulkCommands {
public:
    BulkCommands(RecordBrowser& browser, UserPrompt& prompt)
        : browser_(browser)
        , prompt_(prompt)
    {
    }

    // Of the selected field; the result stands in the browser's editor.
    bool ShowAggregate(Aggregate kind);
    // Both ask twice. The result is run again afterwards: it shows what is left.
    bool DeleteAll();
    // Sets the selected field of all records to what its editor shows. The page stays where it is.
    bool UpdateAll();

private:
    bool IsReady();

    RecordBrowser& browser_;
    UserPrompt& prompt_;
};

} // namespace mirel
