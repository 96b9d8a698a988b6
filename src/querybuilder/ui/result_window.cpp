#include "querybuilder/ui/result_window.h"

#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "tableview/ui/table_view.h"

#include <QMenu>
#include <QMenuBar>
#include <QPushButton>
#include <QVBoxLayout>

namespace mirel {
namespace {

constexpr QSize kFirstSize(880, 560);

} // namespace

CResultWindow::CResultWindow(const QueryServices& services, QWidget* parent)
    : QDialog(parent)
    , view_(new CTableView(services.connection, services.database, services.prompt, services.settings, this))
{
    setWindowTitle(StringText(Str::QueryRunTitle));
    auto* bar = new QMenuBar(this);
    bar->setNativeMenuBar(false);
    for (QMenu* menu : view_->Menus())
        bar->addMenu(menu);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins({});
    column->setMenuBar(bar);
    column->addWidget(view_);
    resize(kFirstSize);
    FillSmallWindow(*this, *parent);
}

bool CResultWindow::Show(const QString& statement)
{
    return view_->OpenStatement(windowTitle(), statement);
}

// What was typed into a record is written first.
void CResultWindow::reject()
{
    if (view_->MayClose())
        QDialog::reject();
}

} // namespace mirel
