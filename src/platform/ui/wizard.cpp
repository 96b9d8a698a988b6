#include "platform/ui/wizard.h"

#include "platform/ui/look_roles.h"
#include "platform/ui/scrolled_page.h"
#include "resources/string_table.h"

#include <QCoreApplication>
#include <QLabel>
#include <QPushButton>
#include <QScreen>
#include <QStackedWidget>
#include <QVBoxLayout>

#include <algorithm>

namespace mirel {

Wizard::Wizard(std::span<const WizardStep> steps, QSize firstSize, QWidget* parent)
    : QDialog(parent)
    , steps_(steps)
    , heading_(new QLabel(this))
    , pages_(new QStackedWidget(this))
    , back_(new QPushButton(StringText(Str::WizardBack), this))
    , next_(new QPushButton(this))
{
    LayOut();
    resize(firstSize.boundedTo(screen()->availableSize()));
}

void Wizard::LayOut()
{
    auto* cancel = new QPushButton(QCoreApplication::translate("QPlatformTheme", "Cancel"), this);
    QFont bold = heading_->font();
    bold.setBold(true);
    heading_->setFont(bold);
    heading_->setWordWrap(true);
    auto* buttons = new QHBoxLayout;
    buttons->addWidget(cancel);
    buttons->addStretch(1);
    buttons->addWidget(back_);
    buttons->addWidget(next_);
    auto* column = new QVBoxLayout(this);
    column->addWidget(heading_);
    column->addWidget(pages_, 1);
    column->addLayout(buttons);
    for (QPushButton* button : {cancel, back_, next_}) { // three of them stand side by side on a small screen
        button->setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Fixed);
        button->setMinimumWidth(4 * fontMetrics().height());
    }
    cancel->setMinimumWidth( // it is the longest in some languages
        std::max(cancel->minimumWidth(), fontMetrics().horizontalAdvance(cancel->text()) + spacing::kWide));
    next_->setDefault(true);
    for (QPushButton* button : {cancel, back_})
        button->setAutoDefault(false);
    connect(cancel, &QPushButton::clicked, this, &QDialog::reject);
    connect(back_, &QPushButton::clicked, this, [this] { ShowStep(CurrentStep() - 1); });
    connect(next_, &QPushButton::clicked, this, [this] { GoOn(); });
}

void Wizard::AddPage(QWidget* page)
{
    pages_->addWidget(Scrolled(page));
}

int Wizard::CurrentStep() const
{
    return pages_->currentIndex();
}

void Wizard::ShowStep(int step)
{
    pages_->setCurrentIndex(std::clamp(step, 0, int(steps_.size()) - 1));
    const WizardStep& shown = steps_[size_t(CurrentStep())];
    heading_->setText(StringText(Str::WizardStep, {StringText(shown.title), QString::number(CurrentStep() + 1),
                                                   QString::number(steps_.size())}));
    next_->setText(StringText(shown.goOn));
    back_->setEnabled(CurrentStep() > 0);
}

} // namespace mirel
