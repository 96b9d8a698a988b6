#include "tableeditor/ui/field_dialog.h"

#include "data/field_names.h"
#include "platform/ui/dialog_buttons.h"
#include "platform/ui/scrolled_page.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QComboBox>
#include <QDialogButtonBox>
#include <QFormLayout>
#include <QLineEdit>
#include <QSpinBox>
#include <QVBoxLayout>

namespace mirel {
namespace {

constexpr int kLargestTyped = 99999; // what is out of range is told, not made impossible to type

// The type that most fields have stands first.
QStringList TypesToChoose()
{
    QString text;
    TypeNameOfField(FieldType::Text, text);
    QStringList names = FieldTypeNames();
    names.removeAll(text);
    names.prepend(text);
    return names;
}

} // namespace

CFieldDialog::CFieldDialog(const QString& title, const FieldDesign& field, Focus focus, Take take, QWidget* parent)
    : QDialog(parent)
    , field_(field)
    , take_(std::move(take))
    , name_(new QLineEdit(field.name, this))
    , type_(new QComboBox(this))
    , size_(new QSpinBox(this))
    , index_(new QComboBox(this))
{
    setWindowTitle(title);
    type_->addItems(TypesToChoose());
    QString type;
    type_->setCurrentIndex(TypeNameOfField(field.type, type) ? type_->findText(type) : -1);
    size_->setRange(0, kLargestTyped);
    size_->setValue(field.size);
    for (const IndexOrder order : {IndexOrder::None, IndexOrder::Ascending, IndexOrder::Descending})
        index_->addItem(WordOfIndexOrder(order));
    index_->setCurrentText(WordOfIndexOrder(field.index));
    LayOut();
    connect(type_, &QComboBox::currentIndexChanged, this, &CFieldDialog::TakeUpType);
    TakeUpType();
    name_->selectAll();
    if (focus == Focus::Name)
        name_->setFocus();
    else
        type_->setFocus();
    FillSmallWindow(*this, *parent->window());
}

void CFieldDialog::LayOut()
{
    auto* page = new QWidget(this);
    auto* form = new QFormLayout(page);
    form->setFieldGrowthPolicy(QFormLayout::AllNonFixedFieldsGrow);
    form->addRow(StringText(Str::DesignFieldName), name_);
    form->addRow(StringText(Str::DesignFieldType), type_);
    form->addRow(StringText(Str::DesignFieldSize), size_);
    form->addRow(StringText(Str::DesignFieldIndexed), index_);
    QDialogButtonBox* buttons = OkAndCancel(*this);
    auto* column = new QVBoxLayout(this);
    column->addWidget(Scrolled(page), 1);
    column->addWidget(buttons);
}

void CFieldDialog::TakeUpType()
{
    size_->setEnabled(FieldTypeOfName(type_->currentText()) == FieldType::Text);
}

FieldDesign CFieldDialog::Field() const
{
    FieldDesign field = field_;
    field.name = name_->text();
    if (type_->currentIndex() >= 0)
        field.type = FieldTypeOfName(type_->currentText());
    field.size = size_->value();
    field.index = IndexOrderOfWord(index_->currentText());
    return field;
}

void CFieldDialog::accept()
{
    if (take_(Field()))
        QDialog::accept();
}

} // namespace mirel
