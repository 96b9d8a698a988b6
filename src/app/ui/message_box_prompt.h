#pragma once

#include "platform/user_prompt.h"

class QWidget;

namespace mirel {

// Questions and messages as boxes over the window that is in front, long work as a box with a count and Cancel.
// Yes/No questions default to No, unless they say otherwise. Texts are shown as plain text: a table's name may
// look like markup.
class MessageBoxPrompt : public UserPrompt {
public:
    bool AskYesNo(const UserMessage& question) override;
    bool AskYesNoWith(const UserMessage& question, const Details& details) override;
    Answer AskYesNoOr(const UserMessage& question, const UserMessage& third) override;
    Answer AskYesNoCancel(const UserMessage& question) override;
    void Show(const UserMessage& message) override;
    void ShowError(const QString& text) override;
    void ShowErrorWithReason(const QString& text, const QString& reason) override;
    std::optional<QString> AskText(const UserMessage& title, const UserMessage& label,
                                   const QString& preset) override;
    // The box appears when the work takes longer than a moment; the wait cursor at once. While it shows, no other
    // window of the program takes input.
    std::unique_ptr<Progress> StartProgress(const UserMessage& what, qint64 total) override;
};

} // namespace mirel
