#include "csvimport/ui/import_wizard.h"

#include "csvimport/ui/destination_page.h"
#include "csvimport/ui/fields_page.h"
#include "csvimport/ui/separator_page.h"
#include "csvimport/ui/source_page.h"
#include "platform/ui/look_roles.h"
#include "platform/ui/scrolled_page.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QCoreApplication>
#include <QDialogButtonBox>
#include <QDragEnterEvent>
#include <QDropEvent>
#include <QGuiApplication>
#include <QInputMethod>
#include <QLabel>
#include <QMimeData>
#include <QPushButton>
#include <QScreen>
#include <QStackedWidget>
#include <QUrl>
#include <QVBoxLayout>

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr QSize kFirstSize(640, 480);

struct Step {
    Str title;
    Str goOn; // what the forward button says
};
constexpr std::array kSteps = {
    Step{Str::ImportStepSource, Str::WizardNext}, Step{Str::ImportStepSeparator, Str::WizardNext},
    Step{Str::ImportStepDestination, Str::WizardNext}, Step{Str::ImportStepFields, Str::ImportRun}};

} // namespace

CImportWizard::CImportWizard(ImportDraft& draft, UserPrompt& prompt, const QString& near, QWidget* parent)
    : QDialog(parent)
    , draft_(draft)
    , heading_(new QLabel(this))
    , pages_(new QStackedWidget(this))
    , back_(new QPushButton(StringText(Str::WizardBack), this))
    , next_(new QPushButton(this))
    , sourcePage_(new ImportSourcePage(draft, near, this))
    , steps_({sourcePage_, new ImportSeparatorPage(draft, prompt, this),
              new ImportDestinationPage(draft, prompt, this), new ImportFieldsPage(draft, prompt, this)})
{
    setWindowTitle(StringText(Str::ImportTitle));
    setAcceptDrops(true);
    for (ImportPage* page : steps_) {
        pages_->addWidget(Scrolled(page));
        connect(page, &ImportPage::StateChanged, this, &CImportWizard::ShowState);
    }
    LayOut();
    ShowStep(0);
}

void CImportWizard::LayOut()
{
    auto* cancel = new QPushButton(QCoreApplication::translate("QPlatformTheme", "Cancel"), this);
    QFont bold = heading_->font();
    bold.setBold(true);
    heading_->setFont(bold);
    heading_->setWordWrap(true);
    auto* buttons = new QHBoxLayout;
    buttons->addWidget(cancel);
    buttons->addStretch(1);
    buttons->addWidget(back_);
    buttons->addWidget(next_);
    auto* column = new QVBoxLayout(this);
    column->addWidget(heading_);
    column->addWidget(pages_, 1);
    column->addLayout(buttons);
    for (QPushButton* button : {cancel, back_, next_}) { // three of them stand side by side on a small screen
        button->setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Fixed);
        button->setMinimumWidth(4 * fontMetrics().height());
    }
    cancel->setMinimumWidth( // it is the longest in some languages
        std::max(cancel->minimumWidth(), fontMetrics().horizontalAdvance(cancel->text()) + spacing::kWide));
    next_->setDefault(true);
    for (QPushButton* button : {cancel, back_})
        button->setAutoDefault(false);
    connect(cancel, &QPushButton::clicked, this, &QDialog::reject);
    connect(back_, &QPushButton::clicked, this, [this] { ShowStep(step_ - 1); });
    connect(next_, &QPushButton::clicked, this, &CImportWizard::GoOn);
    resize(kFirstSize.boundedTo(screen()->availableSize()));
}

void CImportWizard::Begin(const ImportSource& source)
{
    sourcePage_->Choose(source);
    if (sourcePage_->CanGoOn())
        ShowStep(1);
}

void CImportWizard::ShowStep(int step)
{
    steps_[size_t(step_)]->Leave();
    step_ = std::clamp(step, 0, int(kSteps.size()) - 1);
    pages_->setCurrentIndex(step_);
    const Step& shown = kSteps[size_t(step_)];
    heading_->setText(StringText(
        Str::WizardStep, {StringText(shown.title), QString::number(step_ + 1), QString::number(kSteps.size())}));
    next_->setText(StringText(shown.goOn));
    back_->setEnabled(step_ > 0);
    ShowState();
    if (next_->isEnabled())
        next_->setFocus();
    steps_[size_t(step_)]->Enter();
}

void CImportWizard::ShowState()
{
    next_->setEnabled(steps_[size_t(step_)]->CanGoOn());
}

void CImportWizard::GoOn()
{
    if (!steps_[size_t(step_)]->MayLeave())
        return;
    if (step_ + 1 < int(kSteps.size()))
        ShowStep(step_ + 1);
    else
        Import();
}

void CImportWizard::Import()
{
    steps_[size_t(step_)]->Leave(); // no trial while it runs
    const ImportDraft::Outcome outcome = draft_.Run();
    if (outcome == ImportDraft::Outcome::Nothing) {
        steps_[size_t(step_)]->Enter();
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
