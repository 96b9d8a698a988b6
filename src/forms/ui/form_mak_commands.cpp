#include "forms/control_types.h"
#include "forms/ui/design_surface.h"
#include "forms/ui/form_mak_command.h"
#include "forms/ui/form_mak_view.h"
#include "help/ui/help_window.h"
#include "platform/ui/view_command.h"
#include "resources/string_table.h"

#include <QAction>
#include <QMenu>
#include <QScrollArea>
#include <QToolBar>
#include <QToolButton>

#include <array>

// The commands of the form maker's view: one row each.

namespace mirel {
namespace {

using Command = FormMakCommand;
using Row = CommandRow<CFormMakView>;
using State = CommandState;

// Where commands show. The menus but File are those of a selection of none, of one, of several.
enum Menu : unsigned {
    FileMenu = 1,
    FormMenu = 2,
    ControlMenu = 4,
    OneProperties = 8,
    OneEdit = 16,
    ManyProperties = 32,
    ManyEdit = 64,
    ToolBar = 128,
};

// Which menus a selection has.
enum class Selected { None, One, Many };
struct MenuRow {
    Menu bit;
    Str title;
    std::optional<Selected> when; // none: always
};
constexpr std::array kMenus = {
    MenuRow{FileMenu, Str::MenuFile, std::nullopt},
    MenuRow{FormMenu, Str::MakerMenuForm, Selected::None},
    MenuRow{ControlMenu, Str::MakerMenuControl, Selected::None},
    MenuRow{OneProperties, Str::MakerMenuProperties, Selected::One},
    MenuRow{OneEdit, Str::MakerMenuEdit, Selected::One},
    MenuRow{ManyProperties, Str::MakerMenuProperties, Selected::Many},
    MenuRow{ManyEdit, Str::MakerMenuEdit, Selected::Many},
};

Selected SelectedOf(const FormDesign& design)
{
    const size_t count = design.Selection().size();
    return count == 0 ? Selected::None : count == 1 ? Selected::One : Selected::Many;
}

constexpr int Id(Command command)
{
    return int(command);
}

struct PlacingCommand {
    Command command;
    ControlType type;
};
constexpr std::array kPlacing = {
    PlacingCommand{Command::NewLabel, ControlType::Label},
    PlacingCommand{Command::NewEditBox, ControlType::EditBox},
    PlacingCommand{Command::NewCheckBox, ControlType::CheckBox},
    PlacingCommand{Command::NewDropDown, ControlType::DropDownBox},
    PlacingCommand{Command::NewList, ControlType::List},
    PlacingCommand{Command::NewButton, ControlType::Button},
};

} // namespace

// What the rows call and ask.
struct CFormMakView::Commands {
    template <auto Call>
    static void View(CFormMakView& view)
    {
        (view.*Call)();
    }
    // Of the maker, which asks and may refuse.
    template <auto Call>
    static void Maker(CFormMakView& view)
    {
        (void)(view.maker_.*Call)();
        view.ShowState();
    }
    template <auto Call>
    static void Design(CFormMakView& view)
    {
        (view.maker_.Design().*Call)();
        view.ShowState();
    }
    template <ControlType Type>
    static void Place(CFormMakView& view)
    {
        view.StartPlacing(Type);
    }
    template <FormDesign::Edge Edge>
    static void Align(CFormMakView& view)
    {
        view.maker_.Design().Align(Edge);
        view.ShowState();
    }
    template <FormDesign::Like Like>
    static void MakeSame(CFormMakView& view)
    {
        view.maker_.Design().MakeSame(Like);
        view.ShowState();
    }
    template <int By>
    static void Reorder(CFormMakView& view)
    {
        view.maker_.Design().MoveInOrder(By);
        view.ShowState();
    }
    static void Save(CFormMakView& view) { view.Save(view.maker_.Save()); }
    static void SaveAs(CFormMakView& view) { view.Save(view.maker_.SaveAs()); }
    static void EndPlacing(CFormMakView& view)
    {
        view.surface_->SetPlacing({});
        view.ShowState();
    }
    static void FormProperties(CFormMakView& view)
    {
        view.maker_.Design().SelectNone();
        view.ShowProperties();
    }
    static void ToggleScrollBar(CFormMakView& view)
    {
        const bool shown = view.scroller_->verticalScrollBarPolicy() != Qt::ScrollBarAlwaysOff;
        view.scroller_->setVerticalScrollBarPolicy(shown ? Qt::ScrollBarAlwaysOff : Qt::ScrollBarAsNeeded);
        view.ShowState();
    }
    static void ZoomIn(CFormMakView& view) { view.SetZoom(view.surface_->Zoom() + 0.25); }
    static void ZoomOut(CFormMakView& view) { view.SetZoom(view.surface_->Zoom() - 0.25); }
    static void ShowPage(CFormMakView& view) { ShowHelp(view, HelpTopicOf(view)); }

