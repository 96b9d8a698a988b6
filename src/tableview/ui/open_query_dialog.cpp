#include "tableview/ui/open_query_dialog.h"

#include "platform/ui/dialog_buttons.h"
#include "resources/string_table.h"

#include <QDialogButtonBox>
#include <QLabel>
#include <QListWidget>
#include <QVBoxLayout>

namespace mirel {

COpenQueryDialog::COpenQueryDialog(const QStringList& names, QWidget* parent)
    : QDialog(parent)
    , list_(new QListWidget(this))
{
    setWindowTitle(StringText(Str::OpenQueryTitle));
    list_->addItems(names);
    for (int row = 0; row < list_->count(); ++row)
        list_->item(row)->setToolTip(names[row].toHtmlEscaped());
    list_->setCurrentRow(0);
    list_->setTextElideMode(Qt::ElideMiddle);
    list_->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    list_->setAccessibleName(StringText(Str::OpenQueryPrompt).remove(u'&'));
    auto* label = new QLabel(StringText(Str::OpenQueryPrompt), this);
    label->setBuddy(list_);
    label->setWordWrap(true);
    QDialogButtonBox* buttons = OkAndCancel(*this);
    auto* column = new QVBoxLayout(this);
    column->addWidget(label);
    column->addWidget(list_, 1);
    column->addWidget(buttons);
    connect(list_, &QListWidget::itemActivated, this, &QDialog::accept);
    list_->setFocus();
}

QString COpenQueryDialog::Chosen() const
{
    return list_->currentItem() ? list_->currentItem()->text() : QString();
}

} // namespace mirel
