#pragma once

#include "csvimport/import_draft.h"

#include <QDialog>

#include <optional>
#include <vector>

class QLabel;
class QMimeData;
class QPushButton;
class QStackedWidget;

namespace mirel {

class ImportPage;
class ImportSourcePage;

// "Import": the steps of reading a CSV file into a table, over the draft, which must outlive it. A file may be
// dropped on it.
class CImportWizard : public QDialog {
    Q_OBJECT

public:
    CImportWizard(ImportDraft& draft, UserPrompt& prompt, const QString& near, QWidget* parent);

    // Goes on from the first step where that source can be read.
    void Begin(const ImportSource& source);

protected:
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dropEvent(QDropEvent* event) override;

private:
    void LayOut();
    void ShowStep(int step); // from 0
    void ShowState();
    void GoOn();
    void Import();

    ImportDraft& draft_;
    QLabel* heading_;
    QStackedWidget* pages_;
    QPushButton* back_;
    QPushButton* next_;
    ImportSourcePage* sourcePage_;
    std::vector<ImportPage*> steps_;
    int step_ = 0;
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
