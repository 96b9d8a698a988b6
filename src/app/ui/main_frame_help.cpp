#include "app/ui/lumo_view.h"
#include "app/ui/main_frame.h"
#include "app/ui/side_bar.h"
#include "app/ui/tour.h"
#include "app/ui/view_tabs.h"
#include "help/ui/help_window.h"
#include "resources/string_table.h"

#include <QMenuBar>

// What the main window does with the help and the tour.

namespace mirel {

void CMainFrame::ShowHelpOfFront()
{
    const HostedView* front = tabs_->Front();
    ShowHelp(*this, HelpTopicOf(front ? *static_cast<const QWidget*>(front) : *this));
}

void CMainFrame::ShowTour()
{
    if (findChild<Tour*>())
        return;
    const auto lists = [this]() -> QWidget* { return wide_ ? static_cast<QWidget*>(sideBar_) : &Lists(); };
    const auto views = [this]() -> QWidget* { return wide_ ? tabs_ : nullptr; };
    const auto menus = [this]() -> QWidget* { return menuBar(); };
    new Tour({{Str::TourWelcomeTitle, Str::TourWelcome, {}},
              {Str::TourDatabaseTitle, Str::TourDatabase, menus},
              {Str::TourListsTitle, Str::TourLists, lists},
              {Str::TourViewsTitle, Str::TourViews, views},
              {Str::TourHelpTitle, Str::TourHelp, menus}},
             *this);
}

} // namespace mirel
