#include "app/ui/lumo_view.h"

#include "app/ui/compact_tab_bar.h"
#include "app/ui/entry_icon.h"
#include "app/ui/welcome_page.h"
#include "platform/ui/elided_label.h"
#include "platform/ui/entry_list.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"

#include <QDir>
#include <QLabel>
#include <QLineEdit>
#include <QResizeEvent>
#include <QStackedWidget>
#include <QStyle>
#include <QToolButton>
#include <QVBoxLayout>

namespace mirel {
namespace {

constexpr std::array kEntryButtons = {ShellCommand::Open, ShellCommand::New, ShellCommand::Edit,
                                      ShellCommand::Delete};
// What an entry says of itself under its name. A table among tables says nothing.
QString DetailOf(const MainEntry& entry, MainTab tab)
{
    if (entry.missing)
        return StringText(Str::KindMissing);
    if (tab == MainTab::Form || tab == MainTab::Query)
        return entry.table;
    switch (entry.kind) {
    case EntryKind::Table:
        return tab == MainTab::Favorites ? StringText(Str::KindTable) : QString();
    case EntryKind::Form:
        return StringText(Str::KindForm, {entry.table});
    case EntryKind::Query:
        break;
    }
    return StringText(Str::KindQuery, {entry.table});
}

} // namespace

CLumoView::CLumoView(MainViewState& state, ShellActions& actions, QWidget* parent)
    : QWidget(parent)
    , state_(state)
    , actions_(actions)
    , tabs_(new CompactTabBar(this))
    , search_(new QLineEdit(this))
    , pages_(new QStackedWidget(this))
    , list_(new EntryList(this))
    , emptyText_(new QLabel(this))
{
    list_->setObjectName(QStringLiteral("entries"));
    search_->setObjectName(QStringLiteral("search"));
    for (int tab = 0; tab < kMainTabs; ++tab)
        tabs_->addTab(StringText(TabText(MainTab(tab))));
    tabs_->setExpanding(false);
    tabs_->setUsesScrollButtons(false);
    tabs_->setDocumentMode(true);
    tabs_->setDrawBase(false);
    tabs_->setAccessibleName(StringText(Str::SideBarName));
    search_->setPlaceholderText(StringText(Str::SearchEntries));
    search_->setAccessibleName(StringText(Str::SearchEntries));
    search_->setClearButtonEnabled(true);
    search_->addAction(ThemeIcon(u"edit-find"), QLineEdit::LeadingPosition);
    emptyText_->setWordWrap(true);
    emptyText_->setAlignment(Qt::AlignCenter);
    emptyText_->setForegroundRole(QPalette::PlaceholderText);
    emptyText_->setTextFormat(Qt::PlainText);
    pages_->addWidget(list_);
    pages_->addWidget(emptyText_);

    header_ = MakeHeader();
    buttonRow_ = MakeButtons();
    auto* lines = new QVBoxLayout(this);
    const int gap = style()->pixelMetric(QStyle::PM_LayoutVerticalSpacing, nullptr, this) / 2;
    lines->setContentsMargins(gap, gap, gap, gap);
    lines->setSpacing(gap);
    lines->addWidget(header_);
    lines->addWidget(tabs_);
    lines->addWidget(search_);
    lines->addWidget(pages_, 1);
    lines->addWidget(buttonRow_);
    Connect();
    ShowState();
}

QWidget* CLumoView::MakeHeader()
{
    auto* header = new QWidget(this);
    databaseIcon_ = new QLabel(header);
    databaseLine_ = new ElidedLabel(header);
    QFont font = databaseLine_->font();
    font.setBold(true);
    databaseLine_->setFont(font);
    databaseLine_->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Preferred);
    auto* line = new QHBoxLayout(header);
    line->setContentsMargins({});
    line->addWidget(databaseIcon_);
    line->addWidget(databaseLine_, 1);
    return header;
}

QWidget* CLumoView::MakeButtons()
{
    auto* row = new QWidget(this);
    auto* line = new QHBoxLayout(row);
    line->setContentsMargins({});
    line->setSpacing(style()->pixelMetric(QStyle::PM_LayoutHorizontalSpacing, nullptr, this) / 2);
    for (const ShellCommand id : kEntryButtons) {
        auto* button = new QToolButton(row);
        button->setDefaultAction(actions_.Of(id));
        button->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
        button->setFocusPolicy(Qt::StrongFocus);
        button->setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Fixed);
        line->addWidget(button);
        buttons_.push_back(button);
    }
    line->addStretch();
    return row;
}

