#pragma once

#include "csvimport/import_draft.h"
#include "csvimport/ui/import_page.h"

#include <QTimer>

class QCheckBox;
class QComboBox;
class QLabel;
class QLineEdit;
class QSpinBox;
class QTreeWidget;

namespace mirel {

class ErrorLine;

// "Define Fields": where each column of the file goes. The selected one is edited below the list. Meanwhile the
// whole file is tried, so that lines that will fail are told before the run.
class ImportFieldsPage : public ImportPage {
    Q_OBJECT

public:
    ImportFieldsPage(ImportDraft& draft, UserPrompt& prompt, QWidget* parent);

    void Enter() override;
    bool MayLeave() override;
    void Leave() override;

private:
    QWidget* MakeList();
    QWidget* MakeStrip();
    void Connect();
    bool IsNew() const { return draft_.DestinationKind() == ImportDraft::Destination::NewTable; }
    int Row() const;
    ImportColumn& Column() { return draft_.Columns()[size_t(Row())]; }

    void ShowColumns();
    void ShowColumn(int row);
    void ShowStrip();
    void TakeStrip();
    void ToggleIgnored(int row);
    void Changed(); // the selected column: the trial begins again

    void BeginTrial();
    void GoOnTrying();
    void ShowTrial(bool done);

    ImportDraft& draft_;
    UserPrompt& prompt_;
    QStringList firstData_; // of the file's first record
    QTreeWidget* list_;
    QLabel* nameLabel_;
    QLineEdit* name_;
    QComboBox* field_;
    QLabel* typeLabel_;
    QComboBox* type_;
    QLabel* sizeLabel_;
    QSpinBox* size_;
    QCheckBox* key_;
    QCheckBox* skip_;
    ErrorLine* trialLine_;
    std::unique_ptr<ImportDraft::Rehearsal> trial_;
    QTimer trialTimer_;
    bool showing_ = false;
};

} // namespace mirel
