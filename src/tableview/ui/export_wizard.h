#pragma once

#include "platform/ui/wizard.h"
#include "tableview/export_draft.h"
#include "tableview/ui/query_writer.h"

#include <vector>

class QLabel;
class QListWidget;
class QPushButton;
class QRadioButton;
class QCheckBox;
class QTreeWidget;

namespace mirel {

class ElidedLabel;

// "Export": the two steps of writing a result as a file, over the draft, which must outlive it.
class CExportWizard : public Wizard {
    Q_OBJECT

public:
    // `name` is what the result is called: the file's name begins with it. `near` is a path in the folder where
    // the user begins to look for a place.
    // `writeQuery` lets the user choose other records; empty: nobody does.
    CExportWizard(ExportDraft& draft, QString name, QString near, WriteQuery writeQuery, QWidget* parent);

private:
    QWidget* SourcePage();
    QWidget* SeparatorPage();
    QWidget* Separators(QWidget* page);
    QWidget* Kinds(QWidget* page);
    void ShowStep(int step) override;
    void GoOn() override;
    void ShowSource();
    void ChooseSource();
    void ShowState();
    void ShowPreview();
    void ChoosePath();
    void ChooseOptions();

    ExportDraft& draft_;
    QString name_;
    QString near_;
    WriteQuery writeQuery_;
    ElidedLabel* source_ = nullptr;
    QTreeWidget* fields_ = nullptr;
    QLabel* count_ = nullptr;
    ElidedLabel* path_;
    QListWidget* preview_;
    QPushButton* saveAs_;
    QWidget* csvOptions_ = nullptr; // what is chosen for CSV alone
};

// Opens the wizard over `window` on the records of a statement, and comes back when it is done with.
struct ExportRequest {
    QString name; // of the table or the query
    QString statement;
    YesNoWords words{}; // for a web page and a document
    WriteQuery writeQuery{};
};
void RunExport(DbConnection& connection, const DatabaseLocation& database, UserPrompt& prompt,
               const ExportRequest& request, QWidget& window);

} // namespace mirel
