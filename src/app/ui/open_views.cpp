#include "app/ui/open_views.h"

#include "forms/ui/form_eng_view.h"
#include "tableview/ui/table_view.h"

#include <algorithm>

namespace mirel {

QList<CTableView*> OpenViews::TablesOn(const QString& table) const
{
    QList<CTableView*> on;
    for (CTableView* view : lists_.tables()) {
        if (view->Shows(table))
            on += view;
    }
    return on;
}

QList<CFormEngView*> OpenViews::FormsOn(const QString& table) const
{
    QList<CFormEngView*> on;
    for (CFormEngView* view : lists_.forms()) {
        const QStringList tables = TablesOfStatement(view->Form().CurrentQuery())
                                   << view->Form().Form().tableName.Text();
        if (tables.contains(table, Qt::CaseInsensitive))
            on += view;
    }
    return on;
}

bool OpenViews::WritePending(const QString& table)
{
    return std::ranges::all_of(TablesOn(table), [](CTableView* view) { return view->WritePending(); });
}

void OpenViews::TableChanged(const QString& table)
{
    const std::optional<NameChange> renamed = std::exchange(renamed_, std::nullopt);
    for (CTableView* view : TablesOn(table)) {
        if (!renamed) {
            (void)view->RunAgain();
            continue;
        }
        const bool bearsName = renamed->what == NameChange::What::Table && view->Title() == renamed->from;
        (void)view->RunRenamed(bearsName ? renamed->to : QString(view->Title()), [&](const QString& statement) {
            return StatementWithNewName(statement, *renamed);
        });
    }
    for (CFormEngView* view : FormsOn(table)) {
        if (renamed)
            view->close(); // what it shows is by the old name
        else
            view->RunAgain();
    }
}

void OpenViews::TableDropped(const QString& table)
{
    for (CTableView* view : TablesOn(table)) {
        view->GiveUpEdits();
        view->close();
    }
    for (CFormEngView* view : FormsOn(table)) {
        view->GiveUpEdits();
        view->close();
    }
}

bool OpenViews::Rename(const NameChange& change,
                       const std::function<bool(const DesignRun::LastStep& last)>& rename)
{
    // The field's renaming tells of the table's change before it returns.
    renamed_ = change;
    const bool done = MendingHost::Rename(change, rename);
    if (!done)
        renamed_.reset();
    return done;
}

} // namespace mirel
