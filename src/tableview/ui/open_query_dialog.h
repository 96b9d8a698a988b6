#pragma once

#include <QDialog>
#include <QStringList>

class QListWidget;

namespace mirel {

// "Open": one of the saved queries by its name.
class COpenQueryDialog : public QDialog {
    Q_OBJECT

public:
    COpenQueryDialog(const QStringList& names, QWidget* parent);

    QString Chosen() const;

private:
    QListWidget* list_;
};

} // namespace mirel
