#pragma once

#include "forms/form_view_settings.h"

#include <QDialog>

class QCheckBox;
class QComboBox;
class QHBoxLayout;
class QSpinBox;
class QVBoxLayout;

namespace mirel {

// The options of running forms, edited as a copy of their settings.
class CFormOptionsDialog : public QDialog {
    Q_OBJECT

public:
    CFormOptionsDialog(const FormViewSettings& settings, QWidget* parent);

    FormViewSettings Chosen() const;

private:
    void ShowSettings();
    void LayOut();
    void AddNumbers(QVBoxLayout& column);

    FormViewSettings settings_;
    QCheckBox* confirmDelete_;
    QCheckBox* confirmSave_;
    QCheckBox* thirdAnswer_;
    QCheckBox* aggregate_;
    QCheckBox* fit_;
    QCheckBox* sort_;
    QCheckBox* limit_;
    QSpinBox* characters_;
    QCheckBox* popup_;
    QSpinBox* holdMs_;
    QSpinBox* scrollPx_;
    QComboBox* words_;
};

} // namespace mirel
