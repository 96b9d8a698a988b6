#pragma once

#include "platform/user_prompt.h"

#include <QStringList>

#include <deque>

namespace mirel {

// Answers from a script and keeps what was said. A question without an answer left is answered No.
class ScriptedPrompt : public UserPrompt {
public:
    std::deque<bool> answers;
    std::deque<std::optional<QString>> texts;
    bool cancels = false; // questions that can be cancelled
    qint64 stopAt = -1;   // progress asks to stop once this many are done; -1: never

    QStringList questions; // what was asked
    QStringList shown;     // messages and errors
    QStringList reasons;   // the plain lines below them

    bool AskYesNo(const UserMessage& question) override
    {
        questions += question.Text();
        return Take(answers, false);
    }
    Answer AskYesNoCancel(const UserMessage& question) override
    {
        const bool yes = AskYesNo(question);
        return cancels ? Answer::Third : yes ? Answer::Yes : Answer::No;
    }
    void Show(const UserMessage& message) override { shown += message.Text(); }
    void ShowError(const QString& text) override { shown += text; }
    void ShowErrorWithReason(const QString& text, const QString& reason) override
    {
        shown += text;
        reasons += reason;
    }
    std::optional<QString> AskText(const UserMessage& title, const UserMessage& label, const QString&) override
    {
        questions += title.Text() + QLatin1Char('/') + label.Text();
        return Take(texts, std::optional<QString>());
    }
    std::unique_ptr<Progress> StartProgress(const UserMessage&, qint64) override
    {
        return std::make_unique<StoppingProgress>(stopAt);
    }

private:
    struct StoppingProgress : Progress {
        explicit StoppingProgress(qint64 at)
            : stopAt(at)
        {
        }
        bool Advance(qint64 done) override { return stopAt < 0 || done < stopAt; }
        qint64 stopAt;
    };

    template <typename T>
    static T Take(std::deque<T>& queue, T otherwise)
    {
        if (queue.empty())
            return otherwise;
        T first = queue.front();
        queue.pop_front();
        return first;
    }
};

} // namespace mirel
