#pragma once

#include "platform/user_prompt.h"

#include <vector>

namespace mirel {

// Keeps what there is to tell until it is destroyed, and then tells it: for the time of a transaction, in which
// nobody may be kept waiting for a person. Asks nothing, and shows no progress.
class HeldPrompt : public UserPrompt {
public:
    explicit HeldPrompt(UserPrompt& prompt)
        : prompt_(prompt)
    {
    }
    ~HeldPrompt() override
    {
        for (const QString& text : errors_)
            prompt_.ShowError(text);
        for (const UserMessage& message : messages_)
            prompt_.Show(message);
    }
    Q_DISABLE_COPY_MOVE(HeldPrompt)

    bool AskYesNo(const UserMessage&) override { return false; }
    void Show(const UserMessage& message) override { messages_.push_back(message); }
    void ShowError(const QString& text) override { errors_ += text; }
    std::optional<QString> AskText(const UserMessage&, const UserMessage&, const QString&) override { return {}; }
    std::unique_ptr<Progress> StartProgress(const UserMessage&, qint64) override
    {
        struct Unseen : Progress {
            bool Advance(qint64) override { return true; }
        };
        return std::make_unique<Unseen>();
    }

private:
    UserPrompt& prompt_;
    QStringList errors_;
    std::vector<UserMessage> messages_;
};

} // namespace mirel
