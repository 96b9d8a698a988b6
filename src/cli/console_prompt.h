#pragma once

#include "platform/user_prompt.h"

namespace mirel::cli {

// Speaks to standard error and asks nothing: every question has the answer that the command line gave (--yes),
// No without it. Progress shows where standard error is a terminal, and ends when the program is interrupted.
class ConsolePrompt : public UserPrompt {
public:
    explicit ConsolePrompt(bool answerYes)
        : answerYes_(answerYes)
    {
    }

    bool AskYesNo(const UserMessage& question) override;
    void Show(const UserMessage& message) override;
    void ShowError(const QString& text) override;
    std::optional<QString> AskText(const UserMessage& title, const UserMessage& label,
                                   const QString& preset) override;
    std::unique_ptr<Progress> StartProgress(const UserMessage& what, qint64 total) override;

private:
    bool answerYes_;
};

// From here on an interrupt (or a request to end) is only remembered, so that a command ends where everything
// done so far is whole; a second one ends the program at once. A broken pipe shows as a failed write.
void CatchInterrupts();
bool WasInterrupted();

} // namespace mirel::cli
