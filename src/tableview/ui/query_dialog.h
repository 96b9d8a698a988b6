#pragma once

#include <QDialog>
#include <QStringList>

class QListWidget;

namespace mirel {

// "Open": one of the saved queries by its name.
class CQueryDialog : public QDialog {
    Q_OBJECT

public:
    CQueryDialog(const QStringList& names, QWidget* parent);

    QString Chosen() const;

private:
    QListWidget* list_;
};

} // namespace mirel
