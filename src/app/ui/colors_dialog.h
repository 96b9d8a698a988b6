#pragma once

#include <QColor>
#include <QDialog>

#include <optional>

class QLineEdit;
class QToolButton;

namespace mirel {

// A palette of colours: one is taken with a tap or the arrow keys, or written as "#rrggbb". It opens on a given
// colour.
class CColorsDialog : public QDialog {
    Q_OBJECT

public:
    enum class Unset { Refused, Offered }; // whether "the desktop's color" can be chosen

    CColorsDialog(const std::optional<QColor>& color, Unset unset, QWidget* parent);

    std::optional<QColor> Chosen() const { return chosen_; } // none: the desktop's

private:
    QWidget* MakePalette();
    void Choose(const std::optional<QColor>& color);
    void ShowChosen();

    std::optional<QColor> chosen_;
    QList<QToolButton*> swatches_;
    QToolButton* desktops_;
    QLineEdit* code_;
    QWidget* sample_;
};

} // namespace mirel
