#include "app/dropped_files.h"
#include "app/ui/entry_panel.h"
#include "app/ui/main_frame.h"
#include "csvimport/ui/import_wizard.h"
#include "resources/string_table.h"

#include <QClipboard>
#include <QDragEnterEvent>
#include <QDropEvent>
#include <QFileInfo>
#include <QGuiApplication>
#include <QMimeData>
#include <QUrl>

// What comes into the window from outside: files that are dropped on it, and tables.

namespace mirel {
namespace {

QStringList DraggedPaths(const QMimeData& data)
{
    QStringList paths;
    for (const QUrl& url : data.urls()) {
        if (url.isLocalFile())
            paths += url.toLocalFile();
    }
    return paths;
}

} // namespace

void CMainFrame::dragEnterEvent(QDragEnterEvent* event)
{
    if (DroppedFiles::Of(DraggedPaths(*event->mimeData())).IsUsable())
        event->acceptProposedAction();
}

void CMainFrame::dropEvent(QDropEvent* event)
{
    const QStringList paths = DraggedPaths(*event->mimeData());
    if (!DroppedFiles::Of(paths).IsUsable())
        return;
    // A move would have the file manager delete what was only opened.
    event->setDropAction(Qt::CopyAction);
    event->accept();
    // The program that it was dragged from waits until this returns, and dialogs stay open for long.
    QMetaObject::invokeMethod(
        this, [this, paths] { TakeFiles(paths); }, Qt::QueuedConnection);
}

// The database first: what comes with it goes into it.
void CMainFrame::TakeFiles(const QStringList& paths)
{
    const DroppedFiles files = DroppedFiles::Of(paths);
    for (const QString& other : files.others)
        session_.Prompt().Show({Str::DropNotUsable, {QFileInfo(other).fileName()}});
    if (files.databases.size() > 1) {
        session_.Prompt().Show({Str::DropOneDatabase, {}});
        return;
    }
    if (!files.databases.isEmpty() && !commands_.OpenDatabase(files.databases.first())) {
        ShowState();
        return;
    }
    ShowState();
    for (const QString& form : files.forms) {
        if (!state_.HasDatabase()) {
            session_.Prompt().Show({Str::OpenDatabaseFirst, {}});
            return;
        }
        (void)commands_.ImportFormFile(form);
        ShowState();
    }
    for (const QString& text : files.texts) {
        ImportFrom(ImportSource::OfFile(text));
        if (!state_.HasDatabase())
            return;
    }
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
