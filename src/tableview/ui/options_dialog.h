#pragma once

#include "tableview/table_view_settings.h"

#include <QDialog>

class QCheckBox;
class QComboBox;
class QSpinBox;

namespace mirel {

// The options of the table view, edited as a copy of its settings.
class COptionsDialog : public QDialog {
    Q_OBJECT

public:
    COptionsDialog(const TableViewSettings& settings, QWidget* parent);

    TableViewSettings Chosen() const;

private:
    void LayOut();

    TableViewSettings settings_;
    QCheckBox* confirmDelete_;
    QCheckBox* limit_;
    QSpinBox* characters_;
    QComboBox* words_;
    QCheckBox* popup_;
    QSpinBox* holdMs_;
    QCheckBox* sortByHeader_;
};

} // namespace mirel
