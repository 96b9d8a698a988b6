#pragma once

#include "csvimport/import_draft.h"
#include "csvimport/ui/import_page.h"

#include <vector>

class QCheckBox;
class QLineEdit;
class QRadioButton;
class QTableWidget;

namespace mirel {

// "Field separator": what is between the texts of a line, with a live preview.
class ImportSeparatorPage : public ImportPage {
    Q_OBJECT

public:
    ImportSeparatorPage(ImportDraft& draft, UserPrompt& prompt, QWidget* parent);

    void Enter() override;
    bool MayLeave() override;

private:
    QWidget* Separators();
    void TakeSeparator();
    void ChooseOptions();
    void ShowFormat();
    void ShowPreview();

    ImportDraft& draft_;
    UserPrompt& prompt_;
    std::vector<QRadioButton*> buttons_; // the last one: another character
    QLineEdit* other_;
    QCheckBox* header_;
    QTableWidget* preview_;
    bool showing_ = false;
};

} // namespace mirel
