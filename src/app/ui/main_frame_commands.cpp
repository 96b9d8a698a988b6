#include "app/ui/about_box.h"
#include "app/ui/display_look.h"
#include "app/ui/main_frame.h"
#include "app/ui/shell_actions.h"
#include "app/ui/view_tabs.h"
#include "app/ui/window_language.h"
#include "csvimport/import_source.h"
#include "resources/string_table.h"
#include "tableview/ui/export_wizard.h"

#include <QWhatsThis>

#include <array>

// The commands of the main window: one row each. Where a row does not say when its command can be given, the lists
// and their selection decide (AvailabilityOf).

namespace mirel {
namespace {

using Command = ShellCommand;
using Row = CommandRow<CMainFrame>;
using State = CommandState;

constexpr int Id(Command command)
{
    return int(command);
}

} // namespace

// What the rows call and ask.
struct CMainFrame::Commands {
    // Then the lists are shown as they are now.
    template <auto Call>
    static void Change(CMainFrame& frame)
    {
        (void)(frame.commands_.*Call)();
        frame.ShowState();
    }
    template <auto Call>
    static void Frame(CMainFrame& frame)
    {
        (frame.*Call)();
    }
    template <auto Call>
    static void Tabs(CMainFrame& frame)
    {
        (frame.tabs_->*Call)();
    }
    template <LookItem Item>
    static void Look(CMainFrame& frame)
    {
        frame.ChooseMainLook(Item);
    }
    static void ToggleDoubleTap(CMainFrame& frame)
    {
        frame.state_.SetOpensByDoubleTap(!frame.state_.OpensByDoubleTap());
        frame.ShowState();
    }
    static void Exit(CMainFrame& frame) { frame.close(); }
    static void About(CMainFrame& frame) { ShowAbout(frame.session_, frame); }
    static void Export(CMainFrame& frame)
    {
        if (const std::optional<TableRequest> request = frame.commands_.RequestOfSelected()) {
            RunExport(frame.session_.Connection(), frame.session_.Location(), frame.session_.Prompt(),
                      {.name = request->title,
                       .statement = request->statement,
                       .words = frame.settings_.Words(),
                       .writeQuery = frame.QueryWriter()},
                      frame);
        }
    }
    static void Import(CMainFrame& frame) { frame.ImportFrom({}); }
    static void AskWhatThisIs(CMainFrame&) { QWhatsThis::enterWhatsThisMode(); }
    static void Language(CMainFrame& frame) { ChooseLanguage(frame.session_.Folder(), frame.settings_, frame); }
    static void Nothing(CMainFrame&) {} // opens a menu

    template <auto Call>
    static void Care(CMainFrame& frame)
    {
        frame.RunCare(Call);
    }

