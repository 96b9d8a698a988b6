#include "app/ui/side_bar.h"

#include "app/ui/entry_icon.h"
#include "app/ui/side_tree.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

#include <QKeyEvent>
#include <QLineEdit>
#include <QVBoxLayout>

#include <algorithm>

namespace mirel {
namespace {

// At the right of an entry: what it was made for; of a favorite, its kind.
QString DetailOf(MainTab tab, const MainEntry& entry)
{
    if (entry.missing)
        return StringText(Str::FavoriteGone);
    if (tab != MainTab::Favorites)
        return entry.table;
    switch (entry.kind) {
    case EntryKind::Table:
        return StringText(Str::FavoriteTable);
    case EntryKind::Form:
        return StringText(Str::FavoriteForm);
    case EntryKind::Query:
        break;
    }
    return StringText(Str::FavoriteQuery);
}

MainTab SectionOf(const QTreeWidgetItem& item)
{
    const QTreeWidgetItem* heading = item.parent() ? item.parent() : &item;
    return MainTab(heading->treeWidget()->indexOfTopLevelItem(const_cast<QTreeWidgetItem*>(heading)));
}

} // namespace

SideBar::SideBar(MainViewState& state, ShellActions& actions, QWidget* parent)
    : QWidget(parent)
    , state_(state)
    , actions_(actions)
    , search_(new QLineEdit(this))
    , tree_(new SideTree(this))
{
    search_->setObjectName(QStringLiteral("sideBarSearch"));
    search_->setPlaceholderText(StringText(Str::SideBarSearch));
    search_->setAccessibleName(StringText(Str::SideBarSearch));
    search_->setClearButtonEnabled(true);
    tree_->setAccessibleName(StringText(Str::SideBarName));
    auto* lines = new QVBoxLayout(this);
    lines->setContentsMargins({});
    auto* top = new QVBoxLayout;
    top->setContentsMargins(8, 8, 8, 0);
    top->addWidget(search_);
    lines->addLayout(top);
    lines->addWidget(tree_, 1);
    setFocusProxy(tree_);
    Connect();
    ShowState();
}

void SideBar::Connect()
{
    connect(search_, &QLineEdit::textChanged, this, [this](const QString& text) {
        if (showing_)
            return;
        state_.SetSearch(text);
        ShowState();
    });
    connect(tree_, &QTreeWidget::currentItemChanged, this, [this](const QTreeWidgetItem* item) {
        if (!showing_ && item)
            TakeSelection(item);
    });
    connect(tree_, &SideTree::Tapped, this, [this](const QTreeWidgetItem* item, Tap tap) {
        TakeSelection(item);
        if (!SideTree::IsHeading(*item) && state_.OpensOn(tap))
            actions_.Of(ShellCommand::Open)->trigger();
    });
    connect(tree_, &SideTree::EnterPressed, this, [this] { actions_.Of(ShellCommand::Open)->trigger(); });
    actions_.OfferEntryMenu(*tree_, state_);
    search_->installEventFilter(this);
    for (QAction* action : actions_.OfEntries())
        tree_->addAction(action); // their keys
}

void SideBar::ShowState()
{
    showing_ = true;
    setEnabled(state_.HasDatabase());
    if (search_->text() != state_.Search())
        search_->setText(state_.Search());
    Fill();
    ShowSelection();
    showing_ = false;
    actions_.Follow(state_);
}

void SideBar::Fill()
{
    const QString search = state_.Search();
    std::array<std::vector<MainEntry>, kMainTabs> entries;
    for (int tab = 0; tab < kMainTabs; ++tab)
        entries[size_t(tab)] = state_.EntriesWith(MainTab(tab), search);
    if (filled_ && entries == shown_ && search == shownSearch_)
        return;
    std::array<bool, kMainTabs> folded{};
    for (int tab = 0; filled_ && search.isEmpty() && tab < kMainTabs; ++tab)
        folded[size_t(tab)] = !tree_->topLevelItem(tab)->isExpanded();
    shown_ = std::move(entries);
    shownSearch_ = search;
    tree_->clear();
    for (int tab = 0; tab < kMainTabs; ++tab) {
        const std::vector<MainEntry>& section = shown_[size_t(tab)];
        auto* heading = new QTreeWidgetItem(tree_, {StringText(SectionText(MainTab(tab)))});
        heading->setData(0, SideTree::DetailRole, QString::number(section.size()));
        heading->setData(0, Qt::AccessibleDescriptionRole, QString::number(section.size()));
        QList<QTreeWidgetItem*> items;
        for (const MainEntry& entry : section) {
            const QString detail = DetailOf(MainTab(tab), entry);
            auto* item = new QTreeWidgetItem({entry.name});
            item->setIcon(0, ThemeIcon(MainTab(tab) == MainTab::Favorites ? QStringView(u"mirel-favorite")
                                                                          : IconOf(entry.kind)));
            item->setToolTip(0, entry.name.toHtmlEscaped());
            item->setData(0, SideTree::DetailRole, detail);
            item->setData(0, Qt::AccessibleDescriptionRole, detail);
            item->setData(0, SideTree::DimmedRole, entry.missing);
            items += item;
        }
        heading->addChildren(items);
        heading->setExpanded(!folded[size_t(tab)]);
    }
    filled_ = true;
}

void SideBar::ShowSelection()
{
    QTreeWidgetItem* heading = tree_->topLevelItem(int(state_.Tab()));
    const std::vector<MainEntry>& section = shown_[size_t(state_.Tab())];
    const std::optional<MainEntry> selected = state_.Selected();
    const auto row = selected ? std::ranges::find(section, *selected) : section.end();
    QTreeWidgetItem* item = row == section.end() ? heading : heading->child(int(row - section.begin()));
    if (item != tree_->currentItem())
        tree_->setCurrentItem(item);
}

void SideBar::TakeSelection(const QTreeWidgetItem* item)
{
    const MainTab tab = SectionOf(*item);
    state_.SetSection(tab);
    if (SideTree::IsHeading(*item))
        state_.SelectNothing();
    else
        state_.Select(
            shown_[size_t(tab)][size_t(item->parent()->indexOfChild(const_cast<QTreeWidgetItem*>(item)))]);
    actions_.Follow(state_);
    Q_EMIT selectionChanged();
}

void SideBar::SetLook(const ViewLook& look)
{
    tree_->setFont(look.font.value_or(QFont()));
    DrawAsList(*tree_, look.lists);
    tree_->viewport()->setBackgroundRole(look.lists.background ? QPalette::Base : QPalette::Window);
}

bool SideBar::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == search_ && event->type() == QEvent::KeyPress) {
        const int key = static_cast<QKeyEvent*>(event)->key();
        if (key == Qt::Key_Down)
            tree_->setFocus();
        if (key == Qt::Key_Escape)
            search_->clear();
        if (key == Qt::Key_Down || key == Qt::Key_Escape)
            return true;
    }
    return QWidget::eventFilter(watched, event);
}

} // namespace mirel
