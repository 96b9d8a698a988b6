#include "csvimport/ui/destination_page.h"

#include "resources/string_table.h"
#include "tableeditor/table_design.h"

#include <QLineEdit>
#include <QListWidget>
#include <QRadioButton>
#include <QVBoxLayout>

namespace mirel {

using Destination = ImportDraft::Destination;

ImportDestinationPage::ImportDestinationPage(ImportDraft& draft, UserPrompt& prompt, QWidget* parent)
    : ImportPage(parent)
    , draft_(draft)
    , prompt_(prompt)
    , new_(new QRadioButton(StringText(Str::ImportNewTable), this))
    , name_(new QLineEdit(this))
    , existing_(new QRadioButton(StringText(Str::ImportExistingTable), this))
    , tables_(new QListWidget(this))
{
    name_->setMaxLength(int(kMaxNewTableName));
    name_->setAccessibleName(StringText(Str::ImportNewTableName));
    tables_->setAccessibleName(StringText(Str::ImportTables));
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins({});
    column->addWidget(new_);
    column->addWidget(name_);
    column->addWidget(existing_);
    column->addWidget(tables_, 1);
    connect(new_, &QRadioButton::toggled, this, &ImportDestinationPage::Follow);
    connect(name_, &QLineEdit::textEdited, this, [this](const QString& name) {
        draft_.SetNewTable(name);
        new_->setChecked(true);
    });
    connect(tables_, &QListWidget::itemSelectionChanged, this, &ImportDestinationPage::Follow);
    connect(tables_, &QListWidget::itemClicked, this, [this] { existing_->setChecked(true); });
}

void ImportDestinationPage::Enter()
{
    const bool isNew = draft_.DestinationKind() == Destination::NewTable;
    showing_ = true;
    name_->setText(draft_.NewTable());
    tables_->clear();
    tables_->addItems(draft_.Tables());
    existing_->setEnabled(tables_->count() > 0);
    const QList<QListWidgetItem*> chosen = tables_->findItems(draft_.ExistingTable(), Qt::MatchExactly);
    tables_->setCurrentItem(chosen.isEmpty() ? nullptr : chosen.first());
    (isNew ? new_ : existing_)->setChecked(true);
    showing_ = false;
    Follow();
    if (isNew) {
        name_->setFocus();
        name_->selectAll();
    } else {
        tables_->setFocus();
    }
}

void ImportDestinationPage::Follow()
{
    if (showing_)
        return;
    draft_.SetDestination(new_->isChecked() ? Destination::NewTable : Destination::ExistingTable);
    // The list makes an entry the current one when it gets the focus; only a selected one was chosen.
    const QList<QListWidgetItem*> selected = tables_->selectedItems();
    if (existing_->isChecked())
        draft_.SetExistingTable(selected.isEmpty() ? QString() : selected.first()->text());
}

bool ImportDestinationPage::MayLeave()
{
    if (const std::optional<UserMessage> fault = draft_.FaultOfDestination()) {
        prompt_.Show(*fault);
        (new_->isChecked() ? static_cast<QWidget*>(name_) : tables_)->setFocus();
        return false;
    }
    return draft_.MakeColumns();
}

} // namespace mirel
