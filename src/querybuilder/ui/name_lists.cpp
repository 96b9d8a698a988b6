#include "querybuilder/ui/name_lists.h"

#include "platform/ui/look_roles.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"
#include "tableview/ui/pick_box.h"

#include <QFormLayout>
#include <QLabel>
#include <QListWidget>
#include <QSignalBlocker>
#include <QStackedWidget>
#include <QVBoxLayout>

#include <algorithm>

namespace mirel {
namespace {

constexpr int kBoxEntries = 8;
constexpr int kLeastRowHeight = 24; // a finger's

QComboBox* Box(Str name, QWidget* parent)
{
    auto* box = new PickBox(parent);
    box->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    box->setMinimumContentsLength(4);
    box->setMaxVisibleItems(kBoxEntries);
    box->setAccessibleName(StringText(name).remove(u'&'));
    return box;
}

QListWidget* List(Str name, QWidget* parent)
{
    auto* list = new QListWidget(parent);
    list->setAccessibleName(StringText(name).remove(u'&'));
    list->setTextElideMode(Qt::ElideMiddle);
    list->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    return list;
}

QLabel* Label(Str text, QWidget* buddy, QWidget* parent)
{
    auto* label = new QLabel(StringText(text), parent);
    label->setBuddy(buddy);
    return label;
}

} // namespace

NameLists::NameLists(FieldLists& lists, const QString& table, QWidget* parent)
    : QWidget(parent)
    , lists_(lists)
    , parts_(new QStackedWidget(this))
{
    parts_->addWidget(WidePart());
    parts_->addWidget(NarrowPart());
    auto* whole = new QVBoxLayout(this);
    whole->setContentsMargins({});
    whole->addWidget(parts_);
    const QStringList& tables = lists_.Tables();
    tableBox_->addItems(tables);
    tableList_->addItems(tables);
    for (int row = 0; row < tableList_->count(); ++row) {
        tableList_->item(row)->setIcon(ThemeIcon(u"mirel-table"));
        tableList_->item(row)->setToolTip(tables[row].toHtmlEscaped());
        tableList_->item(row)->setSizeHint({0, kLeastRowHeight});
    }
    const qsizetype first = std::max<qsizetype>(tables.indexOf(table), 0);
    if (!tables.isEmpty())
        ChooseTable(tables[first]);
}

QWidget* NameLists::WidePart()
{
    auto* part = new QWidget(parts_);
    tableList_ = List(Str::QueryTables, part);
    fieldList_ = List(Str::QueryFields, part);
    auto* column = new QVBoxLayout(part);
    column->setContentsMargins({});
    column->setSpacing(spacing::kTight);
    column->addWidget(Label(Str::QueryTables, tableList_, part));
    column->addWidget(tableList_, 1);
    column->addWidget(Label(Str::QueryFields, fieldList_, part));
    column->addWidget(fieldList_, 2);
    connect(tableList_, &QListWidget::currentTextChanged, this, &NameLists::ChooseTable);
    connect(tableList_, &QListWidget::itemActivated, this, [this] { Q_EMIT tablePicked(table_); });
    connect(fieldList_, &QListWidget::currentTextChanged, this, [this](const QString& field) { field_ = field; });
    connect(fieldList_, &QListWidget::itemActivated, this, [this] { Q_EMIT fieldPicked(table_, field_); });
    return part;
}

QWidget* NameLists::NarrowPart()
{
    auto* part = new QWidget(parts_);
    tableBox_ = Box(Str::QueryTables, part);
    fieldBox_ = Box(Str::QueryFields, part);
    auto* form = new QFormLayout(part);
    form->setContentsMargins({});
    form->setSpacing(spacing::kTight);
    form->setFieldGrowthPolicy(QFormLayout::AllNonFixedFieldsGrow);
    form->addRow(StringText(Str::QueryTables), tableBox_);
    form->addRow(StringText(Str::QueryFields), fieldBox_);
    connect(tableBox_, &QComboBox::textActivated, this, &NameLists::ChooseTable);
    connect(fieldBox_, &QComboBox::activated, this, [this](int entry) {
        if (entry == 0) {
            Q_EMIT tablePicked(table_);
            return;
        }
        field_ = fieldBox_->itemText(entry);
        Q_EMIT fieldPicked(table_, field_);
    });
    return part;
}

void NameLists::ChooseTable(const QString& table)
{
    if (table.isEmpty() || table == table_)
        return;
    table_ = table;
    QStringList fields;
    for (const FieldLists::Field& field : lists_.FieldsOf(table))
        fields += field.name;
    field_ = fields.value(0);
    const QSignalBlocker quiet[] = {QSignalBlocker(tableList_), QSignalBlocker(fieldList_)};
    const auto rows = tableList_->findItems(table, Qt::MatchExactly);
    if (!rows.isEmpty())
        tableList_->setCurrentItem(rows.first());
    fieldList_->clear();
    fieldList_->addItems(fields);
    for (int row = 0; row < fieldList_->count(); ++row)
        fieldList_->item(row)->setSizeHint({0, kLeastRowHeight});
    fieldList_->setCurrentRow(0);
    tableBox_->setCurrentText(table);
    fieldBox_->clear();
    fieldBox_->addItem(ThemeIcon(u"mirel-table"), table);
    fieldBox_->insertSeparator(1);
    fieldBox_->addItems(fields);
    fieldBox_->setCurrentIndex(fields.isEmpty() ? 0 : 2);
}

void NameLists::SetNarrow(bool narrow)
{
    parts_->setCurrentIndex(narrow ? 1 : 0);
    // The part that is hidden asks for no room.
    for (int i = 0; i < parts_->count(); ++i) {
        const auto policy = i == parts_->currentIndex() ? QSizePolicy::Preferred : QSizePolicy::Ignored;
        parts_->widget(i)->setSizePolicy(policy, policy);
    }
    parts_->setSizePolicy(QSizePolicy::Preferred, narrow ? QSizePolicy::Maximum : QSizePolicy::Preferred);
}

} // namespace mirel
