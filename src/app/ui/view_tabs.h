#pragma once

#include "app/view_list.h"
#include "platform/ui/hosted_view.h"

#include <QPointer>

#include <functional>

class QStackedWidget;
class QTabBar;

namespace mirel {

// The views that are open in the main window: a bar of tabs, and below it the view in front; or, where no view is
// in front, the home page. A view closes its tab by closing itself.
//
// Tabs count from 0. A tab can wait: its view is made when it first comes to the front.
class ViewTabs : public QWidget {
    Q_OBJECT
public:
    // Makes a view for a tab that waited; null: it cannot be opened, and the tab goes.
    using MakeView = std::function<HostedView*(const ViewKey&)>;

    ViewTabs(MakeView make, QWidget* parent);

    // What shows when no view is in front: one page while the bar is there, another one where it is not. A page is
    // asked for whenever it comes to show, so that none is made that nobody sees.
    struct Homes {
        std::function<QWidget*()> withBar;
        std::function<QWidget*()> withoutBar;
    };
    void SetHomes(Homes homes) { homes_ = std::move(homes); }
    void AddHome(QWidget* page); // one that has just been made
    // Without the bar the home page can be in front of the views.
    void SetBarShown(bool shown);
    bool IsBarShown() const { return barShown_; }

    void Add(HostedView* view, const ViewKey& key); // and brings it forward
    void AddWaiting(const ViewList& views);         // and brings the one in front forward
    // Brings the view of that key forward; false: it has none.
    bool BringForward(const ViewKey& key);
    void BringForward(int tab);
    void ShowHome();
    // The view of that tab leaves without being closed.
    HostedView* Take(int tab);
    void Remove(int tab); // a waiting one

    int Count() const { return int(tabs_.size()); }
    int Current() const;
    HostedView* Front() const; // null: the home page is in front
    HostedView* ViewAt(int tab) const { return tabs_[size_t(tab)].view; }
    void SetNameAt(int tab, const QString& name) { tabs_[size_t(tab)].key.name = name; }
    const ViewKey& KeyAt(int tab) const { return tabs_[size_t(tab)].key; }
    QString TitleAt(int tab) const;
    QList<HostedView*> Views() const;
    ViewList Open() const;

    void GoToNext() { Step(1); }
    void GoToPrevious() { Step(-1); }
    bool Close(int tab);
    void CloseCurrent() { (void)Close(Current()); }
    void CloseOthers();
    void CloseAll(); // without opening those that wait

Q_SIGNALS:
    void frontChanged();
    void titleChanged(); // of the view in front
    void lastClosed();
    void menuRequested(const QPoint& globalPosition); // on the current tab

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    void showEvent(QShowEvent* event) override;

private:
    struct Tab {
        ViewKey key;
        QPointer<HostedView> view; // null while it waits
    };
    void Insert(int tab, const ViewKey& key, HostedView* view);
    int TabOf(const QObject* view) const;
    void Step(int by);
    void ShowFront();
    void ShowPage();
    bool ShowTitle(int tab); // true: it is another one
    void Forget(int tab);

    MakeView make_;
    QTabBar* bar_;
    QStackedWidget* stack_;
    Homes homes_;
    std::vector<Tab> tabs_; // in the order of the bar
    bool barShown_ = true;
    bool atHome_ = true; // while the bar is not there
    bool changing_ = false;
};

// Gives a view the focus, where it was in it last.
void FocusView(HostedView& view);

} // namespace mirel
