#include "app/ui/view_tabs.h"

#include "resources/string_table.h"

#include <QContextMenuEvent>
#include <QMouseEvent>
#include <QStackedWidget>
#include <QTabBar>
#include <QVBoxLayout>

#include <algorithm>

namespace mirel {
namespace {

constexpr int kWidestTabInCharacters = 28;

// Of any name, however long, as much as leaves room for others.
class NameTabBar : public QTabBar {
public:
    using QTabBar::QTabBar;

protected:
    QSize tabSizeHint(int index) const override
    {
        const QSize hint = QTabBar::tabSizeHint(index);
        return {std::min(hint.width(), fontMetrics().averageCharWidth() * kWidestTabInCharacters), hint.height()};
    }
    QSize minimumTabSizeHint(int index) const override { return tabSizeHint(index); }
};

} // namespace

void FocusView(HostedView& view)
{
    QWidget* last = view.focusWidget();
    (last ? last : &view)->setFocus();
}

ViewTabs::ViewTabs(MakeView make, QWidget* parent)
    : QWidget(parent)
    , make_(std::move(make))
    , bar_(new NameTabBar(this))
    , stack_(new QStackedWidget(this))
{
    bar_->setObjectName(QStringLiteral("views"));
    bar_->setAccessibleName(StringText(Str::OpenViews));
    bar_->setMovable(true);
    bar_->setTabsClosable(true);
    bar_->setDocumentMode(true);
    bar_->setExpanding(false);
    bar_->setElideMode(Qt::ElideMiddle);
    bar_->installEventFilter(this);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins({});
    column->setSpacing(0);
    column->addWidget(bar_);
    column->addWidget(stack_, 1);
    connect(bar_, &QTabBar::currentChanged, this, [this](int tab) {
        if (!changing_ && tab >= 0)
            BringForward(tab);
    });
    connect(bar_, &QTabBar::tabBarClicked, this, [this](int tab) {
        if (tab >= 0 && tab == bar_->currentIndex())
            BringForward(tab);
    });
    connect(bar_, &QTabBar::tabMoved, this, [this](int from, int to) {
        const auto begin = tabs_.begin();
        if (from < to)
            std::rotate(begin + from, begin + from + 1, begin + to + 1);
        else
            std::rotate(begin + to, begin + from, begin + from + 1);
    });
    connect(bar_, &QTabBar::tabCloseRequested, this, [this](int tab) { (void)Close(tab); });
}

void ViewTabs::AddHome(QWidget* page)
{
    stack_->addWidget(page);
}

void ViewTabs::SetBarShown(bool shown)
{
    if (shown == barShown_)
        return;
    barShown_ = shown;
    if (shown && Count() > 0)
        atHome_ = false;
    ShowFront();
}

int ViewTabs::Current() const
{
    return bar_->currentIndex();
}

HostedView* ViewTabs::Front() const
{
    return atHome_ || Current() < 0 ? nullptr : tabs_[size_t(Current())].view.data();
}

QString ViewTabs::TitleAt(int tab) const
{
    const HostedView* view = ViewAt(tab);
    if (!view)
        return KeyAt(tab).name;
    return view->windowTitle().replace(QStringLiteral("[*]"),
                                       view->isWindowModified() ? QStringLiteral("*") : QString());
}

QList<HostedView*> ViewTabs::Views() const
{
    QList<HostedView*> views;
    for (const Tab& tab : tabs_) {
        if (tab.view)
            views += tab.view;
    }
    return views;
}

ViewList ViewTabs::Open() const
{
    ViewList open;
    for (const Tab& tab : tabs_)
        open.views.push_back(tab.key);
    open.front = atHome_ ? -1 : Current();
    return open;
}

void ViewTabs::Insert(int tab, const ViewKey& key, HostedView* view)
{
    changing_ = true;
    tabs_.insert(tabs_.begin() + tab, {key, view});
    bar_->insertTab(tab, QString());
    if (view) {
        stack_->addWidget(view);
        view->installEventFilter(this);
        connect(view, &HostedView::closed, this, [this, view] { Forget(TabOf(view)); });
    }
    ShowTitle(tab);
    changing_ = false;
}

void ViewTabs::Add(HostedView* view, const ViewKey& key)
{
    const int tab = Current() + 1; // beside the one it was opened from
    Insert(tab, key, view);
    BringForward(tab);
}

void ViewTabs::AddWaiting(const ViewList& views)
{
    const int first = Count();
    for (const ViewKey& key : views.views)
        Insert(Count(), key, nullptr);
    if (views.front >= 0)
        BringForward(first + views.front);
    else if (barShown_ && Count() > 0)
        BringForward(std::max(Current(), 0));
    ShowFront();
}

bool ViewTabs::BringForward(const ViewKey& key)
{
    const auto tab = std::ranges::find(tabs_, key, &Tab::key);
    if (tab == tabs_.end())
        return false;
    BringForward(int(tab - tabs_.begin()));
    return true;
}

void ViewTabs::BringForward(int tab)
{
    if (tab < 0 || tab >= Count())
        return;
    if (!tabs_[size_t(tab)].view) {
        HostedView* view = make_(tabs_[size_t(tab)].key);
        if (!view) {
            Remove(tab);
            return;
        }
        const ViewKey key = tabs_[size_t(tab)].key;
        changing_ = true;
        tabs_.erase(tabs_.begin() + tab);
        bar_->removeTab(tab);
        changing_ = false;
        Insert(tab, key, view);
    }
    atHome_ = false;
    changing_ = true;
    bar_->setCurrentIndex(tab);
    changing_ = false;
    ShowFront();
    if (HostedView* view = Front())
        FocusView(*view);
}

void ViewTabs::ShowHome()
{
    atHome_ = true;
    ShowFront();
}

HostedView* ViewTabs::Take(int tab)
{
    HostedView* view = ViewAt(tab);
    if (!view)
        return nullptr;
    view->removeEventFilter(this);
    disconnect(view, nullptr, this, nullptr);
    stack_->removeWidget(view);
    Remove(tab);
    return view;
}

void ViewTabs::Remove(int tab)
{
    changing_ = true;
    tabs_.erase(tabs_.begin() + tab);
    bar_->removeTab(tab);
    changing_ = false;
    if (Count() == 0)
        atHome_ = true;
    else if (!atHome_)
        return BringForward(Current());
    ShowFront();
}

bool ViewTabs::Close(int tab)
{
    if (tab < 0 || tab >= Count())
        return false;
    HostedView* view = ViewAt(tab);
    if (view)
        return view->close();
    Remove(tab);
    if (Count() == 0)
        Q_EMIT lastClosed();
    return true;
}

void ViewTabs::CloseOthers()
{
    const int current = Current();
    for (int tab = Count() - 1; tab >= 0; --tab) {
        if (tab != current && !Close(tab))
            return;
    }
}

void ViewTabs::CloseAll()
{
    atHome_ = true; // so that none comes to the front meanwhile
    for (int tab = Count() - 1; tab >= 0 && Close(tab); --tab) {
    }
    if (barShown_ && Count() > 0)
        atHome_ = false;
    ShowFront();
}

void ViewTabs::Forget(int tab)
{
    if (tab < 0)
        return;
    HostedView* view = tabs_[size_t(tab)].view;
    view->removeEventFilter(this);
    stack_->removeWidget(view);
    Remove(tab);
    if (Count() == 0)
        Q_EMIT lastClosed();
}

int ViewTabs::TabOf(const QObject* view) const
{
    const auto tab = std::ranges::find_if(tabs_, [view](const Tab& each) { return each.view == view; });
    return tab == tabs_.end() ? -1 : int(tab - tabs_.begin());
}

void ViewTabs::Step(int by)
{
    if (Count() > 0)
        BringForward(atHome_ ? Current() : (Current() + by + Count()) % Count());
}

void ViewTabs::ShowFront()
{
    bar_->setVisible(barShown_ && Count() > 0);
    ShowPage();
    Q_EMIT frontChanged();
}

void ViewTabs::ShowPage()
{
    if (HostedView* view = Front())
        return stack_->setCurrentWidget(view);
    const std::function<QWidget*()>& makeHome = barShown_ ? homes_.withBar : homes_.withoutBar;
    if (!isVisible() || !makeHome)
        return;
    stack_->setCurrentWidget(makeHome());
}

void ViewTabs::showEvent(QShowEvent* event)
{
    ShowPage();
    QWidget::showEvent(event);
}

bool ViewTabs::ShowTitle(int tab)
{
    const QString title = TitleAt(tab);
    const QString text = QString(title).replace(u'&', QStringLiteral("&&"));
    if (bar_->tabText(tab) == text)
        return false; // a view says so with every step through its records
    bar_->setTabText(tab, text);
    bar_->setTabToolTip(tab, title.toHtmlEscaped());
    return true;
}

bool ViewTabs::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == bar_) {
        if (event->type() == QEvent::ContextMenu) {
            const auto* menu = static_cast<QContextMenuEvent*>(event);
            const int tab = menu->reason() == QContextMenuEvent::Mouse ? bar_->tabAt(menu->pos()) : Current();
            if (tab < 0)
                return false;
            BringForward(tab);
            Q_EMIT menuRequested(menu->globalPos());
            return true;
        }
        if (event->type() == QEvent::MouseButtonRelease) {
            const auto* mouse = static_cast<QMouseEvent*>(event);
            const int tab = bar_->tabAt(mouse->position().toPoint());
            if (mouse->button() == Qt::MiddleButton && tab >= 0) {
                (void)Close(tab);
                return true;
            }
        }
        return QWidget::eventFilter(watched, event);
    }
    if (event->type() == QEvent::WindowTitleChange || event->type() == QEvent::ModifiedChange) {
        if (const int tab = TabOf(watched); tab >= 0 && ShowTitle(tab) && tab == Current())
            Q_EMIT titleChanged();
    }
    return QWidget::eventFilter(watched, event);
}

} // namespace mirel
