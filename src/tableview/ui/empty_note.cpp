#include "tableview/ui/empty_note.h"

#include "platform/ui/look_roles.h"
#include "resources/string_table.h"

#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace mirel {

EmptyNote::EmptyNote(QWidget* parent)
    : QWidget(parent)
    , text_(new QLabel(this))
    , button_(new QPushButton(this))
{
    text_->setForegroundRole(QPalette::PlaceholderText);
    text_->setAlignment(Qt::AlignCenter);
    text_->setWordWrap(true);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(spacing::kRoom, spacing::kSection, spacing::kRoom, spacing::kRoom);
    column->setSpacing(spacing::kRoom);
    column->addWidget(text_);
    column->addWidget(button_, 0, Qt::AlignHCenter);
    column->addStretch(1);
    connect(button_, &QPushButton::clicked, this, [this] {
        if (offered_)
            Q_EMIT commandRequested(*offered_);
    });
    hide();
}

void EmptyNote::Show(const QString& text, std::optional<TableCommand> offered)
{
    text_->setText(text);
    offered_ = offered;
    button_->setVisible(offered.has_value());
    if (offered)
        button_->setText(
            StringText(*offered == TableCommand::RemoveFilter ? Str::ActionRemoveFilter : Str::ActionNewRecord));
    show();
}

} // namespace mirel
