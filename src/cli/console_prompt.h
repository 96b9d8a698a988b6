#pragma once

#include "platform/user_prompt.h"

namespace mirel::cli {

// Writes to standard error and asks nothing: the answer to every question is Yes with --yes, else No. Shows
// progress if standard error is a terminal; an interrupt ends the work in progress.
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

// From here on an interrupt (or a request to terminate) is only remembered, so that a command can end in a
// consistent state; a second one ends the program at once. A broken pipe shows as a failed write.
void CatchInterrupts();
bool WasInterrupted();

} // namespace mirel::cli
