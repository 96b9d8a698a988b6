#pragma once

#include <QWidget>

namespace mirel {

// One step of the import wizard: shows the draft and hands it what the user chooses.
class ImportPage : public QWidget {
    Q_OBJECT

public:
    using QWidget::QWidget;

    // The page comes to the front: it shows the draft as it is now.
    virtual void Enter() = 0;
    // The user wants to go on. False when something is missing, which was told.
    [[nodiscard]] virtual bool MayLeave() = 0;
    // The page goes, forward or back.
    virtual void Leave() {}
    virtual bool CanGoOn() const { return true; }

Q_SIGNALS:
    void StateChanged(); // CanGoOn may have
};

} // namespace mirel