void CLumoView::Connect()
{
    connect(tabs_, &QTabBar::currentChanged, this, [this](int tab) {
        state_.SetTab(MainTab(tab));
        ShowState();
    });
    connect(search_, &QLineEdit::textEdited, this, [this](const QString& text) {
        state_.SetSearch(text);
        ShowList();
    });
    connect(list_, &EntryList::RowChanged, this, [this](int row) {
        if (row >= 0)
            state_.Select(state_.ShownEntries()[size_t(row)]);
        actions_.Follow(state_);
    });
    connect(list_, &EntryList::Tapped, this, [this](int, Tap tap) {
        if (state_.OpensOn(tap))
            actions_.Of(ShellCommand::Open)->trigger();
    });
    connect(list_, &EntryList::EnterPressed, this, [this] { actions_.Of(ShellCommand::Open)->trigger(); });
    actions_.OfferEntryMenu(*list_, state_);
    for (QAction* action : actions_.OfEntries())
        addAction(action); // their keys work while the view has the focus
}

void CLumoView::ShowState()
{
    const bool open = state_.HasDatabase();
    const int iconSize = style()->pixelMetric(QStyle::PM_SmallIconSize, nullptr, this);
    databaseIcon_->setPixmap(
        ThemeIcon(u"mirel-database").pixmap(iconSize, open ? QIcon::Normal : QIcon::Disabled));
    databaseLine_->SetText(open ? state_.DatabaseName() : StringText(Str::NoDatabase));
    databaseLine_->setToolTip(QDir::toNativeSeparators(state_.DatabasePath()));
    {
        const QSignalBlocker quiet(tabs_); // changing the tab by hand ends the search
        tabs_->setCurrentIndex(int(state_.Tab()));
    }
    search_->setVisible(state_.OffersSearch() || !state_.Search().isEmpty());
    if (search_->text() != state_.Search())
        search_->setText(state_.Search());
    list_->setAccessibleName(StringText(Str::EntriesOf, {StringText(TabText(state_.Tab())).remove(u'&')}));
    ShowList();
    FitButtons();
}

void CLumoView::ShowRecent(const QStringList& paths)
{
    recent_ = paths;
    if (welcome_)
        welcome_->SetRecent(paths);
}

WelcomePage& CLumoView::Welcome()
{
    if (!welcome_) {
        welcome_ = new WelcomePage(actions_, this);
        welcome_->SetRecent(recent_);
        pages_->addWidget(welcome_);
        connect(welcome_, &WelcomePage::RecentChosen, this, &CLumoView::RecentChosen);
    }
    return *welcome_;
}

void CLumoView::SetLook(const ViewLook& look)
{
    // The tabs stay as they are: all four must fit.
    for (QWidget* part : {header_, static_cast<QWidget*>(list_), static_cast<QWidget*>(emptyText_), buttonRow_})
        part->setFont(look.font.value_or(QFont()));
    DrawAsLine(*header_, look.line);
    DrawAsList(*list_, look.lists);
    DrawAsButtons(*buttonRow_, look.buttons);
    FitButtons();
}

void CLumoView::ShowList()
{
    list_->SetLines(Lines());
    list_->SetRow(state_.SelectedRow());
    setFocusProxy(list_);
    if (!state_.HasDatabase()) {
        pages_->setCurrentWidget(&Welcome());
        setFocusProxy(welcome_);
    } else if (!state_.ShownEntries().empty()) {
        pages_->setCurrentWidget(list_);
    } else {
        emptyText_->setText(state_.Search().isEmpty() ? StringText(EmptyListText(state_.Tab()))
                                                      : StringText(Str::NothingFound, {state_.Search()}));
        pages_->setCurrentWidget(emptyText_);
    }
    // One way each: off the list on the favorites, deleted on the other tabs.
    const bool favorites = state_.Tab() == MainTab::Favorites;
    buttons_.back()->setDefaultAction(
        actions_.Of(favorites ? ShellCommand::RemoveFavorites : ShellCommand::Delete));
    FitButtons();
    actions_.Follow(state_);
}

std::vector<EntryLine> CLumoView::Lines() const
{
    std::vector<EntryLine> lines;
    for (const MainEntry& entry : state_.ShownEntries()) {
        lines.push_back({.name = entry.name,
                         .detail = DetailOf(entry, state_.Tab()),
                         .toolTip = entry.name.toHtmlEscaped(),
                         .icon = IconOf(entry.kind),
                         .dimmed = entry.missing});
    }
    return lines;
}

void CLumoView::FitButtons()
{
    // The names stay while they fit; below that the icons stand alone, and the tool tips name them.
    int named = 0;
    for (QToolButton* button : buttons_) {
        button->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
        named += button->sizeHint().width() + buttonRow_->layout()->spacing();
    }
    if (named > contentsRect().width() - layout()->contentsMargins().left() * 2) {
        for (QToolButton* button : buttons_)
            button->setToolButtonStyle(Qt::ToolButtonIconOnly);
    }
}

void CLumoView::resizeEvent(QResizeEvent* event)
{
    QWidget::resizeEvent(event);
    FitButtons();
}

} // namespace mirel
