#include "app/ui/entry_panel.h"
#include "app/ui/main_frame.h"
#include "csvimport/ui/import_wizard.h"
#include "resources/string_table.h"

#include <QClipboard>
#include <QDragEnterEvent>
#include <QDropEvent>
#include <QGuiApplication>
#include <QMimeData>
#include <QUrl>

// What comes into the window from outside: files that are dropped on it, and tables.

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

// The one database file that is dragged; empty when it is anything else.
QString DraggedDatabase(const QMimeData* data)
{
    const QList<QUrl> urls = data->urls();
    if (urls.size() != 1 || !urls.first().isLocalFile())
        return {};
    const QString path = urls.first().toLocalFile();
    return path.endsWith(u".cdb"_s, Qt::CaseInsensitive) ? path : QString();
}

} // namespace

void CMainFrame::dragEnterEvent(QDragEnterEvent* event)
{
    if (!DraggedDatabase(event->mimeData()).isEmpty() || !DraggedTextFile(*event->mimeData()).isEmpty())
        event->acceptProposedAction();
}

void CMainFrame::dropEvent(QDropEvent* event)
{
    const QString database = DraggedDatabase(event->mimeData());
    const QString text = DraggedTextFile(*event->mimeData());
    if (database.isEmpty() && text.isEmpty())
        return;
    // A move would have the file manager delete what was only opened.
    event->setDropAction(Qt::CopyAction);
    event->accept();
    if (!database.isEmpty()) {
        OpenPath(database);
        return;
    }
    // The program that it was dragged from waits until this returns, and the wizard stays open for long.
    QMetaObject::invokeMethod(
        this, [this, text] { ImportFrom(ImportSource::OfFile(text)); }, Qt::QueuedConnection);
}

void CMainFrame::ImportFrom(const ImportSource& source)
{
    if (!state_.HasDatabase()) {
        session_.Prompt().Show({Str::OpenDatabaseFirst, {}});
        return;
    }
    panel_->StopCounting();
    const QString table =
        RunImportWizard(session_.Connection(), session_.Location(), session_.Prompt(), {source}, *this);
    if (table.isEmpty())
        return;
    commands_.Refill();
    if (state_.Tab() == MainTab::Table)
        state_.Select({EntryKind::Table, table, {}, false});
    ShowState();
    session_.TellRecordsChanged();
}

void CMainFrame::ImportFromClipboard()
{
    const QString text = QGuiApplication::clipboard()->text();
    if (text.trimmed().isEmpty())
        session_.Prompt().Show({Str::ImportNothingCopied, {}});
    else
        ImportFrom(ImportSource::OfText(text));
}

} // namespace mirel
