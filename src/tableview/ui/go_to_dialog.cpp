#include "tableview/ui/go_to_dialog.h"

#include "platform/ui/dialog_buttons.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QDialogButtonBox>
#include <QLineEdit>
#include <QRadioButton>
#include <QRegularExpressionValidator>
#include <QVBoxLayout>

#include <algorithm>

namespace mirel {

CGoToDialog::CGoToDialog(qint64 record, QWidget* parent)
    : QDialog(parent)
    , number_(new QLineEdit(QString::number(record), this))
{
    setWindowTitle(StringText(Str::GoTitle));
    auto* column = new QVBoxLayout(this);
    auto* first = new QHBoxLayout;
    column->addLayout(first);
    first->addWidget(AddChoice(StringText(Str::GoToRecordChoice)));
    first->addWidget(number_, 1);
    for (const Str text :
         {Str::GoToFirstChoice, Str::GoToLastChoice, Str::GoToPreviousChoice, Str::GoToNextChoice})
        column->addWidget(AddChoice(StringText(text)));
    QDialogButtonBox* buttons = OkAndCancel(*this);
    column->addStretch(1);
    column->addWidget(buttons);

    static const QRegularExpression digits(QStringLiteral("\\d{0,18}"));
    number_->setValidator(new QRegularExpressionValidator(digits, number_));
    number_->setInputMethodHints(Qt::ImhDigitsOnly);
    number_->setAccessibleName(choices_.front()->text());
    connect(number_, &QLineEdit::textEdited, choices_.front(), [this] { choices_.front()->setChecked(true); });
    connect(choices_.front(), &QRadioButton::clicked, number_, [this] { number_->setFocus(); });
    choices_.front()->setChecked(true);
    number_->setFocus();
    number_->selectAll();
    FillSmallWindow(*this, *parent->window());
}

QRadioButton* CGoToDialog::AddChoice(const QString& text)
{
    choices_ += new QRadioButton(text, this);
    return choices_.back();
}

CGoToDialog::Choice CGoToDialog::Chosen() const
{
    const auto at = std::ranges::find_if(choices_, &QRadioButton::isChecked);
    return Choice(at - choices_.begin());
}

qint64 CGoToDialog::Number() const
{
    return number_->text().toLongLong();
}

} // namespace mirel
