#include "app/ui/view_window.h"

#include "app/ui/view_tabs.h"
#include "help/ui/help_window.h"
#include "resources/string_table.h"

#include <QCloseEvent>
#include <QMenu>
#include <QMenuBar>

#include <array>

namespace mirel {

std::span<const CommandRow<CViewWindow>> CViewWindow::CommandTable()
{
    using Row = CommandRow<CViewWindow>;
    static constexpr std::array kRows = {
        Row{{.id = 0, .text = Str::CommandShowAsTab, .tip = Str::TipShowAsTab, .menus = 1},
            [](CViewWindow& window) { Q_EMIT window.showAsTabRequested(); }},
        Row{{.id = 1,
             .text = Str::CommandKeys,
             .tip = Str::TipKeys,
             .keys = {{{Qt::CTRL | Qt::Key_Slash}}},
             .menus = 1},
            [](CViewWindow& window) { ShowKeyHints(window, window.view_->Keys() + window.actions_->KeyHints()); }},
        Row{{.id = 3,
             .text = Str::CommandHelp,
             .tip = Str::TipHelp,
             .icon = u"help-contents",
             .keys = {{{Qt::Key_F1}}},
             .menus = 1},
            [](CViewWindow& window) { ShowHelp(window, HelpTopicOf(*window.view_)); }},
        Row{{.id = 2,
             .text = Str::CommandCloseView,
             .tip = Str::TipCloseView,
             .icon = u"window-close",
             .keys = {{{Qt::CTRL | Qt::Key_W}}},
             .menus = 1},
            [](CViewWindow& window) { window.close(); }},
    };
    return kRows;
}

CViewWindow::CViewWindow(HostedView& view, ViewKey key, const QString& database, QWidget* parent)
    : QMainWindow(parent)
    , view_(&view)
    , key_(std::move(key))
    , database_(database)
    , actions_(new CommandActions(CommandTable(), *this))
{
    setAttribute(Qt::WA_DeleteOnClose);
    connect(actions_, &CommandActions::given, this, [this](int id) { RunCommand(CommandTable(), id, *this); });
    menuBar()->setNativeMenuBar(false);
    const QList<QMenu*> menus = view.Menus();
    auto* file = new QMenu(StringText(Str::MenuFile), this);
    for (qsizetype i = 0; i < menus.size(); ++i)
        menuBar()->addMenu(i == 0 ? file : menus[i]);
    file->setToolTipsVisible(true);
    if (!menus.isEmpty())
        file->addActions(menus.first()->actions());
    file->addSeparator();
    actions_->FillMenu(*file, 1);
    setCentralWidget(&view);
    view.show();
    view.installEventFilter(this);
    connect(&view, &HostedView::closed, this, [this] {
        view_ = nullptr;
        close();
    });
    ShowTitle();
}

HostedView* CViewWindow::Take()
{
    HostedView* view = std::exchange(view_, nullptr);
    view->removeEventFilter(this);
    disconnect(view, nullptr, this, nullptr);
    view->setParent(nullptr);
    close();
    return view;
}

void CViewWindow::ShowTitle()
{
    setWindowTitle(StringText(Str::TitleOfView, {view_->windowTitle(), database_}));
    setWindowModified(view_->isWindowModified());
}

void CViewWindow::closeEvent(QCloseEvent* event)
{
    Q_EMIT aboutToClose();
    if (view_ && !view_->close()) {
        event->ignore();
        return;
    }
    event->accept();
}

bool CViewWindow::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == view_ &&
        (event->type() == QEvent::WindowTitleChange || event->type() == QEvent::ModifiedChange))
        ShowTitle();
    return QMainWindow::eventFilter(watched, event);
}

} // namespace mirel
