#include "tableview/ui/export_wizard.h"

#include "platform/ui/elided_label.h"
#include "platform/ui/file_choice.h"
#include "platform/ui/wait_cursor.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "tableview/ui/csv_options_dialog.h"
#include "tableview/ui/pdf_export.h"

#include <QCheckBox>
#include <QComboBox>
#include <QDir>
#include <QGridLayout>
#include <QHeaderView>
#include <QLabel>
#include <QListWidget>
#include <QPushButton>
#include <QRadioButton>
#include <QTreeWidget>
#include <QVBoxLayout>

#include <algorithm>
#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr QSize kFirstSize(600, 440);

constexpr std::array kSteps = {WizardStep{Str::ExportStepSource, Str::WizardNext},
                               WizardStep{Str::ExportStepSeparator, Str::ExportRun}};

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

struct Kind {
    ExportKind kind;
    Str text;
    Str filter;
};
// As they stand in the box.
constexpr std::array kKinds = {
    Kind{ExportKind::Csv, Str::ExportKindCsv, Str::CsvFilter},
    Kind{ExportKind::Json, Str::ExportKindJson, Str::ExportFilterJson},
    Kind{ExportKind::Html, Str::ExportKindHtml, Str::ExportFilterHtml},
    Kind{ExportKind::Pdf, Str::ExportKindPdf, Str::ExportFilterPdf},
};

const Kind& KindOf(const ExportDraft& draft)
{
    return *std::ranges::find(kKinds, draft.Options().kind, &Kind::kind);
}

QStringList EndingsOf(ExportKind kind)
{
    const QString ending = ExportDraft::EndingOf(kind);
    return kind == ExportKind::Csv ? QStringList{ending, u".txt"_s} : QStringList{ending};
}

// A table may be called what no file can be.
QString FileNameOf(QString name, ExportKind kind)
{
    return name.replace(u'/', u'_') + ExportDraft::EndingOf(kind);
}

} // namespace

CExportWizard::CExportWizard(ExportDraft& draft, QString name, QString near, WriteQuery writeQuery,
                             QWidget* parent)
    : Wizard(kSteps, kFirstSize, parent)
    , draft_(draft)
    , name_(std::move(name))
    , near_(std::move(near))
    , writeQuery_(std::move(writeQuery))
    , path_(new ElidedLabel(this))
    , preview_(new QListWidget(this))
    , saveAs_(new QPushButton(StringText(Str::ExportSaveAs), this))
{
    setWindowTitle(StringText(Str::ExportTitle));
    for (QWidget* page : {SourcePage(), SeparatorPage()})
        AddPage(page);
    CExportWizard::ShowStep(0);
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
    grid->addWidget(Kinds(page), 4, 0, 1, 2);
    grid->addWidget(new QLabel(StringText(Str::ExportDestination), page), 5, 0, 1, 2);
    grid->addWidget(path_, 6, 0);
    grid->addWidget(saveAs_, 6, 1);
    grid->setColumnStretch(0, 1);
    grid->setRowStretch(2, 1);
    ShowSource();
    return page;
}

QWidget* CExportWizard::Kinds(QWidget* page)
{
    auto* row = new QWidget(page);
    auto* box = new QComboBox(row);
    for (const Kind& each : kKinds)
        box->addItem(StringText(each.text));
    box->setCurrentIndex(int(&KindOf(draft_) - kKinds.data()));
    auto* label = new QLabel(StringText(Str::ExportKind), row);
    label->setBuddy(box);
    connect(box, &QComboBox::activated, this, [this](int index) {
        draft_.SetKind(kKinds[size_t(index)].kind);
        ShowState();
    });
    auto* line = new QHBoxLayout(row);
    line->setContentsMargins({});
    line->addWidget(label);
    line->addWidget(box, 1);
    return row;
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
    csvOptions_ = new QWidget(page);
    auto* header = new QCheckBox(StringText(Str::CsvHeader), csvOptions_);
    auto* advanced = new QPushButton(StringText(Str::CsvAdvanced), csvOptions_);
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
    auto* options = new QVBoxLayout(csvOptions_);
    options->setContentsMargins({});
    options->addWidget(Separators(csvOptions_));
    const bool narrow = parentWidget() && IsHandheldSize(parentWidget()->window()->size());
    auto* row = new QBoxLayout(narrow ? QBoxLayout::TopToBottom : QBoxLayout::LeftToRight);
    row->addWidget(header, 1);
    row->addWidget(advanced, 0, Qt::AlignRight);
    options->addLayout(row);
    column->addWidget(csvOptions_);
    column->addWidget(title);
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
    Wizard::ShowStep(step);
    ShowState();
    if (CurrentStep() > 0)
        ShowPreview();
    (NextButton()->isEnabled() ? NextButton() : saveAs_)->setFocus();
}

void CExportWizard::ShowState()
{
    const QString path = QDir::toNativeSeparators(draft_.Path());
    path_->SetText(path.isEmpty() ? QString() : StringText(Str::ExportPath, {path}));
    path_->setToolTip(path);
    NextButton()->setEnabled(draft_.CanRun());
    csvOptions_->setVisible(draft_.Options().kind == ExportKind::Csv);
}

void CExportWizard::ShowPreview()
{
    preview_->clear();
    preview_->addItems(draft_.Preview());
}

void CExportWizard::ChoosePath()
{
    const QString path = draft_.Path().isEmpty() ? near_ : draft_.Path();
    draft_.ChoosePath(
        ChooseFile(*this, {.title = Str::ExportSaveAs,
                           .accept = Str::ExportSaveAs,
                           .use = FileUse::Create,
                           .kind = {KindOf(draft_).filter, EndingsOf(draft_.Options().kind), u"document-export"},
                           .near = path,
                           .name = FileNameOf(name_, draft_.Options().kind)}));
    ShowState();
    if (NextButton()->isEnabled())
        NextButton()->setFocus();
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
    if (!IsLastStep())
        ShowStep(CurrentStep() + 1);
    else if (draft_.Run(draft_.Options().kind == ExportKind::Pdf ? ExportPdf : ExportCsv))
        accept();
}

void RunExport(DbConnection& connection, const DatabaseLocation& database, UserPrompt& prompt,
               const ExportRequest& request, QWidget& window)
{
    ExportDraft draft(connection, database, prompt);
    draft.Options().title = request.name;
    draft.Options().words = request.words;
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
