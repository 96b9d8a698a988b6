#include "app/ui/welcome_page.h"

#include "platform/ui/entry_list.h"
#include "resources/string_table.h"

#include <QDir>
#include <QFileInfo>
#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace mirel {
namespace {

constexpr int kWidthInCharacters = 46; // wider, a column of buttons looks lost

// Without the command's mnemonic, which the buttons under the lists bear as well.
QPushButton* WayIn(QAction* action, QWidget* parent)
{
    auto* button = new QPushButton(action->icon(), action->text().remove(u'&'), parent);
    button->setToolTip(action->statusTip());
    button->setAutoDefault(true); // Enter presses it, not the space bar alone
    QObject::connect(button, &QPushButton::clicked, action, &QAction::trigger);
    return button;
}

QLabel* Heading(Str text, QWidget* parent)
{
    auto* label = new QLabel(StringText(text), parent);
    QFont font = label->font();
    font.setBold(true);
    label->setFont(font);
    return label;
}

} // namespace

WelcomePage::WelcomePage(const ShellActions& actions, QWidget* parent)
    : QScrollArea(parent)
{
    auto* page = new QWidget(this);
    auto* column = new QWidget(page);
    column->setMaximumWidth(fontMetrics().averageCharWidth() * kWidthInCharacters);
    auto* lines = new QVBoxLayout(column);
    auto* hint = new QLabel(StringText(Str::WelcomeHint), column);
    hint->setWordWrap(true);
    hint->setMinimumHeight(1); // or the page would have room for the hint at its narrowest
    lines->addWidget(hint);
    for (const ShellCommand id : {ShellCommand::OpenDatabase, ShellCommand::NewDatabase, ShellCommand::OpenSample})
        lines->addWidget(WayIn(actions.Of(id), column));
    recentHeading_ = Heading(Str::RecentHeading, column);
    lines->addWidget(recentHeading_);
    recentList_ = new EntryList(column);
    recentList_->setAccessibleName(StringText(Str::RecentHeading));
    recentList_->setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    lines->addWidget(recentList_);
    lines->addStretch();

    auto* centred = new QHBoxLayout(page);
    centred->setContentsMargins({});
    centred->addStretch(1);
    centred->addWidget(column, 1000);
    centred->addStretch(1);
    setWidget(page);
    setWidgetResizable(true);
    setFrameShape(NoFrame);
    setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    setFocusProxy(column->findChild<QPushButton*>());

    // Going back to a database is one tap, whatever opens the entries of the lists: nothing is edited here.
    connect(recentList_, &EntryList::Tapped, this, [this](int row, Tap tap) {
        if (tap == Tap::Single)
            Q_EMIT RecentChosen(recent_[row]);
    });
    connect(recentList_, &EntryList::EnterPressed, this, [this](int row) { Q_EMIT RecentChosen(recent_[row]); });
}

void WelcomePage::SetRecent(const QStringList& paths)
{
    recent_ = paths;
    std::vector<EntryLine> lines;
    for (const QString& path : paths) {
        const QFileInfo file(path);
        lines.push_back({.name = file.fileName(),
                         .detail = QDir::toNativeSeparators(file.path()),
                         .toolTip = QDir::toNativeSeparators(path),
                         .icon = u"mirel-database"});
    }
    recentList_->SetLines(std::move(lines));
    recentList_->setFixedHeight(recentList_->HeightOfAll());
    recentList_->setVisible(!paths.isEmpty());
    recentHeading_->setVisible(!paths.isEmpty());
}

} // namespace mirel
