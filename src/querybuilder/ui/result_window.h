#pragma once

#include "querybuilder/ui/query_dialog.h"

#include <QDialog>

namespace mirel {

class CTableView;

// The result of a statement that is still being written, in a table view over the query dialog.
class CResultWindow : public QDialog {
    Q_OBJECT
public:
    CResultWindow(const QueryServices& services, QWidget* parent);

    [[nodiscard]] bool Show(const QString& statement); // false: the provider refused it, which was told
    CTableView& View() { return *view_; }

    void reject() override;

private:
    CTableView* view_;
};

} // namespace mirel
