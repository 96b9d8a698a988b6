#include "tableeditor/ui/table_dialog.h"

#include "data/field_names.h"
#include "platform/ui/wait_cursor.h"
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"
#include "tableeditor/ui/field_dialog.h"

#include <QAction>
#include <QDialogButtonBox>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QStackedWidget>
#include <QStyle>
#include <QStyledItemDelegate>
#include <QToolButton>
#include <QTreeWidget>
#include <QVBoxLayout>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr QSize kFirstSize(720, 480);
constexpr int kValuesShown = 3;
constexpr int kLeastRowHeight = 24; // a finger's

enum Column { Name, Type, Size, Indexed, Values, Columns };

QString SizeText(const FieldDesign& field)
{
    return field.type == FieldType::Text ? QString::number(field.size) : QString();
}

QString TypeText(const FieldDesign& field)
{
    QString name;
    TypeNameOfField(field.type, name);
    return name;
}

// One line, whatever a value holds.
QString OnOneLine(const QStringList& values)
{
    constexpr qsizetype kLongest = 80;
    QStringList shown;
    for (const QString& value : values) {
        if (!value.isEmpty())
            shown += value.left(kLongest).simplified();
    }
    return shown.join(u"  ·  "_s);
}

// Rows that a finger can hit.
class TallRows : public QStyledItemDelegate {
public:
    using QStyledItemDelegate::QStyledItemDelegate;

    QSize sizeHint(const QStyleOptionViewItem& option, const QModelIndex& index) const override
    {
        return QStyledItemDelegate::sizeHint(option, index).expandedTo(QSize(0, kLeastRowHeight));
    }
};

} // namespace

CTableDialog::CTableDialog(TableDesigner& designer, QWidget* parent)
    : QDialog(parent)
    , designer_(designer)
    , name_(new QLineEdit(this))
    , pages_(new QStackedWidget(this))
    , list_(new QTreeWidget(pages_))
    , emptyText_(new QLabel(StringText(Str::DesignEmpty), pages_))
{
    setWindowTitle(StringText(designer_.IsNew() ? Str::DesignCreateTitle : Str::DesignEditTitle));
    auto* column = new QVBoxLayout(this);
    column->addWidget(MakeNameRow());
    column->addWidget(MakeFields(), 1);
    column->addWidget(MakeTools());
    column->addWidget(MakeButtons());
    resize(kFirstSize);
    FillSmallWindow(*this, *parent->window());
    if (IsHandheldSize(size()))
        column->setContentsMargins(column->contentsMargins() / 2);
    ShowDesign();
    if (designer_.IsNew())
        name_->setFocus();
    else
        list_->setFocus();
}

QWidget* CTableDialog::MakeNameRow()
{
    auto* row = new QWidget(this);
    auto* line = new QHBoxLayout(row);
    line->setContentsMargins({});
    auto* label = new QLabel(StringText(Str::DesignTableName), row);
    label->setBuddy(name_);
    name_->setObjectName(u"tableName"_s);
    name_->setText(designer_.Table());
    name_->setCursorPosition(0);
    line->addWidget(label);
    line->addWidget(name_, 1);
    if (designer_.IsNew()) {
        connect(name_, &QLineEdit::textChanged, this, [this](const QString& text) {
            designer_.SetTableName(text);
            ShowSelection();
        });
        return row;
    }
    rename_ = new QPushButton(StringText(Str::DesignRenameTable), row);
    rename_->setAutoDefault(false);
    line->addWidget(rename_);
    connect(rename_, &QPushButton::clicked, this, &CTableDialog::RenameTable);
    connect(name_, &QLineEdit::textChanged, this, &CTableDialog::ShowSelection);
    return row;
}

QWidget* CTableDialog::MakeFields()
{
    list_->setObjectName(u"fields"_s);
    list_->setAccessibleName(StringText(Str::DesignFields));
    list_->setItemDelegate(new TallRows(list_));
    list_->setRootIsDecorated(false);
    list_->setUniformRowHeights(true);
    list_->setAllColumnsShowFocus(true);
    list_->setEditTriggers(QAbstractItemView::NoEditTriggers);
    list_->setHorizontalScrollMode(QAbstractItemView::ScrollPerPixel);
    list_->setContextMenuPolicy(Qt::ActionsContextMenu);
    list_->setHeaderLabels({StringText(Str::DesignColumnName), StringText(Str::DesignColumnType),
                            StringText(Str::DesignColumnSize), StringText(Str::DesignColumnIndexed),
                            StringText(Str::DesignColumnValues)});
    list_->headerItem()->setTextAlignment(Size, Qt::AlignRight | Qt::AlignVCenter);
    list_->setColumnHidden(Values, designer_.IsNew());
    emptyText_->setAlignment(Qt::AlignCenter);
    emptyText_->setWordWrap(true);
    emptyText_->setForegroundRole(QPalette::PlaceholderText);
    pages_->addWidget(list_);
    pages_->addWidget(emptyText_);
    connect(list_, &QTreeWidget::itemSelectionChanged, this, [this] {
        if (filling_)
            return;
        designer_.Select(list_->indexOfTopLevelItem(list_->currentItem()));
        ShowSelection();
    });
    connect(list_, &QTreeWidget::itemDoubleClicked, this, [this] { Do(Command::EditField); });
    return pages_;
}

