#include "tableview/ui/field_chooser.h"

#include "resources/string_table.h"
#include "tableview/ui/pick_box.h"

#include <QComboBox>
#include <QFormLayout>
#include <QSignalBlocker>

#include <algorithm>

namespace mirel {

FieldChooser::FieldChooser(FieldLists& lists, Use use, QWidget* parent)
    : QWidget(parent)
    , lists_(lists)
    , tables_(new QComboBox(this))
    , fields_(use == Use::ToPick ? new PickBox(this) : new QComboBox(this))
{
    auto* form = new QFormLayout(this);
    form->setContentsMargins({});
    form->setFieldGrowthPolicy(QFormLayout::AllNonFixedFieldsGrow);
    form->addRow(StringText(Str::TablesLabel), tables_);
    form->addRow(StringText(Str::FieldsLabel), fields_);
    for (QComboBox* box : {tables_, fields_}) {
        box->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
        box->setMinimumContentsLength(5);
    }
    tables_->addItems(lists_.Tables());
    ListFields({});
    connect(tables_, &QComboBox::currentTextChanged, this, [this] {
        ListFields({});
        Q_EMIT fieldChanged();
    });
    connect(fields_, &QComboBox::currentTextChanged, this, &FieldChooser::fieldChanged);
    connect(fields_, &QComboBox::activated, this, &FieldChooser::fieldPicked);
}

QString FieldChooser::Table() const
{
    return tables_->currentText();
}

QString FieldChooser::Field() const
{
    return fields_->currentText();
}

void FieldChooser::Choose(const QString& table, const QString& field)
{
    const QSignalBlocker quiet(this);
    tables_->setCurrentIndex(std::max(tables_->findText(table, Qt::MatchFixedString), 0));
    ListFields(field);
}

void FieldChooser::ListFields(const QString& wanted)
{
    const QSignalBlocker quiet(fields_);
    fields_->clear();
    if (Table().isEmpty())
        return;
    for (const FieldLists::Field& field : lists_.FieldsOf(Table()))
        fields_->addItem(field.name);
    fields_->setCurrentIndex(std::max(fields_->findText(wanted, Qt::MatchFixedString), 0));
}

} // namespace mirel
