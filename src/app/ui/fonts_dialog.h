#pragma once

#include "app/display_records.h"

#include <QDialog>
#include <QFont>

class QCheckBox;
class QComboBox;
class QLabel;
class QLineEdit;

namespace mirel {

// A font as the user described it, as the screen draws it.
QFont FontOf(const FontDesc& description);

QColor ColorOfRef(quint32 bgr);
quint32 RefOfColor(const QColor& color);

// Edits a font description: face, size, flags and the text's colour, with a sample that shows each change.
class CFontsDialog : public QDialog {
    Q_OBJECT

public:
    CFontsDialog(const FontDesc& font, QWidget* parent);

    const FontDesc& Chosen() const { return font_; }

private:
    void FillChoices();
    void LayOut();
    void TakeUpChoices();
    void ChooseColor();
    void ShowSample();

    FontDesc font_;
    QComboBox* face_;
    QComboBox* size_;
    QCheckBox* bold_;
    QCheckBox* italic_;
    QCheckBox* strikeout_;
    QCheckBox* underline_;
    QLabel* swatch_;
    QLineEdit* sample_;
};

} // namespace mirel