void CTableDialog::AddCommand(Command command, Str text, Str tip, QStringView icon, const QString& keys)
{
    auto* action = new QAction(ThemeIcon(icon), StringText(text), this);
    action->setToolTip(StringText(tip));
    action->setShortcut(QKeySequence(keys));
    action->setShortcutContext(Qt::WidgetShortcut);
    list_->addAction(action);
    connect(action, &QAction::triggered, this, [this, command] { Do(command); });
    actions_.push_back(action);
    auto* button = new QToolButton(tools_);
    button->setDefaultAction(action);
    button->setFocusPolicy(Qt::StrongFocus);
    button->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
    button->setMinimumSize(kLeastRowHeight, kLeastRowHeight);
    tools_->layout()->addWidget(button);
    toolButtons_.push_back(button);
}

QWidget* CTableDialog::MakeTools()
{
    tools_ = new QWidget(this);
    auto* line = new QHBoxLayout(tools_);
    line->setContentsMargins({});
    line->setSpacing(4);
    AddCommand(Command::NewField, Str::DesignNewField, Str::TipDesignNewField, u"list-add", u"Ins"_s);
    AddCommand(Command::EditField, Str::DesignEditField, Str::TipDesignEditField, u"document-edit", u"F2"_s);
    AddCommand(Command::ChangeType, Str::DesignChangeType, Str::TipDesignChangeType, u"configure", u"Ctrl+T"_s);
    AddCommand(Command::DropField, Str::DesignDropFieldCommand, Str::TipDesignDropField, u"edit-delete", u"Del"_s);
    AddCommand(Command::MoveUp, Str::DesignMoveUp, Str::TipDesignMoveUp, u"go-up", u"Ctrl+Up"_s);
    AddCommand(Command::MoveDown, Str::DesignMoveDown, Str::TipDesignMoveDown, u"go-down", u"Ctrl+Down"_s);
    toolButtons_[size_t(Command::ChangeType)]->setHidden(designer_.IsNew()); // nothing is to be converted there
    line->addStretch(1);
    return tools_;
}

QWidget* CTableDialog::MakeButtons()
{
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Close, this);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    QPushButton* close = buttons->button(QDialogButtonBox::Close);
    close->setAutoDefault(false);
    if (designer_.IsNew()) {
        create_ = buttons->addButton(StringText(Str::DesignCreate), QDialogButtonBox::ActionRole);
        create_->setObjectName(u"create"_s);
        create_->setDefault(true);
        connect(create_, &QPushButton::clicked, this, &CTableDialog::CreateTable);
        return buttons;
    }
    QPushButton* drop = buttons->addButton(StringText(Str::DesignDropTableCommand), QDialogButtonBox::ActionRole);
    drop->setObjectName(u"dropTable"_s);
    drop->setAutoDefault(false);
    connect(drop, &QPushButton::clicked, this, &CTableDialog::DropTable);
    return buttons;
}

// Enter in the list edits the field, and in the name of an existing table it renames that.
void CTableDialog::keyPressEvent(QKeyEvent* event)
{
    if (event->key() != Qt::Key_Return && event->key() != Qt::Key_Enter)
        return QDialog::keyPressEvent(event);
    if (focusWidget() == list_)
        return Do(designer_.SelectedRow() >= 0 ? Command::EditField : Command::NewField);
    if (focusWidget() == name_ && rename_)
        return RenameTable();
    QDialog::keyPressEvent(event);
}

void CTableDialog::Do(Command command)
{
    const int row = designer_.SelectedRow();
    switch (command) {
    case Command::NewField:
        return NewField();
    case Command::EditField:
        return EditField(false);
    case Command::ChangeType:
        return EditField(true);
    case Command::DropField: {
        const WaitCursor working;
        (void)designer_.DropField(row);
        break;
    }
    case Command::MoveUp: {
        const WaitCursor working;
        (void)designer_.MoveUp(row);
        break;
    }
    case Command::MoveDown: {
        const WaitCursor working;
        (void)designer_.MoveDown(row);
        break;
    }
    }
    ShowDesign();
    list_->setFocus();
}

void CTableDialog::NewField()
{
    CFieldDialog dialog(
        StringText(Str::DesignNewFieldTitle), {}, CFieldDialog::Focus::Name,
        [this](const FieldDesign& field) {
            const WaitCursor working;
            return designer_.AddField(field);
        },
        this);
    dialog.exec();
    ShowDesign();
    list_->setFocus();
}

