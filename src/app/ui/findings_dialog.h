#pragma once

#include "app/store_check.h"

#include <QDialog>
#include <QString>

#include <vector>

class QLabel;

namespace mirel {

class EntryList;

// What the check of a database found: a list, and for the finding that is selected all of its text and what can be
// done about it.
class CFindingsDialog : public QDialog {
    Q_OBJECT
public:
    CFindingsDialog(std::vector<CheckFinding> findings, const QString& summary, QWidget* parent);

private:
    void ShowList(const QString& summary);
    void ShowSelected();
    QString AllText() const;

    std::vector<CheckFinding> findings_;
    QLabel* summary_;
    EntryList* list_;
    QLabel* text_;
    QLabel* remedy_;
};

} // namespace mirel
