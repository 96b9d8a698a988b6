#pragma once

#include <QApplication>
#include <QObject>
#include <QTimer>

#include <deque>
#include <functional>
#include <memory>

namespace mirel {

// What somebody does in dialogs, step by step: each step waits until the widget that it is for is there. Dialogs
// run event loops of their own, so the steps go on in those.
class Script : public QObject {
public:
    using Find = std::function<QWidget*()>;
    using Act = std::function<void(QWidget&)>;

    Script() { Next(); }

    void Then(Find find, Act act) { steps_.push_back({std::move(find), std::move(act)}); }
    // On a modal dialog of that type.
    template <typename Dialog>
    void On(std::function<void(Dialog&)> act)
    {
        Then(
            []() -> QWidget* {
                auto* dialog = qobject_cast<Dialog*>(QApplication::activeModalWidget());
                return dialog && dialog->isVisible() && dialog->isActiveWindow() ? dialog : nullptr;
            },
            [act](QWidget& dialog) { act(static_cast<Dialog&>(dialog)); });
    }
    bool IsDone() const { return steps_.empty() && !acting_; }

private:
    struct Step {
        Find find;
        Act act;
    };
    // A timer does not fire again while what it called is not back: so each step has one of its own.
    void Next()
    {
        constexpr int kMs = 15;
        QTimer::singleShot(kMs, this, [this] {
            Next();
            if (steps_.empty())
                return;
            QWidget* found = steps_.front().find();
            if (!found)
                return;
            const Act act = std::move(steps_.front().act);
            steps_.pop_front();
            ++acting_;
            act(*found);
            --acting_;
        });
    }

    std::deque<Step> steps_;
    int acting_ = 0;
};

} // namespace mirel
