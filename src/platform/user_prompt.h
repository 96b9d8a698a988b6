#pragma once

#include "resources/string_id.h"

#include <QString>
#include <QStringList>

#include <functional>
#include <memory>
#include <optional>

namespace mirel {

// One of the system's texts with its arguments; what the user sees is Text().
struct UserMessage {
    Str id;
    QStringList arguments;

    QString Text() const { return StringText(id, arguments); }
};

// Long work in progress. Destroying it removes the display.
class Progress {
public:
    virtual ~Progress() = default;

    // `done` counts from 0 to the total that StartProgress was given. Returns false once the user has asked to
    // stop: the work then ends at the next point where everything done so far is consistent. Cheap enough to call
    // every thousand records, but not for each one.
    [[nodiscard]] virtual bool Advance(qint64 done) = 0;
};

inline constexpr qint64 kUnknownTotal = -1;

// How the core asks and informs the user: the window shows message boxes, the command line answers from its
// options, a test answers from a script. The core never waits for the user in any other way.
class UserPrompt {
public:
    virtual ~UserPrompt() = default;

    virtual bool AskYesNo(const UserMessage& question) = 0;
    // A yes/no question with one more answer, in the words of `third`. A prompt that cannot offer it asks yes or
    // no.
    enum class Answer { No, Yes, Third };
    virtual Answer AskYesNoOr(const UserMessage& question, const UserMessage& third)
    {
        (void)third;
        return AskYesNo(question) ? Answer::Yes : Answer::No;
    }
    // Whether to keep what would be lost. Third, which leaving the question means as well: neither, go back.
    virtual Answer AskYesNoCancel(const UserMessage& question)
    {
        return AskYesNo(question) ? Answer::Yes : Answer::No;
    }
    // A question with a plain line below it that says what the answer means (empty: none), and the answer that a
    // mere Enter gives.
    enum class Preset { No, Yes };
    struct Details {
        QString note;
        Preset preset = Preset::No;
    };
    virtual bool AskYesNoWith(const UserMessage& question, const Details& details)
    {
        (void)details;
        return AskYesNo(question);
    }
    virtual void Show(const UserMessage& message) = 0;
    // A text that is not a row of the string table: a failure of the provider, with its context.
    virtual void ShowError(const QString& text) = 0;
    // The same with a line below it that says in plain words what is wrong with what the user did; empty: none.
    virtual void ShowErrorWithReason(const QString& text, const QString& reason)
    {
        (void)reason;
        ShowError(text);
    }
    // Empty optional: the user cancelled.
    virtual std::optional<QString> AskText(const UserMessage& title, const UserMessage& label,
                                           const QString& preset) = 0;
    // With kUnknownTotal the display counts what is done.
    virtual std::unique_ptr<Progress> StartProgress(const UserMessage& what, qint64 total) = 0;
};

} // namespace mirel
