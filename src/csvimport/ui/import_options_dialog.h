#pragma once

#include "csvimport/csv_format.h"

#include <QDialog>

class QCheckBox;
class QComboBox;

namespace mirel {

// "Advanced Options" of an import: quotation marks, the form of dates and numbers, the file's encoding.
class CImportOptionsDialog : public QDialog {
    Q_OBJECT

public:
    CImportOptionsDialog(const CsvFormat& format, QWidget* parent);

    const CsvFormat& Chosen() const { return format_; }

private:
    void LayOut();
    void ShowFormat();
    void Connect();

    CsvFormat format_;
    QComboBox* quote_;
    QCheckBox* quotedLines_;
    QComboBox* dateOrder_;
    QComboBox* dateSeparator_;
    QComboBox* timeSeparator_;
    QComboBox* decimal_;
    QComboBox* encoding_;
};

} // namespace mirel
