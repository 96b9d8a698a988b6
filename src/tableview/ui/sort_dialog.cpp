#include "tableview/ui/sort_dialog.h"

#include "data/filter_condition.h"
#include "platform/ui/dialog_buttons.h"
#include "resources/string_table.h"
#include "tableview/ui/field_chooser.h"
#include "tableview/ui/pick_box.h"

#include <QDialogButtonBox>
#include <QFormLayout>
#include <QLineEdit>
#include <QVBoxLayout>

namespace mirel {

using namespace Qt::StringLiterals;

CSortDialog::CSortDialog(FieldLists& lists, const QString& table, const QString& field, QWidget* parent)
    : QDialog(parent)
    , terms_(new QLineEdit(this))
{
    setWindowTitle(StringText(Str::SortTitle));
    auto* chooser = new FieldChooser(lists, FieldChooser::Use::ToPick, this);
    chooser->Choose(table, field);
    auto* directions = new PickBox(this);
    directions->addItems({u"ASC"_s, u"DESC"_s});
    QDialogButtonBox* buttons = OkAndCancel(*this);

    auto* form = new QFormLayout;
    form->setFieldGrowthPolicy(QFormLayout::AllNonFixedFieldsGrow);
    form->setRowWrapPolicy(QFormLayout::WrapLongRows);
    form->addRow(StringText(Str::SortOrderBy), terms_);
    form->addRow(chooser);
    form->addRow(StringText(Str::SortDirection), directions);
    auto* column = new QVBoxLayout(this);
    column->addLayout(form);
    column->addStretch(1);
    column->addWidget(buttons);

    connect(chooser, &FieldChooser::fieldPicked, this,
            [this, chooser] { Insert(SortFieldInsertion(terms_->text(), chooser->Table(), chooser->Field())); });
    connect(directions, &QComboBox::textActivated, this,
            [this](const QString& word) { Insert(WordInsertion(terms_->text(), word)); });
    terms_->setFocus();
}

QString CSortDialog::Terms() const
{
    return terms_->text();
}

// As if it were typed at the caret.
void CSortDialog::Insert(const QString& text)
{
    terms_->setFocus();
    terms_->insert(text);
}

} // namespace mirel
