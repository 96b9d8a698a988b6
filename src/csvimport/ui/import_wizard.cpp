#include "csvimport/ui/import_wizard.h"

#include "csvimport/ui/destination_page.h"
#include "csvimport/ui/fields_page.h"
#include "csvimport/ui/separator_page.h"
#include "csvimport/ui/source_page.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QDragEnterEvent>
#include <QDropEvent>
#include <QGuiApplication>
#include <QInputMethod>
#include <QMimeData>
#include <QPushButton>
#include <QUrl>

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr QSize kFirstSize(640, 480);

constexpr std::array kSteps = {
    WizardStep{Str::ImportStepSource, Str::WizardNext}, WizardStep{Str::ImportStepSeparator, Str::WizardNext},
    WizardStep{Str::ImportStepDestination, Str::WizardNext}, WizardStep{Str::ImportStepFields, Str::ImportRun}};

} // namespace

CImportWizard::CImportWizard(ImportDraft& draft, UserPrompt& prompt, const QString& near, QWidget* parent)
    : Wizard(kSteps, kFirstSize, parent)
    , draft_(draft)
    , sourcePage_(new ImportSourcePage(draft, near, this))
    , pages_({sourcePage_, new ImportSeparatorPage(draft, prompt, this),
              new ImportDestinationPage(draft, prompt, this), new ImportFieldsPage(draft, prompt, this)})
{
    setWindowTitle(StringText(Str::ImportTitle));
    setAcceptDrops(true);
    for (ImportPage* page : pages_) {
        AddPage(page);
        connect(page, &ImportPage::StateChanged, this, &CImportWizard::ShowState);
    }
    CImportWizard::ShowStep(0);
}

void CImportWizard::Begin(const ImportSource& source)
{
    sourcePage_->Choose(source);
    if (sourcePage_->CanGoOn())
        ShowStep(1);
}

void CImportWizard::ShowStep(int step)
{
    Page().Leave();
    Wizard::ShowStep(step);
    ShowState();
    if (NextButton()->isEnabled())
        NextButton()->setFocus();
    Page().Enter();
}

void CImportWizard::ShowState()
{
    NextButton()->setEnabled(Page().CanGoOn());
}

void CImportWizard::GoOn()
{
    if (!Page().MayLeave())
        return;
    if (IsLastStep())
        Import();
    else
        ShowStep(CurrentStep() + 1);
}

void CImportWizard::Import()
{
    Page().Leave(); // no trial while it runs
    const ImportDraft::Outcome outcome = draft_.Run();
    if (outcome == ImportDraft::Outcome::Nothing) {
        Page().Enter();
        return;
    }
    QGuiApplication::inputMethod()->hide();
    accept();
}

void CImportWizard::dragEnterEvent(QDragEnterEvent* event)
{
    if (!DraggedTextFile(*event->mimeData()).isEmpty())
        event->acceptProposedAction();
}

void CImportWizard::dropEvent(QDropEvent* event)
{
    const QString path = DraggedTextFile(*event->mimeData());
    if (path.isEmpty())
        return;
    event->setDropAction(Qt::CopyAction); // a move would have the file manager delete what was only read
    event->accept();
    ShowStep(0);
    Begin(ImportSource::OfFile(path));
}

QString DraggedTextFile(const QMimeData& data)
{
    const QList<QUrl> urls = data.urls();
    if (urls.size() != 1 || !urls.first().isLocalFile())
        return {};
    constexpr std::array<QStringView, 4> kEndings = {u".csv", u".tsv", u".txt", u".tab"};
    const QString path = urls.first().toLocalFile();
    const bool isText = std::ranges::any_of(
        kEndings, [&path](QStringView ending) { return path.endsWith(ending, Qt::CaseInsensitive); });
    return isText ? path : QString();
}

QString RunImportWizard(DbConnection& connection, const DatabaseLocation& database, UserPrompt& prompt,
                        const ImportRequest& request, QWidget& window)
{
    ImportDraft draft(connection, database, prompt);
    CImportWizard wizard(draft, prompt, database.FilePath(), &window);
    FillSmallWindow(wizard, window);
    if (!request.source.IsNone()) {
        wizard.Begin(request.source);
        if (draft.Source().IsNone())
            return {}; // it cannot be read, which was told
    }
    wizard.exec();
    return draft.Table();
}

} // namespace mirel
