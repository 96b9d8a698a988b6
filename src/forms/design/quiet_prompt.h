#pragma once

#include "platform/user_prompt.h"

#include <QElapsedTimer>

namespace mirel {

// For what nobody asked for: answers No, shows nothing, and stops work after a moment.
class QuietPrompt : public UserPrompt {
public:
    static constexpr qint64 kUsualPatienceMs = 300;

    void SetPatience(qint64 ms) { patienceMs_ = ms; }

    bool AskYesNo(const UserMessage&) override { return false; }
    void Show(const UserMessage&) override {}
    void ShowError(const QString&) override {}
    std::optional<QString> AskText(const UserMessage&, const UserMessage&, const QString&) override { return {}; }
    std::unique_ptr<Progress> StartProgress(const UserMessage&, qint64) override
    {
        return std::make_unique<Patience>(patienceMs_);
    }

private:
    struct Patience : Progress {
        explicit Patience(qint64 ms)
            : patienceMs(ms)
        {
            since.start();
        }
        bool Advance(qint64) override { return since.elapsed() < patienceMs; }
        qint64 patienceMs;
        QElapsedTimer since;
    };
    qint64 patienceMs_ = kUsualPatienceMs;
};

} // namespace mirel
