#include "tableview/ui/statement_dialog.h"

#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

#include <QClipboard>
#include <QDialogButtonBox>
#include <QGuiApplication>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QVBoxLayout>

namespace mirel {

CStatementDialog::CStatementDialog(const QString& statement, Edit edit, QWidget* parent)
    : QDialog(parent)
{
    setWindowTitle(StringText(Str::StatementTitle));
    auto* text = new QPlainTextEdit(statement, this);
    text->setReadOnly(true);
    text->setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    text->setTabChangesFocus(true);
    text->setAccessibleName(windowTitle());
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Close, this);
    QPushButton* copy = buttons->addButton(StringText(Str::StatementCopy), QDialogButtonBox::ActionRole);
    copy->setIcon(ThemeIcon(u"edit-copy"));
    connect(copy, &QPushButton::clicked, this, [statement] { QGuiApplication::clipboard()->setText(statement); });
    if (edit == Edit::Offered) {
        QPushButton* change = buttons->addButton(StringText(Str::StatementEdit), QDialogButtonBox::ActionRole);
        change->setToolTip(StringText(Str::StatementEditTip));
        connect(change, &QPushButton::clicked, this, &QDialog::accept);
    }
    for (QAbstractButton* button : buttons->buttons()) { // three of them stand side by side on a small screen
        button->setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Fixed);
        button->setMinimumWidth(4 * fontMetrics().height());
    }
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    auto* column = new QVBoxLayout(this);
    column->addWidget(text, 1);
    column->addWidget(buttons);
    const int line = fontMetrics().height();
    resize(line * 30, line * 12);
    FillSmallWindow(*this, *parent->window());
}

} // namespace mirel
