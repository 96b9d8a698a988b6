#pragma once

#include "app/draft_check.h"
#include "platform/yes_no_words.h"

#include <QDialog>

#include <functional>
#include <vector>

class QLabel;
class QPlainTextEdit;
class QPushButton;

namespace mirel {

class EntryList;

// A draft of a process that was killed, and what became of its record.
struct LeftDraft {
    Draft draft;
    DraftState state = DraftState::Fits;
};

// Offers what was being typed when the program ended: to be put back into its record, to be copied, to be given
// up. It closes once nothing is left to decide; before that, what is not decided stays for the next start.
class CDraftsDialog : public QDialog {
    Q_OBJECT
public:
    // Both get a position in the list as it is by then; the draft leaves the list when they return an empty text,
    // else the text says why not.
    struct Actions {
        std::function<QString(size_t)> putBack;
        std::function<QString(size_t)> discard;
        YesNoWords words{};
    };
    CDraftsDialog(std::vector<LeftDraft> drafts, Actions actions, QWidget* parent);

private:
    void LayOut(bool small);
    QPushButton* Button(Str text, Str tip);
    void ShowList();
    void ShowSelected();
    void Do(const std::function<QString(size_t)>& action);
    size_t Selected() const;

    std::vector<LeftDraft> drafts_;
    Actions actions_;
    QLabel* intro_;
    EntryList* list_;
    QLabel* title_;
    QPlainTextEdit* text_;
    QLabel* state_;
    QPushButton* putBack_;
    QPushButton* copy_;
    QPushButton* discard_;
    QPushButton* later_;
};

} // namespace mirel