    static State HasDatabase(const CMainFrame& frame) { return {.enabled = frame.state_.HasDatabase()}; }
    static State Always(const CMainFrame&) { return {}; }
    static State HasView(const CMainFrame& frame) { return {.enabled = frame.tabs_->Front() != nullptr}; }
    static State HasTabs(const CMainFrame& frame) { return {.enabled = frame.tabs_->Count() > 0}; }
    static State HasMoreTabs(const CMainFrame& frame) { return {.enabled = frame.tabs_->Count() > 1}; }
    static State CanShowLists(const CMainFrame& frame)
    {
        return {.enabled = !frame.alone_ && (frame.IsWide() || frame.tabs_->Front() != nullptr)};
    }
};

std::span<const CommandRow<CMainFrame>> CMainFrame::CommandTable()
{
    using C = Commands;
    using M = MainViewCommands;
    using F = CMainFrame;
    using T = ViewTabs;
    constexpr bool kCheckable = true;
    static constexpr std::array kRows = {
        Row{{.id = Id(Command::SideBar),
             .text = Str::MenuSideBar,
             .tip = Str::SideBarName,
             .menus = ShellViewFileMenu,
             .group = 0,
             .opens = ShellSideBarMenu},
            C::Nothing,
            C::Always},
        Row{{.id = Id(Command::AddFavorites),
             .text = Str::CommandAddFavorites,
             .tip = Str::TipAddFavorites,
             .icon = u"bookmark-new",
             .keys = {{{Qt::CTRL | Qt::Key_B}}},
             .menus = ShellFileMenu | ShellSideBarMenu | ShellEntryPopup,
             .group = 1},
            C::Change<&M::AddFavorite>},
        Row{{.id = Id(Command::RemoveFavorites),
             .text = Str::CommandRemoveFavorites,
             .tip = Str::TipRemoveFavorites,
             .icon = u"list-remove",
             .keys = {{{Qt::SHIFT | Qt::Key_Delete}}},
             .menus = ShellFileMenu | ShellSideBarMenu | ShellFavoritePopup,
             .group = 1},
            C::Change<static_cast<bool (M::*)()>(&M::RemoveFavorite)>},
        Row{{.id = Id(Command::OpenByDoubleClicking),
             .text = Str::CommandOpenByDoubleClicking,
             .tip = Str::TipOpenByDoubleClicking,
             .menus = ShellFileMenu | ShellSideBarMenu,
             .group = 1,
             .checkable = kCheckable},
            C::ToggleDoubleTap},
        Row{{.id = Id(Command::Layout),
             .text = Str::MenuLayout,
             .tip = Str::TipLayout,
             .menus = ShellFileMenu | ShellSideBarMenu,
             .group = 1,
             .opens = ShellLayoutMenu},
            C::Nothing,
            C::Always},
        Row{{.id = Id(Command::ImportCsv),
             .text = Str::CommandImportCsv,
             .tip = Str::TipImportCsv,
             .icon = u"document-import",
             .menus = ShellFileMenu | ShellViewFileMenu | ShellSideBarMenu,
             .group = 2},
            C::Import},
        Row{{.id = Id(Command::PasteTable),
             .text = Str::CommandPasteTable,
             .tip = Str::TipPasteTable,
             .icon = u"edit-paste",
             .keys = {{{Qt::CTRL | Qt::SHIFT | Qt::Key_V}}},
             .menus = ShellFileMenu | ShellViewFileMenu | ShellSideBarMenu,
             .group = 2},
            C::Frame<&F::ImportFromClipboard>},
        Row{{.id = Id(Command::ExportCsv),
             .text = Str::CommandExportCsv,
             .tip = Str::TipExportCsv,
             .icon = u"document-export",
             .menus = ShellFileMenu | ShellSideBarMenu,
             .group = 2},
            C::Export},
        Row{{.id = Id(Command::CloseView),
             .text = Str::CommandCloseView,
             .tip = Str::TipCloseView,
             .icon = u"window-close",
             .keys = {{{Qt::CTRL | Qt::Key_W}}},
             .menus = ShellViewFileMenu | ShellTabMenu,
             .group = 3},
            C::Tabs<&T::CloseCurrent>,
            C::HasView},
        Row{{.id = Id(Command::Exit),
             .text = Str::CommandExit,
             .tip = Str::TipExit,
             .icon = u"application-exit",
             .keys = {{{Qt::CTRL | Qt::Key_Q}}},
             .menus = ShellFileMenu | ShellViewFileMenu,
             .group = 3},
            C::Exit},
        Row{{.id = Id(Command::Font),
             .text = Str::CommandFont,
             .tip = Str::TipFont,
             .icon = u"preferences-desktop-font",
             .menus = ShellLayoutMenu,
             .asks = true},
            C::Look<LookItem::Font>},
        Row{{.id = Id(Command::BackgroundColor),
             .text = Str::CommandBackgroundColor,
             .tip = Str::TipColor,
             .menus = ShellLayoutMenu,
             .asks = true},
            C::Look<LookItem::LineBackground>},
        Row{{.id = Id(Command::ListBackgroundColor),
             .text = Str::CommandListBackgroundColor,
             .tip = Str::TipColor,
             .menus = ShellLayoutMenu,
             .asks = true},
            C::Look<LookItem::ListBackground>},
        Row{{.id = Id(Command::ButtonBackgroundColor),
             .text = Str::CommandButtonBackgroundColor,
             .tip = Str::TipColor,
             .menus = ShellLayoutMenu,
             .asks = true},
            C::Look<LookItem::ButtonBackground>},
        Row{{.id = Id(Command::DatabaseTextColor),
             .text = Str::CommandDatabaseTextColor,
             .tip = Str::TipColor,
             .menus = ShellLayoutMenu,
             .asks = true},
            C::Look<LookItem::LineText>},
        Row{{.id = Id(Command::ListTextColor),
             .text = Str::CommandListTextColor,
             .tip = Str::TipColor,
             .menus = ShellLayoutMenu,
             .asks = true},
            C::Look<LookItem::ListText>},
        Row{{.id = Id(Command::ButtonTextColor),
             .text = Str::CommandButtonTextColor,
             .tip = Str::TipColor,
             .menus = ShellLayoutMenu,
             .asks = true},
            C::Look<LookItem::ButtonText>},
        Row{{.id = Id(Command::ResetLayout),
             .text = Str::LayoutReset,
             .tip = Str::LayoutResetTip,
             .menus = ShellLayoutMenu,
             .group = 1},
            C::Look<LookItem::Reset>},
        Row{{.id = Id(Command::OpenDatabase),
             .text = Str::CommandOpenDatabase,
             .tip = Str::TipOpenDatabase,
             .icon = u"document-open",
             .keys = {{{Qt::CTRL | Qt::Key_O}}},
             .menus = ShellDatabaseMenu,
             .asks = true},
            C::Frame<&F::ChooseAndOpenDatabase>},
        Row{{.id = Id(Command::NewDatabase),
             .text = Str::CommandNewDatabase,
             .tip = Str::TipNewDatabase,
             .icon = u"document-new",
             .keys = {{{Qt::CTRL | Qt::SHIFT | Qt::Key_N}}},
             .menus = ShellDatabaseMenu,
             .asks = true},
            C::Frame<&F::ChooseAndCreateDatabase>},
        Row{{.id = Id(Command::DeleteDatabase),
             .text = Str::CommandDeleteDatabase,
             .tip = Str::TipDeleteDatabase,
             .icon = u"edit-delete",
             .menus = ShellDatabaseMenu,
             .asks = true},
            C::Frame<&F::ChooseAndDeleteDatabase>},
        Row{{.id = Id(Command::Information),
             .text = Str::CommandInformation,
             .tip = Str::TipInformation,
             .icon = u"document-properties",
             .keys = {{{Qt::CTRL | Qt::Key_I}}},
             .menus = ShellDatabaseMenu,
             .group = 1,
             .asks = true},
            C::Frame<&F::ShowInformation>,
            C::HasDatabase},
        Row{{.id = Id(Command::BackUp),
             .text = Str::CommandBackUp,
             .tip = Str::TipBackUp,
             .icon = u"document-save-as",
             .menus = ShellDatabaseMenu,
             .group = 1,
             .asks = true},
            C::Care<&F::BackUp>,
            C::HasDatabase},
        Row{{.id = Id(Command::Compact),
             .text = Str::CommandCompact,
             .tip = Str::TipCompact,
             .menus = ShellDatabaseMenu,
             .group = 1},
            C::Care<&F::Compact>,
            C::HasDatabase},
        Row{{.id = Id(Command::Check),
             .text = Str::CommandCheck,
             .tip = Str::TipCheck,
             .menus = ShellDatabaseMenu,
             .group = 1},
            C::Care<&F::Check>,
            C::HasDatabase},
        Row{{.id = Id(Command::OpenSample),
             .text = Str::CommandOpenSample,
             .tip = Str::TipOpenSample,
             .icon = u"mirel-sample",
             .menus = ShellDatabaseMenu,
             .group = 2},
            C::Change<&M::OpenSample>},
        Row{{.id = Id(Command::Help),
             .text = Str::CommandHelp,
             .tip = Str::TipHelp,
             .icon = u"help-contents",
             .keys = {{{Qt::Key_F1}}},
             .menus = ShellHelpMenu},
            C::Frame<&F::ShowHelpOfFront>,
            C::Always},
        Row{{.id = Id(Command::WhatsThis),
             .text = Str::CommandWhatsThis,
             .tip = Str::TipWhatsThis,
             .menus = ShellHelpMenu},
            C::AskWhatThisIs,
            C::Always},
        Row{{.id = Id(Command::Keys),
             .text = Str::CommandKeys,
             .tip = Str::TipKeys,
             .keys = {{{Qt::CTRL | Qt::Key_Slash}}},
             .menus = ShellHelpMenu},
            C::Frame<&F::ShowKeyList>},
        Row{{.id = Id(Command::Tour), .text = Str::CommandTour, .tip = Str::TipTour, .menus = ShellHelpMenu},
            C::Frame<&F::ShowTour>,
            C::Always},
        Row{{.id = Id(Command::Language),
             .text = Str::CommandLanguage,
             .tip = Str::TipLanguage,
             .menus = ShellHelpMenu,
             .group = 1,
             .asks = true},
            C::Language,
            C::Always},
        Row{{.id = Id(Command::About),
             .text = Str::CommandAbout,
             .tip = Str::TipAbout,
             .icon = u"help-about",
             .menus = ShellHelpMenu,
             .group = 1},
            C::About},
        Row{{.id = Id(Command::Open),
             .text = Str::CommandOpen,
             .tip = Str::TipOpen,
             .icon = u"mirel-open",
             .menus = ShellEntryPopup | ShellFavoritePopup},
            C::Frame<&F::OpenSelected>},
        Row{{.id = Id(Command::New),
             .text = Str::CommandNew,
             .tip = Str::TipNew,
             .icon = u"list-add",
             .keys = {{{Qt::CTRL | Qt::Key_N}}},
             .menus = ShellEntryPopup},
            C::Frame<&F::MakeNew>},
        Row{{.id = Id(Command::Edit),
             .text = Str::CommandEdit,
             .tip = Str::TipEdit,
             .icon = u"document-edit",
             .keys = {{{Qt::Key_F2}}},
             .menus = ShellEntryPopup | ShellFavoritePopup},
            C::Frame<&F::EditSelected>},
        Row{{.id = Id(Command::Rename),
             .text = Str::CommandRename,
             .tip = Str::TipRename,
             .keys = {{{Qt::SHIFT | Qt::Key_F2}}},
             .menus = ShellEntryPopup | ShellFavoritePopup,
             .asks = true},
            C::Change<&M::RenameSelected>},
        Row{{.id = Id(Command::Delete),
             .text = Str::CommandDelete,
             .tip = Str::TipDelete,
             .icon = u"edit-delete",
             .keys = {{{Qt::Key_Delete}}},
             .menus = ShellEntryPopup,
             .group = 2},
            C::Frame<&F::DeleteSelected>},
        Row{{.id = Id(Command::NextView),
             .text = Str::CommandNextView,
             .tip = Str::TipNextView,
             .icon = u"go-next",
             .keys = {{{Qt::CTRL | Qt::Key_Tab}}},
             .menus = ShellWindowMenu},
            C::Tabs<&T::GoToNext>,
            C::HasTabs},
        Row{{.id = Id(Command::PreviousView),
             .text = Str::CommandPreviousView,
             .tip = Str::TipPreviousView,
             .icon = u"go-previous",
             .keys = {{{Qt::CTRL | Qt::SHIFT | Qt::Key_Tab}, {Qt::CTRL | Qt::SHIFT | Qt::Key_Backtab}}},
             .menus = ShellWindowMenu},
            C::Tabs<&T::GoToPrevious>,
            C::HasTabs},
        Row{{.id = Id(Command::ShowLists),
             .text = Str::CommandShowLists,
             .tip = Str::TipShowLists,
             .icon = u"view-list-text",
             .keys = {{{Qt::ALT | Qt::Key_Home}}},
             .menus = ShellWindowMenu,
             .group = 1},
            C::Frame<&F::ShowLists>,
            C::CanShowLists},
        Row{{.id = Id(Command::OpenInWindow),
             .text = Str::CommandOpenInWindow,
             .tip = Str::TipOpenInWindow,
             .menus = ShellWindowMenu | ShellTabMenu,
             .group = 4},
            C::Frame<&F::MoveToWindow>,
            C::HasView},
        Row{{.id = Id(Command::CloseOtherViews),
             .text = Str::CommandCloseOthers,
             .tip = Str::TipCloseOthers,
             .menus = ShellWindowMenu | ShellTabMenu,
             .group = 4},
            C::Tabs<&T::CloseOthers>,
            C::HasMoreTabs},
    };
    return kRows;
}

} // namespace mirel
