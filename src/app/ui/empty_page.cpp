#include "app/ui/empty_page.h"

#include "app/ui/welcome_page.h"
#include "resources/string_table.h"

#include <QLabel>
#include <QToolButton>
#include <QVBoxLayout>

namespace mirel {

EmptyPage::EmptyPage(const ShellActions& actions, QWidget* parent)
    : QStackedWidget(parent)
    , actions_(actions)
    , offers_(new QWidget(this))
    , hint_(new QLabel(offers_))
{
    hint_->setWordWrap(true);
    hint_->setAlignment(Qt::AlignCenter);
    hint_->setForegroundRole(QPalette::PlaceholderText);
    hint_->setTextFormat(Qt::PlainText);
    auto* row = new QHBoxLayout;
    row->addStretch();
    for (const ShellCommand id : {ShellCommand::Open, ShellCommand::New, ShellCommand::ImportCsv}) {
        auto* button = new QToolButton(offers_);
        button->setDefaultAction(actions.Of(id));
        button->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
        button->setFocusPolicy(Qt::StrongFocus);
        row->addWidget(button);
        buttons_.push_back(button);
    }
    row->addStretch();
    auto* column = new QVBoxLayout(offers_);
    column->addStretch();
    column->addWidget(hint_);
    column->addLayout(row);
    column->addStretch();
    addWidget(offers_);
    // What cannot be done now is not offered.
    connect(&actions, &ShellActions::followed, this, [this] {
        for (QToolButton* button : buttons_)
            button->setVisible(button->defaultAction()->isEnabled());
    });
}

WelcomePage& EmptyPage::Welcome()
{
    if (!welcome_) {
        welcome_ = new WelcomePage(actions_, this);
        addWidget(welcome_);
        connect(welcome_, &WelcomePage::RecentChosen, this, &EmptyPage::RecentChosen);
    }
    return *welcome_;
}

void EmptyPage::Show(const MainViewState& state, const QStringList& recent)
{
    if (!state.HasDatabase()) {
        Welcome().SetRecent(recent);
        return setCurrentWidget(welcome_);
    }
    const bool isEmpty = state.Entries(MainTab::Table).empty();
    hint_->setText(StringText(isEmpty ? Str::EmptyDatabaseHint : Str::EmptyTabsHint));
    setCurrentWidget(offers_);
}

} // namespace mirel
