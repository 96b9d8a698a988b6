#include "tableview/ui/export_wizard.h"

#include "platform/ui/elided_label.h"
#include "platform/ui/file_choice.h"
#include "platform/ui/scrolled_page.h"
#include "platform/ui/wait_cursor.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "tableview/ui/csv_options_dialog.h"

#include <QCheckBox>
#include <QDialogButtonBox>
#include <QDir>
#include <QGridLayout>
#include <QHeaderView>
#include <QLabel>
#include <QListWidget>
#include <QPushButton>
#include <QRadioButton>
#include <QScreen>
#include <QStackedWidget>
#include <QTreeWidget>
#include <QVBoxLayout>

#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr QSize kFirstSize(600, 440);

struct Step {
    Str title;
    Str goOn; // what the forward button says
};
constexpr std::array kSteps = {Step{Str::ExportStepSource, Str::WizardNext},
                               Step{Str::ExportStepSeparator, Str::ExportRun}};

struct Separator {
    QChar character;
    Str text;
};
constexpr std::array kSeparators = {
    Separator{u'\t', Str::CsvSeparatorTab},
    Separator{u';', Str::CsvSeparatorSemicolon},
    Separator{u',', Str::CsvSeparatorComma},
    Separator{u' ', Str::CsvSeparatorSpace},
};

QTreeWidget* FieldList(QWidget* parent)
{
    auto* list = new QTreeWidget(parent);
    list->setRootIsDecorated(false);
    list->setUniformRowHeights(true);
    list->setHeaderLabels(
        {StringText(Str::ExportFieldName), StringText(Str::ExportFieldType), StringText(Str::ExportFieldData)});
    list->setAccessibleName(StringText(Str::ExportSource));
    return list;
}

// A table may be called what no file can be.
QString FileNameOf(QString name)
{
    return name.replace(u'/', u'_') + u".csv"_s;
}

} // namespace

CExportWizard::CExportWizard(ExportDraft& draft, QString name, QString near, WriteQuery writeQuery,
                             QWidget* parent)
    : QDialog(parent)
    , draft_(draft)
    , name_(std::move(name))
    , near_(std::move(near))
    , writeQuery_(std::move(writeQuery))
    , heading_(new QLabel(this))
    , pages_(new QStackedWidget(this))
    , path_(new ElidedLabel(this))
    , preview_(new QListWidget(this))
    , saveAs_(new QPushButton(StringText(Str::ExportSaveAs), this))
    , back_(new QPushButton(StringText(Str::WizardBack), this))
    , next_(new QPushButton(this))
{
    setWindowTitle(StringText(Str::ExportTitle));
    for (QWidget* page : {SourcePage(), SeparatorPage()})
        pages_->addWidget(Scrolled(page));
    LayOut();
    ShowStep(0);
}

void CExportWizard::LayOut()
{
    auto* cancel = new QPushButton(QDialogButtonBox::tr("Cancel"), this);
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
    next_->setDefault(true);
    for (QPushButton* button : {cancel, back_})
        button->setAutoDefault(false);
    connect(cancel, &QPushButton::clicked, this, &QDialog::reject);
    connect(back_, &QPushButton::clicked, this, [this] { ShowStep(0); });
    connect(next_, &QPushButton::clicked, this, &CExportWizard::GoOn);
    resize(kFirstSize.boundedTo(screen()->availableSize()));
}

QWidget* CExportWizard::SourcePage()
{
    auto* page = new QWidget(this);
    source_ = new ElidedLabel(page);
    fields_ = FieldList(page);
    count_ = new QLabel(page);
    auto* query = new QPushButton(StringText(Str::ExportQuery), page);
    query->setEnabled(bool(writeQuery_));
    query->setAutoDefault(false);
    connect(query, &QPushButton::clicked, this, &CExportWizard::ChooseSource);
    query->setToolTip(StringText(Str::ExportQueryTip));
    saveAs_->setToolTip(StringText(Str::ExportSaveAsTip));
    connect(saveAs_, &QPushButton::clicked, this, &CExportWizard::ChoosePath);

    auto* grid = new QGridLayout(page);
    grid->setContentsMargins({});
    grid->addWidget(new QLabel(StringText(Str::ExportSource), page), 0, 0, 1, 2);
    grid->addWidget(source_, 1, 0);
    grid->addWidget(query, 1, 1);
    grid->addWidget(fields_, 2, 0, 1, 2);
    grid->addWidget(count_, 3, 0, 1, 2);
    grid->addWidget(new QLabel(StringText(Str::ExportDestination), page), 4, 0, 1, 2);
    grid->addWidget(path_, 5, 0);
    grid->addWidget(saveAs_, 5, 1);
    grid->setColumnStretch(0, 1);
    grid->setRowStretch(2, 1);
    ShowSource();
    return page;
}

void CExportWizard::ShowSource()
{
    source_->SetText(draft_.Source().simplified());
    source_->setToolTip(draft_.Source().toHtmlEscaped());
    fields_->clear();
    for (const ExportDraft::Field& field : draft_.Fields())
        fields_->addTopLevelItem(new QTreeWidgetItem({field.name, field.type, field.firstData}));
    for (int column = 0; column < 2; ++column)
        fields_->resizeColumnToContents(column);
    count_->setText(StringText(Str::RecordsSelected, {QString::number(draft_.RecordCount())}));
}

