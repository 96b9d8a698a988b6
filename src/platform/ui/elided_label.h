#pragma once

#include <QFrame>

namespace mirel {

// One line of text that takes what room there is and is cut in the middle, where paths and names differ least.
class ElidedLabel : public QFrame {
    Q_OBJECT
public:
    using QFrame::QFrame;

    void SetText(const QString& text);
    QString Text() const { return text_; }

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QString text_;
};

} // namespace mirel
