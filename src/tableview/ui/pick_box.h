#pragma once

#include <QComboBox>

namespace mirel {

// A box from which words are taken into a text, each choice again. So its keys and the wheel open its list and
// choose nothing by themselves: walking past a word does not take it.
class PickBox : public QComboBox {
    Q_OBJECT

public:
    using QComboBox::QComboBox;

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
};

} // namespace mirel