void CExportWizard::ChooseSource()
{
    const QString before = draft_.Source();
    const auto take = [this, before](const QString&, const QString& statement) {
        const WaitCursor waiting;
        const bool opens = draft_.SetSource(statement);
        if (!opens)
            (void)draft_.SetSource(before);
        draft_.RecordCount();
        return opens;
    };
    writeQuery_({.statement = before, .table = {}}, take, *this);
    ShowSource();
    ShowState();
}

QWidget* CExportWizard::SeparatorPage()
{
    auto* page = new QWidget(this);
    auto* header = new QCheckBox(StringText(Str::CsvHeader), page);
    auto* advanced = new QPushButton(StringText(Str::CsvAdvanced), page);
    advanced->setAutoDefault(false);
    auto* title = new QLabel(StringText(Str::CsvPreview), page);
    title->setBuddy(preview_);
    preview_->setSelectionMode(QAbstractItemView::NoSelection);
    preview_->setHorizontalScrollMode(QAbstractItemView::ScrollPerPixel);
    preview_->setAccessibleName(StringText(Str::CsvPreview));
    header->setChecked(draft_.Options().header);
    connect(header, &QCheckBox::toggled, this, [this](bool on) {
        draft_.Options().header = on;
        ShowPreview();
    });
    connect(advanced, &QPushButton::clicked, this, &CExportWizard::ChooseOptions);

    auto* column = new QVBoxLayout(page);
    column->setContentsMargins({});
    column->addWidget(Separators(page));
    column->addWidget(header);
    auto* row = new QHBoxLayout;
    row->addWidget(title, 1);
    row->addWidget(advanced);
    column->addLayout(row);
    column->addWidget(preview_, 1);
    return page;
}

QWidget* CExportWizard::Separators(QWidget* page)
{
    auto* group = new QWidget(page);
    auto* grid = new QGridLayout(group);
    grid->setContentsMargins({});
    for (size_t i = 0; i < kSeparators.size(); ++i) {
        const Separator& separator = kSeparators[i];
        auto* button = new QRadioButton(StringText(separator.text), group);
        button->setChecked(draft_.Options().separator == separator.character);
        connect(button, &QRadioButton::toggled, this, [this, character = separator.character](bool on) {
            if (!on)
                return;
            draft_.Options().separator = character;
            ShowPreview();
        });
        grid->addWidget(button, int(i / 2), int(i % 2));
    }
    return group;
}

void CExportWizard::ShowStep(int step)
{
    pages_->setCurrentIndex(step);
    const Step& shown = kSteps[size_t(step)];
    heading_->setText(StringText(
        Str::WizardStep, {StringText(shown.title), QString::number(step + 1), QString::number(kSteps.size())}));
    next_->setText(StringText(shown.goOn));
    back_->setEnabled(step > 0);
    ShowState();
    if (step > 0)
        ShowPreview();
    (next_->isEnabled() ? next_ : saveAs_)->setFocus();
}

void CExportWizard::ShowState()
{
    const QString path = QDir::toNativeSeparators(draft_.Path());
    path_->SetText(path.isEmpty() ? QString() : StringText(Str::ExportPath, {path}));
    path_->setToolTip(path);
    next_->setEnabled(draft_.CanRun());
}

void CExportWizard::ShowPreview()
{
    preview_->clear();
    preview_->addItems(draft_.Preview());
}

void CExportWizard::ChoosePath()
{
    const QString path = draft_.Path().isEmpty() ? near_ : draft_.Path();
    draft_.ChoosePath(ChooseFile(*this, {.title = Str::ExportSaveAs,
                                         .accept = Str::ExportSaveAs,
                                         .use = FileUse::Create,
                                         .kind = {Str::CsvFilter, {u".csv"_s, u".txt"_s}, u"document-export"},
                                         .near = path,
                                         .name = FileNameOf(name_)}));
    ShowState();
    if (next_->isEnabled())
        next_->setFocus();
}

void CExportWizard::ChooseOptions()
{
    CCsvOptionsDialog dialog(draft_.Options(), this);
    FillSmallWindow(dialog, *this);
    if (dialog.exec() != QDialog::Accepted)
        return;
    draft_.Options() = dialog.Chosen();
    ShowPreview();
}

void CExportWizard::GoOn()
{
    if (pages_->currentIndex() == 0)
        ShowStep(1);
    else if (draft_.Run())
        accept();
}

void RunExport(DbConnection& connection, const DatabaseLocation& database, UserPrompt& prompt,
               const ExportRequest& request, QWidget& window)
{
    ExportDraft draft(connection, database, prompt);
    {
        const WaitCursor waiting;
        if (!draft.SetSource(request.statement))
            return;
        draft.RecordCount();
    }
    CExportWizard wizard(draft, request.name, database.FilePath(), request.writeQuery, &window);
    FillSmallWindow(wizard, window);
    wizard.exec();
}

} // namespace mirel
