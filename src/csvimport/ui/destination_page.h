#pragma once

#include "csvimport/import_draft.h"
#include "csvimport/ui/import_page.h"

class QLineEdit;
class QListWidget;
class QRadioButton;

namespace mirel {

// "Destination Table": a new one by its name, or one of those that are there.
class ImportDestinationPage : public ImportPage {
    Q_OBJECT

public:
    ImportDestinationPage(ImportDraft& draft, UserPrompt& prompt, QWidget* parent);

    void Enter() override;
    bool MayLeave() override;

private:
    void Follow();

    ImportDraft& draft_;
    UserPrompt& prompt_;
    QRadioButton* new_;
    QLineEdit* name_;
    QRadioButton* existing_;
    QListWidget* tables_;
    bool showing_ = false;
};

} // namespace mirel