void CTableDialog::EditField(bool type)
{
    const int row = designer_.SelectedRow();
    if (row < 0)
        return;
    const FieldDesign before = designer_.Fields()[size_t(row)];
    const auto focus = type ? CFieldDialog::Focus::Type : CFieldDialog::Focus::Name;
    CFieldDialog* shown = nullptr;
    CFieldDialog dialog(
        StringText(type ? Str::DesignChangeTypeTitle : Str::DesignEditFieldTitle), before, focus,
        [&](const FieldDesign& field) {
            const WaitCursor working;
            const bool changed = designer_.ChangeField(row, field);
            const std::vector<FieldDesign>& now = designer_.Fields();
            // A part of it was done, or another program was there: the row is not the one that was asked for.
            if (!changed && (size_t(row) >= now.size() || now[size_t(row)] != before))
                shown->reject();
            return changed;
        },
        this);
    shown = &dialog;
    dialog.exec();
    ShowDesign();
    list_->setFocus();
}

void CTableDialog::CreateTable()
{
    const WaitCursor working;
    if (designer_.Create())
        accept();
    else
        ShowDesign();
}

void CTableDialog::DropTable()
{
    const WaitCursor working;
    if (designer_.DropTable())
        accept();
    else
        ShowDesign();
}

void CTableDialog::RenameTable()
{
    const WaitCursor working;
    const QString wanted = name_->text();
    (void)designer_.RenameTable(wanted);
    ShowDesign();
    if (designer_.Table() != wanted.trimmed()) {
        name_->setText(wanted); // what was typed stays
        name_->setFocus();
    }
}

void CTableDialog::ShowDesign()
{
    filling_ = true;
    list_->clear();
    for (const FieldDesign& field : designer_.Fields()) {
        auto* item = new QTreeWidgetItem(
            list_, {field.name, TypeText(field), SizeText(field), WordOfIndexOrder(field.index)});
        item->setTextAlignment(Size, Qt::AlignRight | Qt::AlignVCenter);
        item->setToolTip(Name, field.name.toHtmlEscaped());
    }
    ShowValues();
    if (!designer_.IsNew() && name_->text().trimmed() != designer_.Table())
        name_->setText(designer_.Table());
    name_->setCursorPosition(designer_.IsNew() ? name_->cursorPosition() : 0);
    pages_->setCurrentWidget(designer_.Fields().empty() ? static_cast<QWidget*>(emptyText_) : list_);
    for (const int column : {Type, Size, Indexed})
        list_->resizeColumnToContents(column);
    FitName();
    filling_ = false;
    ShowSelection();
}

void CTableDialog::ShowValues()
{
    const std::vector<QStringList> values = designer_.FirstValues(kValuesShown);
    for (size_t row = 0; row < values.size(); ++row) {
        QTreeWidgetItem* item = list_->topLevelItem(int(row));
        item->setText(Values, OnOneLine(values[row]));
        item->setForeground(Values, palette().brush(QPalette::PlaceholderText));
    }
}

void CTableDialog::ShowSelection()
{
    const int row = designer_.SelectedRow();
    const bool any = row >= 0;
    if (QTreeWidgetItem* item = list_->topLevelItem(row)) {
        filling_ = true;
        list_->setCurrentItem(item);
        list_->scrollToItem(item);
        filling_ = false;
    }
    actions_[size_t(Command::EditField)]->setEnabled(any);
    actions_[size_t(Command::ChangeType)]->setEnabled(any);
    actions_[size_t(Command::DropField)]->setEnabled(any);
    actions_[size_t(Command::MoveUp)]->setEnabled(row > 0);
    actions_[size_t(Command::MoveDown)]->setEnabled(any && row + 1 < int(designer_.Fields().size()));
    if (rename_)
        rename_->setVisible(name_->text().trimmed() != designer_.Table());
}

// All of the longest name where there is room, else what the columns beside it leave.
void CTableDialog::FitName()
{
    list_->resizeColumnToContents(Name);
    int others = 0;
    for (const int column : {Type, Size, Indexed})
        others += list_->columnWidth(column);
    const int room = std::max(list_->viewport()->width() - others, list_->viewport()->width() / 3);
    list_->setColumnWidth(Name, std::min(list_->columnWidth(Name), room));
}

// The names stay while they fit; below that the icons stand alone, and the tool tips name them.
void CTableDialog::FitTools()
{
    int named = 0;
    for (QToolButton* button : toolButtons_) {
        if (button->isHidden())
            continue;
        button->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
        named += button->sizeHint().width() + tools_->layout()->spacing();
    }
    if (named <= tools_->width())
        return;
    for (QToolButton* button : toolButtons_)
        button->setToolButtonStyle(Qt::ToolButtonIconOnly);
}

void CTableDialog::resizeEvent(QResizeEvent* event)
{
    QDialog::resizeEvent(event);
    FitTools();
    FitName();
}

void CTableDialog::showEvent(QShowEvent* event)
{
    QDialog::showEvent(event);
    FitTools();
    FitName();
}

} // namespace mirel
