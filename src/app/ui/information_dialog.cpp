#include "app/ui/information_dialog.h"

#include "platform/ui/elided_label.h"
#include "platform/ui/look_roles.h"
#include "platform/ui/scrolled_page.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"

#include <QGridLayout>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace mirel {
namespace {

constexpr int kCountSliceMs = 8;
constexpr int kFirstColumns = 56; // characters of the dialog's first width

} // namespace

CInformationDialog::CInformationDialog(DatabaseSession& session, Actions actions, QWidget* parent)
    : QDialog(parent)
    , facts_(session)
    , result_(new QLabel(this))
    , buttons_(new QGridLayout)
    , columns_(IsHandheldSize(parent->window()->size()) ? 2 : 4)
{
    setWindowTitle(StringText(Str::InformationTitle));
    result_->setWordWrap(true);
    result_->setTextFormat(Qt::PlainText);
    result_->hide();
    AddButton(Str::CommandBackUp, Str::TipBackUp, true, actions.backUp);
    AddButton(Str::CommandCompact, Str::TipCompact, false, actions.compact);
    AddButton(Str::CommandCheck, Str::TipCheck, false, actions.check);
    auto* close = new QPushButton(StringText(Str::ActionClose), this);
    close->setToolTip(StringText(Str::ActionCloseTip));
    close->setDefault(true);
    connect(close, &QPushButton::clicked, this, &QDialog::accept);
    buttons_->addWidget(close, buttons_->count() / columns_, buttons_->count() % columns_);
    facts_.Look();
    LayOut();
    connect(&countTimer_, &QTimer::timeout, this, [this] {
        facts_.CountOn(kCountSliceMs);
        ShowFacts();
    });
    ShowFacts();
    resize(fontMetrics().averageCharWidth() * kFirstColumns, sizeHint().height());
    FillSmallWindow(*this, *parent->window());
    close->setFocus();
}

void CInformationDialog::AddButton(Str text, Str tip, bool asks, const std::function<QString()>& action)
{
    auto* button = new QPushButton(asks ? StringText(text) + u'…' : StringText(text), this);
    button->setToolTip(StringText(tip));
    buttons_->addWidget(button, buttons_->count() / columns_, buttons_->count() % columns_);
    connect(button, &QPushButton::clicked, this, [this, action] {
        countTimer_.stop();
        facts_.StopCounting(); // a table that is read would be in the way
        const QString line = action();
        result_->setText(line);
        result_->setVisible(!line.isEmpty());
        Look();
    });
}

void CInformationDialog::LayOut()
{
    auto* page = new QWidget(this);
    auto* grid = new QGridLayout(page);
    grid->setContentsMargins({});
    grid->setHorizontalSpacing(spacing::kRoom);
    grid->setColumnStretch(1, 1);
    int row = 0;
    for (const DatabaseFacts::Fact& fact : facts_.Facts()) {
        auto* label = new QLabel(StringText(fact.label), page);
        label->setForegroundRole(QPalette::PlaceholderText);
        auto* value = new ElidedLabel(page);
        value->setAccessibleName(StringText(fact.label));
        grid->addWidget(label, row, 0);
        grid->addWidget(value, row++, 1);
        values_.push_back(value);
    }
    grid->setRowStretch(row, 1);
    auto* column = new QVBoxLayout(this);
    column->addWidget(Scrolled(page), 1);
    column->addWidget(result_);
    column->addLayout(buttons_);
}

void CInformationDialog::Look()
{
    facts_.Look();
    ShowFacts();
}

void CInformationDialog::ShowFacts()
{
    const std::vector<DatabaseFacts::Fact> facts = facts_.Facts();
    for (size_t i = 0; i < facts.size(); ++i) {
        values_[i]->SetText(facts[i].value);
        values_[i]->setToolTip(facts[i].value.toHtmlEscaped());
    }
    facts_.IsCounting() ? countTimer_.start(0) : countTimer_.stop();
}

} // namespace mirel
