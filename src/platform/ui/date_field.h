#pragma once

#include <QWidget>

class QLineEdit;
class QToolButton;

namespace mirel {

// A line for a date and time, as text in the user's form, beside a button that opens a calendar; Alt+Down and F4
// open it, too. The calendar changes the day of a text and leaves its time alone. Any text can be typed: whether
// it is a date is its owner's to say.
class DateField : public QWidget {
    Q_OBJECT
public:
    explicit DateField(QWidget* parent);

    QLineEdit* Line() const { return line_; }
    QString Text() const;
    void SetText(const QString& text);
    // Without dates it is a line for any text.
    void SetTakesDates(bool dates);
    void OpenCalendar();

Q_SIGNALS:
    void textEdited(const QString& text); // typed or chosen

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    QLineEdit* line_;
    QToolButton* button_;
};

} // namespace mirel
