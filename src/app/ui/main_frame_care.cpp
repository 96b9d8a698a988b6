#include "app/database_upkeep.h"
#include "app/ui/entry_panel.h"
#include "app/ui/findings_dialog.h"
#include "app/ui/information_dialog.h"
#include "app/ui/main_frame.h"
#include "resources/string_table.h"

#include <QFileInfo>

// The care of the open database: what there is to know of it, copies, the check, the compacting.

namespace mirel {

void CMainFrame::ShowInformation()
{
    CInformationDialog(session_,
                       {.backUp = [this] { return BackUp(); },
                        .compact = [this] { return Compact(); },
                        .check = [this] { return Check(); }},
                       this)
        .exec();
}

QString CMainFrame::BackUp()
{
    DatabaseUpkeep upkeep(session_);
    FileKind kind = FileKind::Database();
    kind.others.clear();
    QString file = ChooseFile(*this, {.title = Str::CommandBackUp,
                                      .accept = Str::CommandBackUp,
                                      .use = FileUse::Create,
                                      .kind = kind,
                                      .near = state_.DatabasePath(),
                                      .name = upkeep.NameForCopy()});
    if (file.isEmpty())
        return {};
    if (QFileInfo(file).suffix().isEmpty())
        file += kind.endings.first();
    return upkeep.BackUp(file);
}

// Compacting renumbers the records, so the open views are closed for it and opened again.
QString CMainFrame::Compact()
{
    if (!MayCloseViews())
        return {};
    panel_->StopCounting();
    const ViewList before = CloseViews();
    const QString line = DatabaseUpkeep(session_).Compact();
    OpenAgain(before);
    ShowState();
    return line;
}

QString CMainFrame::Check()
{
    std::vector<CheckFinding> findings;
    const QString line = DatabaseUpkeep(session_).Check(findings);
    if (findings.empty())
        return line;
    CFindingsDialog(std::move(findings), line, this).exec();
    return line;
}

// From the menu the line has no dialog to stand in.
void CMainFrame::RunCare(QString (CMainFrame::*command)())
{
    if (const QString line = (this->*command)(); !line.isEmpty())
        Note(line);
}

} // namespace mirel
