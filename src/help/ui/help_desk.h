#pragma once

#include <QObject>

class QApplication;
class QDialog;
class QWidget;

namespace mirel {

// Answers where windows ask for no help themselves: F1 in a dialog, Shift+F1 on a control, a tap after "What Is
// This?". Puts a button with a question mark beside the buttons of every dialog that has a page.
class HelpDesk : public QObject {
    Q_OBJECT
public:
    explicit HelpDesk(QApplication& application); // which owns it

    // What is said of a control: its own row of the table, or else its tool tip. Empty: neither.
    static QString TextOf(const QWidget& part);

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    bool TakeKey(QWidget& part, const QEvent& event);
    static void Explain(QWidget& part);
    static void OfferButton(QDialog& dialog);
};

} // namespace mirel
