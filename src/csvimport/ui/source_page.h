#pragma once

#include "csvimport/import_draft.h"
#include "csvimport/ui/import_page.h"

class QLabel;
class QPushButton;

namespace mirel {

class ElidedLabel;

// "Select Source/Dest.": which file, and what was found in it.
class ImportSourcePage : public ImportPage {
    Q_OBJECT

public:
    // `near`: a path in the folder where the user begins to look.
    ImportSourcePage(ImportDraft& draft, QString near, QWidget* parent);

    void Enter() override;
    bool MayLeave() override { return CanGoOn(); }
    bool CanGoOn() const override { return !draft_.Source().IsNone(); }
    void Choose(const ImportSource& source);

private:
    void ChooseFileToOpen();
    void TakeClipboard();
    void ShowSource();

    ImportDraft& draft_;
    QString near_;
    ElidedLabel* path_;
    QLabel* summary_;
    QPushButton* open_;
    QPushButton* paste_;
};

} // namespace mirel
