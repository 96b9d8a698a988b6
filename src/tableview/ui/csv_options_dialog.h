#pragma once

#include "tableview/csv_writer.h"

#include <QDialog>

class QCheckBox;
class QComboBox;

namespace mirel {

// "Advanced Options" of an export: quotation marks, the form of dates, the file's encoding.
class CCsvOptionsDialog : public QDialog {
    Q_OBJECT

public:
    CCsvOptionsDialog(const CsvExportOptions& options, QWidget* parent);

    const CsvExportOptions& Chosen() const { return options_; }

private:
    void LayOut();
    void ShowOptions();
    void Connect();

    CsvExportOptions options_;
    QComboBox* quote_;
    QCheckBox* doubledQuotes_;
    QComboBox* dateOrder_;
    QComboBox* dateSeparator_;
    QComboBox* timeSeparator_;
    QComboBox* encoding_;
    QCheckBox* byteOrderMark_;
};

} // namespace mirel
