#pragma once

#include <QFrame>

class QLabel;
class QToolButton;

namespace mirel {

// A line beside an editor that says what is wrong with its text and offers the old one; or a quiet note. Hidden
// while there is nothing to say.
class ErrorLine : public QFrame {
    Q_OBJECT
public:
    explicit ErrorLine(QWidget* parent);

    // `restore` is what the button reads; empty: there is nothing to restore.
    void ShowError(const QString& what, const QString& restore);
    void ShowNote(const QString& note);
    void Clear();
    QString Text() const; // empty: nothing is said

Q_SIGNALS:
    void restoreRequested();

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void Say(const QString& text, bool isError, const QString& restore);
    void TakeUpColors();
    void FitButton();

    QLabel* text_;
    QToolButton* restore_;
    QString restoreText_;
    bool isError_ = false;
};

} // namespace mirel
