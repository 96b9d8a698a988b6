#pragma once

#include "csvimport/import_draft.h"
#include "platform/ui/wizard.h"

#include <optional>
#include <vector>

class QMimeData;

namespace mirel {

class ImportPage;
class ImportSourcePage;

// "Import": the steps of reading a CSV file into a table, over the draft, which must outlive it. A file may be
// dropped on it.
class CImportWizard : public Wizard {
    Q_OBJECT

public:
    CImportWizard(ImportDraft& draft, UserPrompt& prompt, const QString& near, QWidget* parent);

    // Goes on from the first step where that source can be read.
    void Begin(const ImportSource& source);

protected:
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dropEvent(QDropEvent* event) override;

private:
    void ShowStep(int step) override;
    void GoOn() override;
    void ShowState();
    void Import();
    ImportPage& Page() const { return *pages_[size_t(CurrentStep())]; }

    ImportDraft& draft_;
    ImportSourcePage* sourcePage_;
    std::vector<ImportPage*> pages_; // one for each step
};

// The one file that a drag carries, if an import could read it; empty otherwise.
QString DraggedTextFile(const QMimeData& data);

// Opens the wizard over `window`, and comes back when it is done with. Gives the table that was filled; empty:
// none.
struct ImportRequest {
    ImportSource source; // none: the user chooses
};
QString RunImportWizard(DbConnection& connection, const DatabaseLocation& database, UserPrompt& prompt,
                        const ImportRequest& request, QWidget& window);

} // namespace mirel
