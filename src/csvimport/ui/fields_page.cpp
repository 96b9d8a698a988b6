#include "csvimport/ui/fields_page.h"

#include "data/field_names.h"
#include "platform/ui/error_line.h"
#include "platform/ui/look_roles.h"
#include "resources/string_table.h"

#include <QCheckBox>
#include <QComboBox>
#include <QElapsedTimer>
#include <QGridLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QLocale>
#include <QSpinBox>
#include <QTreeWidget>
#include <QVBoxLayout>

#include <algorithm>
#include <array>

namespace mirel {
namespace {

enum ListColumn { MarkColumn, NameColumn, TypeColumn, SizeColumn, DataColumn };

constexpr int kLargestTyped = 99999; // what is out of range is told, not made impossible to type
constexpr std::array kTypes = {FieldType::Text, FieldType::Integer, FieldType::SmallInt, FieldType::Double,
                               FieldType::Memo, FieldType::Date,    FieldType::YesNo};

QString NameOf(FieldType type)
{
    QString name;
    TypeNameOfField(type, name);
    return name;
}

} // namespace

ImportFieldsPage::ImportFieldsPage(ImportDraft& draft, UserPrompt& prompt, QWidget* parent)
    : ImportPage(parent)
    , draft_(draft)
    , prompt_(prompt)
    , list_(new QTreeWidget(this))
    , nameLabel_(new QLabel(StringText(Str::ImportFieldName), this))
    , name_(new QLineEdit(this))
    , field_(new QComboBox(this))
    , typeLabel_(new QLabel(StringText(Str::ImportFieldType), this))
    , type_(new QComboBox(this))
    , sizeLabel_(new QLabel(StringText(Str::ImportFieldSize), this))
    , size_(new QSpinBox(this))
    , key_(new QCheckBox(StringText(Str::ImportFieldKey), this))
    , skip_(new QCheckBox(StringText(Str::ImportSkipFailing), this))
    , trialLine_(new ErrorLine(this))
{
    skip_->setToolTip(StringText(Str::ImportSkipFailingTip));
    key_->setToolTip(StringText(Str::ImportFieldKeyTip));
    trialTimer_.setInterval(0);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins({});
    column->setSpacing(spacing::kTight);
    column->addWidget(MakeList(), 1);
    column->addWidget(MakeStrip());
    column->addWidget(skip_);
    column->addWidget(trialLine_);
    Connect();
}

QWidget* ImportFieldsPage::MakeList()
{
    list_->setRootIsDecorated(false);
    list_->setUniformRowHeights(true);
    list_->setAccessibleName(StringText(Str::ImportFieldsList));
    list_->setHeaderLabels({StringText(Str::ImportColumnMark), StringText(Str::ImportColumnName),
                            StringText(Str::ImportColumnType), StringText(Str::ImportColumnSize),
                            StringText(Str::ImportColumnData)});
    list_->setSizePolicy(QSizePolicy::Expanding,
                         QSizePolicy::Ignored);          // what is below must fit a small screen too
    list_->setMinimumHeight(7 * fontMetrics().height()); // three rows
    list_->header()->setMinimumSectionSize(fontMetrics().height());
    return list_;
}

QWidget* ImportFieldsPage::MakeStrip()
{
    auto* strip = new QWidget(this);
    for (const FieldType type : kTypes)
        type_->addItem(NameOf(type), int(type));
    for (QComboBox* box : {type_, field_}) {
        box->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
        box->setMinimumContentsLength(6);
    }
    size_->setRange(0, kLargestTyped);
    typeLabel_->setBuddy(type_);
    sizeLabel_->setBuddy(size_);
    name_->setAccessibleName(StringText(Str::ImportColumnName));
    field_->setAccessibleName(StringText(Str::ImportColumnName));
    auto* grid = new QGridLayout(strip);
    grid->setContentsMargins({});
    grid->setVerticalSpacing(spacing::kTight);
    grid->addWidget(nameLabel_, 0, 0);
    grid->addWidget(name_, 0, 1, 1, 3);
    grid->addWidget(field_, 0, 1, 1, 2);
    grid->addWidget(key_, 0, 3);
    grid->addWidget(typeLabel_, 1, 0);
    grid->addWidget(type_, 1, 1);
    grid->addWidget(sizeLabel_, 1, 2);
    grid->addWidget(size_, 1, 3);
    grid->setColumnStretch(1, 1);
    return strip;
}

void ImportFieldsPage::Connect()
{
    connect(list_, &QTreeWidget::currentItemChanged, this, &ImportFieldsPage::ShowStrip);
    connect(list_, &QTreeWidget::itemClicked, this, [this](QTreeWidgetItem* item, int column) {
        if (column == MarkColumn)
            ToggleIgnored(list_->indexOfTopLevelItem(item));
    });
    connect(name_, &QLineEdit::textEdited, this, &ImportFieldsPage::TakeStrip);
    connect(type_, &QComboBox::activated, this, &ImportFieldsPage::TakeStrip);
    connect(size_, &QSpinBox::valueChanged, this, &ImportFieldsPage::TakeStrip);
    connect(field_, &QComboBox::activated, this, &ImportFieldsPage::TakeStrip);
    connect(key_, &QCheckBox::toggled, this, [this](bool on) {
        if (showing_ || Row() < 0)
            return;
        draft_.SetKey(size_t(Row()), on);
        ShowColumn(Row());
    });
    connect(skip_, &QCheckBox::toggled, this, [this](bool on) { draft_.SetSkipsFailing(on); });
    connect(&trialTimer_, &QTimer::timeout, this, &ImportFieldsPage::GoOnTrying);
}

int ImportFieldsPage::Row() const
{
    return list_->currentItem() ? list_->indexOfTopLevelItem(list_->currentItem()) : -1;
}

void ImportFieldsPage::Enter()
{
    std::vector<ImportDraft::PreviewRow> rows = draft_.Preview(2);
    const size_t first = draft_.Format().namesInFirstLine ? 1 : 0;
    firstData_ = first < rows.size() ? rows[first].texts : QStringList();
    showing_ = true;
    field_->clear();
    field_->addItem(StringText(Str::ImportIgnoreField));
    for (const ResultField& field : draft_.TableFields())
        field_->addItem(field.name);
    nameLabel_->setBuddy(IsNew() ? static_cast<QWidget*>(name_) : field_);
    name_->setVisible(IsNew());
    field_->setVisible(!IsNew());
    key_->setVisible(!IsNew());
    skip_->setChecked(draft_.SkipsFailing());
    showing_ = false;
    ShowColumns();
    BeginTrial();
}

void ImportFieldsPage::Leave()
{
    trialTimer_.stop();
    trial_.reset();
}

bool ImportFieldsPage::MayLeave()
{
    const std::optional<UserMessage> fault = draft_.FaultOfColumns();
    if (!fault)
        return true;
    prompt_.Show(*fault);
    if (Row() < 0)
        return false;
    (IsNew() ? fault->id == Str::ImportTextSize ? static_cast<QWidget*>(size_) : name_ : field_)->setFocus();
    return false;
}

void ImportFieldsPage::ShowColumns()
{
    const int row = std::max(Row(), 0);
    showing_ = true;
    list_->clear();
    for (size_t i = 0; i < draft_.Columns().size(); ++i)
        new QTreeWidgetItem(list_);
    for (int i = 0; i < list_->topLevelItemCount(); ++i)
        ShowColumn(i);
    for (const int column : {MarkColumn, NameColumn, TypeColumn, SizeColumn})
        list_->resizeColumnToContents(column);
    showing_ = false;
    list_->setCurrentItem(list_->topLevelItem(std::min(row, list_->topLevelItemCount() - 1)));
    ShowStrip();
}

void ImportFieldsPage::ShowColumn(int row)
{
    QTreeWidgetItem* item = list_->topLevelItem(row);
    const ImportColumn& column = draft_.Columns()[size_t(row)];
    const bool hasSize = column.type == FieldType::Text && column.size > 0;
    const QString name = column.ignored && !IsNew() ? StringText(Str::ImportIgnoreField) : column.field;
    item->setText(MarkColumn, column.ignored ? StringText(Str::ImportColumnMark) : QString());
    item->setText(NameColumn, draft_.IsKey(size_t(row)) ? name + u'*' : name);
    item->setText(TypeColumn, column.ignored ? QString() : NameOf(column.type));
    item->setText(SizeColumn, column.ignored || !hasSize ? QString() : QString::number(column.size));
    item->setText(DataColumn, firstData_.value(row).left(200).simplified());
    for (int each = NameColumn; each <= DataColumn; ++each)
        item->setForeground(each, column.ignored ? ColorOfRole(LookRole::Dim, palette()) : QBrush());
}

void ImportFieldsPage::ShowStrip()
{
    if (showing_ || Row() < 0)
        return;
    showing_ = true;
    const ImportColumn& column = Column();
    const bool isText = column.type == FieldType::Text;
    name_->setText(column.field);
    const int field = column.ignored ? 0 : field_->findText(column.field);
    field_->setCurrentIndex(std::max(field, 0));
    type_->setCurrentIndex(type_->findData(int(column.type)));
    size_->setValue(isText ? column.size : 0);
    key_->setChecked(draft_.IsKey(size_t(Row())));
    name_->setEnabled(!column.ignored);
    type_->setEnabled(IsNew() && !column.ignored);
    size_->setEnabled(IsNew() && !column.ignored && isText);
    key_->setEnabled(!column.ignored);
    showing_ = false;
}

void ImportFieldsPage::TakeStrip()
{
    if (showing_ || Row() < 0)
        return;
    ImportColumn& column = Column();
    if (IsNew()) {
        column.field = name_->text();
        const auto type = FieldType(type_->currentData().toInt());
        const bool becomesText = type == FieldType::Text && column.type != type;
        column.type = type;
        if (becomesText)
            column.size = kMaxTextSize;
        else if (type == FieldType::Text)
            column.size = size_->value();
    } else {
        draft_.FillField(size_t(Row()), field_->currentIndex() - 1);
    }
    Changed();
}

void ImportFieldsPage::ToggleIgnored(int row)
{
    ImportColumn& column = draft_.Columns()[size_t(row)];
    if (IsNew())
        column.ignored = !column.ignored;
    else
        draft_.FillField(size_t(row), column.ignored ? field_->findText(column.field) - 1 : -1);
    Changed();
}

void ImportFieldsPage::Changed()
{
    ShowColumn(Row());
    if (!name_->hasFocus())
        ShowStrip();
    BeginTrial();
}

// --- the trial ----------------------------------------------------------------------------------------------

void ImportFieldsPage::BeginTrial()
{
    trial_ = draft_.Rehearse();
    for (int row = 0; row < list_->topLevelItemCount(); ++row) {
        list_->topLevelItem(row)->setToolTip(DataColumn, {});
        ShowColumn(row);
    }
    trialLine_->ShowNote(StringText(Str::ImportChecking));
    trialTimer_.start();
}

// In slices, so that the page goes on answering.
void ImportFieldsPage::GoOnTrying()
{
    constexpr qint64 kSliceMs = 20;
    constexpr qint64 kLines = 200;
    if (!trial_) {
        trialTimer_.stop();
        return;
    }
    QElapsedTimer slice;
    slice.start();
    bool more = true;
    while (more && slice.elapsed() < kSliceMs)
        more = trial_->Step(kLines);
    if (more && trial_->Check().FailingLines() == 0)
        return;
    ShowTrial(!more);
    if (!more)
        trialTimer_.stop();
}

void ImportFieldsPage::ShowTrial(bool done)
{
    const ImportCheck& check = trial_->Check();
    const QLocale locale;
    if (check.FailingLines() == 0) {
        if (done)
            trialLine_->ShowNote(StringText(Str::ImportAllFit, {locale.toString(check.GoodLines())}));
        return;
    }
    const LineFailure& first = check.Failures().front();
    const QString count = locale.toString(check.FailingLines());
    const QString line = locale.toString(first.line);
    const QString why = QString(first.why).replace(QStringLiteral("\r\n"), QStringLiteral(" "));
    trialLine_->ShowError(
        first.column < 0 ? StringText(Str::ImportLineFails, {count, line, why})
                         : StringText(Str::ImportSomeFail, {count, line, QString::number(first.column + 1), why}),
        {});
    const QColor refused = ColorOfRole(LookRole::Error, palette());
    for (const LineFailure& failure : check.Failures()) {
        QTreeWidgetItem* item = list_->topLevelItem(failure.column);
        if (!item || !item->toolTip(DataColumn).isEmpty())
            continue;
        item->setForeground(TypeColumn, refused);
        item->setForeground(DataColumn, refused);
        item->setToolTip(DataColumn,
                         StringText(Str::ImportFailingField, {locale.toString(failure.line), failure.why}));
    }
}

} // namespace mirel