    static State HasControls(const CFormMakView& view) { return {.enabled = view.maker_.Design().Count() > 0}; }
    static State HasFields(const CFormMakView& view) { return {.enabled = view.fieldList_->count() > 0}; }
    static State HasSelection(const CFormMakView& view)
    {
        return {.enabled = !view.maker_.Design().Selection().empty()};
    }
    static State CanUndo(const CFormMakView& view) { return {.enabled = view.maker_.Design().CanUndo()}; }
    static State CanRedo(const CFormMakView& view) { return {.enabled = view.maker_.Design().CanRedo()}; }
    static State Modified(const CFormMakView& view) { return {.enabled = view.maker_.Design().IsModified()}; }
    static State ScrollBarShown(const CFormMakView& view)
    {
        return {.checked = view.scroller_->verticalScrollBarPolicy() != Qt::ScrollBarAlwaysOff};
    }
    static State IsSelecting(const CFormMakView& view) { return {.checked = !view.surface_->Placing()}; }
    template <ControlType Type>
    static State IsPlacing(const CFormMakView& view)
    {
        return {.checked = view.surface_->Placing() == Type};
    }
    static State IsOne(const CFormMakView& view) { return {.enabled = view.maker_.Design().TheSelected() >= 0}; }

    static std::span<const Row> Table();
};

std::span<const Row> CFormMakView::Commands::Table()
{
    using D = FormDesign;
    using E = FormDesign::Edge;
    using L = FormDesign::Like;
    using M = FormMaker;
    using V = CFormMakView;
    constexpr bool kCheckable = true;
    constexpr unsigned kEdits = OneEdit | ManyEdit;
    constexpr unsigned kProperties = OneProperties | ManyProperties;
    (void)kProperties;
    static constexpr std::array kRows = {
        Row{{.id = Id(Command::Save),
             .text = Str::MakerSave,
             .tip = Str::MakerSaveTip,
             .icon = u"document-save",
             .keys = {{{Qt::CTRL | Qt::Key_S}}},
             .menus = FileMenu | ToolBar},
            Save,
            Modified},
        Row{{.id = Id(Command::SaveAs),
             .text = Str::MakerSaveAs,
             .tip = Str::MakerSaveAsTip,
             .keys = {{{Qt::CTRL | Qt::SHIFT | Qt::Key_S}}},
             .menus = FileMenu},
            SaveAs},
        Row{{.id = Id(Command::Import),
             .text = Str::MakerImport,
             .tip = Str::MakerImportTip,
             .icon = u"document-import",
             .menus = FileMenu,
             .group = 1},
            View<&V::ImportForm>},
        Row{{.id = Id(Command::Export),
             .text = Str::MakerExport,
             .tip = Str::MakerExportTip,
             .icon = u"document-export",
             .menus = FileMenu,
             .group = 1},
            View<&V::ExportForm>},
        Row{{.id = Id(Command::ScrollBar),
             .text = Str::MakerScrollBar,
             .tip = Str::MakerScrollBarTip,
             .icon = u"mirel-scrollbar",
             .menus = FileMenu,
             .group = 2,
             .checkable = kCheckable},
            ToggleScrollBar,
            ScrollBarShown},
        Row{{.id = Id(Command::DeleteAll),
             .text = Str::MakerDeleteAll,
             .tip = Str::MakerDeleteAllTip,
             .icon = u"edit-delete",
             .menus = FileMenu,
             .group = 2},
            Maker<&M::DeleteAll>,
            HasControls},
        Row{{.id = Id(Command::Help),
             .text = Str::MakerHelp,
             .tip = Str::MakerHelpTip,
             .icon = u"help-contents",
             .menus = FileMenu,
             .group = 3},
            ShowPage},
        Row{{.id = Id(Command::FormProperties),
             .text = Str::MakerFormProperties,
             .tip = Str::MakerFormPropertiesTip,
             .icon = u"mirel-properties",
             .menus = FormMenu},
            FormProperties},
        Row{{.id = Id(Command::FormColor),
             .text = Str::MakerFormColor,
             .tip = Str::MakerFormColorTip,
             .menus = FormMenu},
            View<&V::ChooseColor>},
        Row{{.id = Id(Command::FormFont),
             .text = Str::MakerFormFont,
             .tip = Str::MakerFormFontTip,
             .icon = u"preferences-desktop-font",
             .menus = FormMenu},
            View<&V::ChooseFont>},
        Row{{.id = Id(Command::DefaultForm),
             .text = Str::MakerDefaultForm,
             .tip = Str::MakerDefaultFormTip,
             .menus = FormMenu,
             .group = 1},
            Maker<&M::CreateDefaultForm>},
        Row{{.id = Id(Command::LayOutAll),
             .text = Str::MakerLayOut,
             .tip = Str::MakerLayOutTip,
             .icon = u"mirel-form",
             .menus = FormMenu,
             .group = 1},
            Maker<&M::LayOutAllFields>},
        Row{{.id = Id(Command::Select),
             .text = Str::MakerSelect,
             .tip = Str::MakerSelectTip,
             .icon = u"mirel-select",
             .menus = ToolBar,
             .group = 1,
             .checkable = kCheckable},
            EndPlacing,
            IsSelecting},
        Row{{.id = Id(Command::NewButton),
             .text = Str::MakerNewButton,
             .tip = Str::MakerNewTip,
             .icon = u"mirel-button",
             .menus = ControlMenu | ToolBar,
             .group = 1,
             .checkable = kCheckable},
            Place<ControlType::Button>,
            IsPlacing<ControlType::Button>},
        Row{{.id = Id(Command::NewEditBox),
             .text = Str::MakerNewEditBox,
             .tip = Str::MakerNewTip,
             .icon = u"mirel-edit-box",
             .menus = ControlMenu | ToolBar,
             .group = 1,
             .checkable = kCheckable},
            Place<ControlType::EditBox>,
            IsPlacing<ControlType::EditBox>},
        Row{{.id = Id(Command::NewCheckBox),
             .text = Str::MakerNewCheckBox,
             .tip = Str::MakerNewTip,
             .icon = u"mirel-check-box",
             .menus = ControlMenu | ToolBar,
             .group = 1,
             .checkable = kCheckable},
            Place<ControlType::CheckBox>,
            IsPlacing<ControlType::CheckBox>},
        Row{{.id = Id(Command::NewLabel),
             .text = Str::MakerNewLabel,
             .tip = Str::MakerNewTip,
             .icon = u"mirel-label",
             .menus = ControlMenu | ToolBar,
             .group = 1,
             .checkable = kCheckable},
            Place<ControlType::Label>,
            IsPlacing<ControlType::Label>},
        Row{{.id = Id(Command::NewList),
             .text = Str::MakerNewList,
             .tip = Str::MakerNewTip,
             .icon = u"mirel-list",
             .menus = ControlMenu | ToolBar,
             .group = 1,
             .checkable = kCheckable},
            Place<ControlType::List>,
            IsPlacing<ControlType::List>},
        Row{{.id = Id(Command::NewDropDown),
             .text = Str::MakerNewDropDown,
             .tip = Str::MakerNewTip,
             .icon = u"mirel-drop-down",
             .menus = ControlMenu | ToolBar,
             .group = 1,
             .checkable = kCheckable},
            Place<ControlType::DropDownBox>,
            IsPlacing<ControlType::DropDownBox>},
        Row{{.id = Id(Command::InsertCounter),
             .text = Str::MakerInsertCounter,
             .tip = Str::MakerInsertCounterTip,
             .menus = ControlMenu,
             .group = 2},
            Design<&D::InsertRecordCounter>},
        Row{{.id = Id(Command::Fields),
             .text = Str::MakerFields,
             .tip = Str::MakerFieldsTip,
             .icon = u"view-list-text",
             .menus = ControlMenu,
             .group = 2},
            View<&V::ChooseFields>,
            HasFields},
        Row{{.id = Id(Command::ControlProperties),
             .text = Str::MakerControlProperties,
             .tip = Str::MakerControlPropertiesTip,
             .icon = u"mirel-properties",
             .keys = {{{Qt::ALT | Qt::Key_Return}}},
             .menus = OneProperties | ToolBar,
             .group = 2},
            View<&V::ShowProperties>},
        Row{{.id = Id(Command::ControlColor),
             .text = Str::MakerControlColor,
             .tip = Str::MakerColorTip,
             .menus = OneProperties,
             .group = 2},
            View<&V::ChooseColor>},
        Row{{.id = Id(Command::ControlFont),
             .text = Str::MakerControlFont,
             .tip = Str::MakerFontTip,
             .icon = u"preferences-desktop-font",
             .menus = OneProperties,
             .group = 2},
            View<&V::ChooseFont>},
        Row{{.id = Id(Command::Color),
             .text = Str::MakerColor,
             .tip = Str::MakerColorTip,
             .menus = ManyProperties,
             .group = 2},
            View<&V::ChooseColor>},
        Row{{.id = Id(Command::Font),
             .text = Str::MakerFont,
             .tip = Str::MakerFontTip,
             .icon = u"preferences-desktop-font",
             .menus = ManyProperties,
             .group = 2},
            View<&V::ChooseFont>},
        Row{{.id = Id(Command::AlignLeft),
             .text = Str::MakerAlignLeft,
             .tip = Str::MakerAlignTip,
             .menus = ManyEdit,
             .group = 3},
            Align<E::Left>},
        Row{{.id = Id(Command::AlignRight),
             .text = Str::MakerAlignRight,
             .tip = Str::MakerAlignTip,
             .menus = ManyEdit,
             .group = 3},
            Align<E::Right>},
        Row{{.id = Id(Command::AlignTop),
             .text = Str::MakerAlignTop,
             .tip = Str::MakerAlignTip,
             .menus = ManyEdit,
             .group = 3},
            Align<E::Top>},
        Row{{.id = Id(Command::AlignBottom),
             .text = Str::MakerAlignBottom,
             .tip = Str::MakerAlignTip,
             .menus = ManyEdit,
             .group = 3},
            Align<E::Bottom>},
        Row{{.id = Id(Command::SameSize),
             .text = Str::MakerSameSize,
             .tip = Str::MakerSameTip,
             .menus = ManyEdit,
             .group = 4},
            MakeSame<L::Size>},
        Row{{.id = Id(Command::SameHeight),
             .text = Str::MakerSameHeight,
             .tip = Str::MakerSameTip,
             .menus = ManyEdit,
             .group = 4},
            MakeSame<L::Height>},
        Row{{.id = Id(Command::SameWidth),
             .text = Str::MakerSameWidth,
             .tip = Str::MakerSameTip,
             .menus = ManyEdit,
             .group = 4},
            MakeSame<L::Width>},
        Row{{.id = Id(Command::Copy),
             .text = Str::MakerCopy,
             .tip = Str::MakerCopyTip,
             .icon = u"edit-copy",
             .keys = {{{Qt::CTRL | Qt::Key_C, OnPart}}},
             .menus = kEdits,
             .group = 5},
            View<&V::Copy>,
            HasSelection},
        Row{{.id = Id(Command::Paste),
             .text = Str::MakerPaste,
             .tip = Str::MakerPasteTip,
             .icon = u"edit-paste",
             .keys = {{{Qt::CTRL | Qt::Key_V, OnPart}}},
             .menus = ControlMenu | kEdits,
             .group = 5},
            View<&V::Paste>},
        Row{{.id = Id(Command::Delete),
             .text = Str::MakerDelete,
             .tip = Str::MakerDeleteTip,
             .icon = u"edit-delete",
             .keys = {{{Qt::Key_Delete, OnPart}, {Qt::Key_Backspace, OnPart}}},
             .menus = kEdits,
             .group = 5},
            Maker<&M::DeleteSelected>,
            HasSelection},
        Row{{.id = Id(Command::Earlier),
             .text = Str::MakerEarlier,
             .tip = Str::MakerEarlierTip,
             .keys = {{{Qt::CTRL | Qt::Key_PageUp}}},
             .menus = OneEdit,
             .group = 6},
            Reorder<-1>,
            IsOne},
        Row{{.id = Id(Command::Later),
             .text = Str::MakerLater,
             .tip = Str::MakerLaterTip,
             .keys = {{{Qt::CTRL | Qt::Key_PageDown}}},
             .menus = OneEdit,
             .group = 6},
            Reorder<1>,
            IsOne},
        Row{{.id = Id(Command::SelectAll),
             .text = Str::MakerSelectAll,
             .tip = Str::MakerSelectAllTip,
             .keys = {{{Qt::CTRL | Qt::Key_A, OnPart}}},
             .menus = ControlMenu,
             .group = 6},
            Design<&D::SelectAll>,
            HasControls},
        Row{{.id = Id(Command::Undo),
             .text = Str::MakerUndo,
             .tip = Str::MakerUndoTip,
             .icon = u"edit-undo",
             .keys = {{{Qt::CTRL | Qt::Key_Z}}},
             .menus = ControlMenu | kEdits | ToolBar,
             .group = 7},
            Design<&D::Undo>,
            CanUndo},
        Row{{.id = Id(Command::Redo),
             .text = Str::MakerRedo,
             .tip = Str::MakerRedoTip,
             .icon = u"edit-redo",
             .keys = {{{Qt::CTRL | Qt::SHIFT | Qt::Key_Z}, {Qt::CTRL | Qt::Key_Y}}},
             .menus = ControlMenu | kEdits | ToolBar,
             .group = 7},
            Design<&D::Redo>,
            CanRedo},
        Row{{.id = Id(Command::ZoomIn),
             .text = Str::MakerZoomIn,
             .tip = Str::MakerZoomTip,
             .icon = u"zoom-in",
             .keys = {{{Qt::CTRL | Qt::Key_Plus}, {Qt::CTRL | Qt::Key_Equal}}},
             .menus = FormMenu,
             .group = 8},
            ZoomIn},
        Row{{.id = Id(Command::ZoomOut),
             .text = Str::MakerZoomOut,
             .tip = Str::MakerZoomTip,
             .keys = {{{Qt::CTRL | Qt::Key_Minus}}},
             .menus = FormMenu,
             .group = 8},
            ZoomOut},
        Row{{.id = Id(Command::Run),
             .text = Str::MakerRun,
             .tip = Str::MakerRunTip,
             .icon = u"mirel-run",
             .keys = {{{Qt::Key_F5}}},
             .menus = FileMenu | ToolBar,
             .group = 9},
            View<&V::Run>},
    };
    return kRows;
}

void CFormMakView::CreateActions()
{
    actions_ = new CommandActions(Commands::Table(), *this);
    actions_->WorkWhereOwnerHasFocus();
    connect(actions_, &CommandActions::given, this, [this](int id) { RunCommand(Commands::Table(), id, *this); });
    for (const MenuRow& menu : kMenus) {
        menus_ += new QMenu(StringText(menu.title), this);
        actions_->FillMenu(*menus_.back(), menu.bit);
    }
    // On the palette a kind is called by its name.
    for (const PlacingCommand& placing : kPlacing)
        actions_->Of(Id(placing.command))->setIconText(StringText(TypeOf(placing.type).title));
}

void CFormMakView::CreateToolBar()
{
    toolBar_ = new QToolBar(StringText(Str::MakerPalette), this);
    toolBar_->setObjectName(QStringLiteral("palette"));
    toolBar_->setMovable(false);
    toolBar_->setFloatable(false);
    const int side = style()->pixelMetric(QStyle::PM_SmallIconSize, nullptr, this);
    toolBar_->setIconSize(QSize(side, side));
    actions_->FillToolBar(*toolBar_, ToolBar);
    for (QToolButton* button : toolBar_->findChildren<QToolButton*>())
        button->setFocusPolicy(Qt::TabFocus); // a tap on the palette leaves the surface the keys
}

QList<KeyHint> CFormMakView::Keys() const
{
    return actions_->KeyHints();
}

void CFormMakView::ShowActions()
{
    ShowCommands(Commands::Table(), *actions_, *this);
    const Selected selected = SelectedOf(maker_.Design());
    for (qsizetype i = 0; i < menus_.size(); ++i) {
        const std::optional<Selected> when = kMenus[size_t(i)].when;
        menus_[i]->menuAction()->setVisible(!when || *when == selected);
    }
}

bool CFormMakView::RunPartKey(const QKeyEvent& event)
{
    const std::optional<int> command =
        CommandOfPartKey(Commands::Table(), OnPart, QKeyCombination(event.modifiers(), Qt::Key(event.key())));
    if (!command || !actions_->Of(*command)->isEnabled())
        return false;
    RunCommand(Commands::Table(), *command, *this);
    return true;
}

void CFormMakView::ShowPopup(const QPoint& globalPosition)
{
    ShowState();
    QMenu popup(this);
    for (const MenuRow& menu : kMenus) {
        if (!menu.when || *menu.when != SelectedOf(maker_.Design()))
            continue;
        if (!popup.isEmpty())
            popup.addSeparator();
        actions_->FillMenu(popup, menu.bit);
    }
    popup.exec(globalPosition);
    ShowState();
}

} // namespace mirel
