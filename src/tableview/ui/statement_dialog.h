#pragma once

#include <QDialog>

namespace mirel {

// Shows a statement as text that can be selected and copied.
class CStatementDialog : public QDialog {
    Q_OBJECT

public:
    // Accepted: the user wants to change it.
    enum class Edit { Offered, NotOffered };
    CStatementDialog(const QString& statement, Edit edit, QWidget* parent);
};

} // namespace mirel
