#pragma once

#include <QDialog>

namespace mirel {

// Shows a statement as text that can be selected and copied.
class CStatementDialog : public QDialog {
    Q_OBJECT

public:
    CStatementDialog(const QString& statement, QWidget* parent);
};

} // namespace mirel
