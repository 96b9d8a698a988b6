#include "querybuilder/ui/diagram_page.h"

#include "platform/ui/look_roles.h"
#include "platform/ui/wait_cursor.h"
#include "provider/dialect/schema.h"
#include "querybuilder/first_records.h"
#include "querybuilder/ui/diagram_canvas.h"
#include "resources/string_table.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QScrollArea>
#include <QSplitter>
#include <QTableWidget>
#include <QVBoxLayout>

#include <array>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

enum GridColumn { FieldColumn, TotalColumn, OrderColumn, ConditionColumn, ShowColumn, GridColumns };
constexpr std::array kHeaders = {Str::DiagramField, Str::DiagramTotal, Str::DiagramOrder, Str::DiagramCondition,
                                 Str::DiagramShow};
constexpr std::array kTotalTexts = {Str::DiagramTotalNone,   Str::DiagramTotalGroup,   Str::DiagramTotalCount,
                                    Str::DiagramTotalSum,    Str::DiagramTotalAverage, Str::DiagramTotalMinimum,
                                    Str::DiagramTotalMaximum};
constexpr std::array kOrderTexts = {Str::DiagramTotalNone, Str::DiagramAscending, Str::DiagramDescending};

constexpr int kDrawingHeight = 250;
constexpr int kGridHeight = 150;
constexpr int kRecordsHeight = 110;
constexpr int kRecords = 12;
constexpr int kRecordsDelayMs = 200; // while somebody still types
constexpr int kRecordsBudgetMs = 1500;

QComboBox* ChoiceBox(std::span<const Str> texts, Str name, QWidget* parent)
{
    auto* box = new QComboBox(parent);
    for (const Str text : texts)
        box->addItem(StringText(text));
    box->setAccessibleName(StringText(name));
    box->setFrame(false);
    return box;
}

} // namespace

DiagramPage::DiagramPage(QueryDraft& draft, FieldLists& lists, DbConnection& connection, DatabaseLocation database,
                         QWidget* parent)
    : QWidget(parent)
    , draft_(draft)
    , lists_(lists)
    , connection_(connection)
    , database_(std::move(database))
    , canvas_(new DiagramCanvas(diagram_, lists, this))
    , grid_(new QTableWidget(this))
    , other_(new QLineEdit(this))
    , records_(new QTableWidget(this))
    , recordsNote_(new QLabel(this))
{
    auto* scroller = new QScrollArea(this);
    scroller->setWidgetResizable(true);
    scroller->setWidget(canvas_);
    scroller->setAccessibleName(StringText(Str::DiagramName));
    records_->setObjectName(u"firstRecords"_s);
    records_->setEditTriggers(QAbstractItemView::NoEditTriggers);
    records_->setAccessibleName(StringText(Str::DiagramFirst));
    records_->verticalHeader()->hide();
    records_->setTabKeyNavigation(false);
    recordsNote_->setWordWrap(true);
    recordsNote_->setTextFormat(Qt::PlainText);
    recordsNote_->setForegroundRole(QPalette::PlaceholderText);
    auto* result = new QWidget(this);
    auto* lines = new QVBoxLayout(result);
    lines->setContentsMargins({});
    lines->setSpacing(spacing::kTight);
    lines->addWidget(recordsNote_);
    lines->addWidget(records_, 1);
    auto* parts = new QSplitter(Qt::Vertical, this);
    for (QWidget* part : {static_cast<QWidget*>(scroller), MakeGrid(), result})
        parts->addWidget(part);
    parts->setChildrenCollapsible(false);
    parts->setSizes({kDrawingHeight, kGridHeight, kRecordsHeight});
    parts->setStretchFactor(0, 1);
    auto* whole = new QVBoxLayout(this);
    whole->setContentsMargins(spacing::kTight, spacing::kTight, spacing::kTight, spacing::kTight);
    whole->addWidget(parts);
    recordsTimer_.setSingleShot(true);
    connect(&recordsTimer_, &QTimer::timeout, this, &DiagramPage::ShowFirstRecords);
    connect(canvas_, &DiagramCanvas::changed, this, &DiagramPage::Changed);
}

QWidget* DiagramPage::MakeGrid()
{
    auto* part = new QWidget(this);
    grid_->setObjectName(u"diagramGrid"_s);
    grid_->setColumnCount(GridColumns);
    QStringList headers;
    for (const Str header : kHeaders)
        headers += StringText(header);
    grid_->setHorizontalHeaderLabels(headers);
    grid_->verticalHeader()->hide();
    grid_->setAccessibleName(StringText(Str::DiagramGrid));
    grid_->horizontalHeader()->setSectionResizeMode(FieldColumn, QHeaderView::Stretch);
    grid_->horizontalHeader()->setSectionResizeMode(ConditionColumn, QHeaderView::Stretch);
    grid_->installEventFilter(this);
    connect(grid_, &QTableWidget::cellChanged, this, [this](int row) { TakeRow(row); });
    auto* label = new QLabel(StringText(Str::DiagramAlso), part);
    label->setBuddy(other_);
    other_->setAccessibleName(StringText(Str::DiagramAlso).remove(u'&'));
    connect(other_, &QLineEdit::textEdited, this, [this](const QString& text) {
        diagram_.SetOtherConditions(text);
        draft_.SetText(diagram_.Statement());
        recordsTimer_.start(kRecordsDelayMs);
    });
    auto* line = new QHBoxLayout;
    line->addWidget(label);
    line->addWidget(other_, 1);
    auto* column = new QVBoxLayout(part);
    column->setContentsMargins({});
    column->setSpacing(spacing::kTight);
    column->addWidget(grid_, 1);
    column->addLayout(line);
    return part;
}

bool DiagramPage::ShowStatement(Str& why)
{
    const QString statement = draft_.Statement();
    if (statement.trimmed().isEmpty()) {
        diagram_ = {};
    } else {
        const std::optional<QueryDiagram> read = QueryDiagram::Read(statement);
        const bool isSelect = statement.trimmed().startsWith(u"SELECT", Qt::CaseInsensitive);
        why = isSelect ? Str::DiagramCannotDraw : Str::DiagramOnlySelect;
        const auto isUnknown = [this](const DiagramTable& table) {
            return !lists_.Tables().contains(table.table, Qt::CaseInsensitive);
        };
        if (!read || std::ranges::any_of(read->Tables(), isUnknown))
            return false;
        diagram_ = *read;
    }
    canvas_->ShowDiagram();
    ShowGrid();
    shownRecordsOf_.clear();
    recordsTimer_.start(0);
    return true;
}

void DiagramPage::AddTable(const QString& table)
{
    diagram_.AddTable(table, lists_);
    Changed();
}

void DiagramPage::AddField(const QString& table, const QString& field)
{
    const auto source = std::ranges::find_if(
        diagram_.Tables(), [&table](const DiagramTable& shown) { return dialect::SameName(shown.table, table); });
    if (source == diagram_.Tables().end())
        diagram_.AddTable(table, lists_);
    diagram_.Show(source == diagram_.Tables().end() ? diagram_.Tables().back().Source() : source->Source(), field,
                  true);
    Changed();
}

void DiagramPage::Changed()
{
    draft_.SetText(diagram_.Statement());
    canvas_->ShowDiagram();
    ShowGrid();
    recordsTimer_.start(kRecordsDelayMs);
}

// --- the grid -----------------------------------------------------------------------------------------------

// One line more than there are fields, for an expression to be typed.
void DiagramPage::ShowGrid()
{
    filling_ = true;
    const QModelIndex current = grid_->currentIndex();
    grid_->setRowCount(int(diagram_.Columns().size()) + 1);
    for (int row = 0; row < grid_->rowCount(); ++row)
        FillRow(row);
    grid_->setCurrentCell(std::min(current.row(), grid_->rowCount() - 1), std::max(current.column(), 0));
    for (const int column : {TotalColumn, OrderColumn, ShowColumn})
        grid_->resizeColumnToContents(column);
    if (other_->text() != diagram_.OtherConditions())
        other_->setText(diagram_.OtherConditions());
    filling_ = false;
}

void DiagramPage::FillRow(int row)
{
    const bool isNew = size_t(row) >= diagram_.Columns().size();
    const DiagramColumn column = isNew ? DiagramColumn{} : diagram_.Columns()[size_t(row)];
    const auto setText = [this, row](int at, const QString& text) {
        if (!grid_->item(row, at))
            grid_->setItem(row, at, new QTableWidgetItem);
        grid_->item(row, at)->setText(text);
        grid_->item(row, at)->setToolTip(text.toHtmlEscaped());
    };
    setText(FieldColumn,
            column.alias.isEmpty() ? column.expression : column.expression + u" AS "_s + column.alias);
    setText(ConditionColumn, column.condition);
    setText(ShowColumn, {});
    QTableWidgetItem* show = grid_->item(row, ShowColumn);
    show->setFlags(isNew ? Qt::ItemFlags() : Qt::ItemIsEnabled | Qt::ItemIsSelectable | Qt::ItemIsUserCheckable);
    show->setData(Qt::CheckStateRole,
                  isNew ? QVariant() : QVariant(int(column.shown ? Qt::Checked : Qt::Unchecked)));
    const auto setChoice = [this, row, isNew](int at, std::span<const Str> texts, Str name, int chosen) {
        auto* box = qobject_cast<QComboBox*>(grid_->cellWidget(row, at));
        if (!box) {
            box = ChoiceBox(texts, name, grid_);
            connect(box, &QComboBox::activated, this, [this, row] { TakeRow(row); });
            grid_->setCellWidget(row, at, box);
        }
        box->setCurrentIndex(chosen);
        box->setVisible(!isNew);
    };
    setChoice(TotalColumn, kTotalTexts, Str::DiagramTotal, int(column.total));
    setChoice(OrderColumn, kOrderTexts, Str::DiagramOrder, int(column.sort));
}

void DiagramPage::TakeRow(int row)
{
    if (filling_)
        return;
    const bool isNew = size_t(row) >= diagram_.Columns().size();
    DiagramColumn column = isNew ? DiagramColumn{} : diagram_.Columns()[size_t(row)];
    const QString typed = grid_->item(row, FieldColumn)->text().trimmed();
    const QString shown =
        column.alias.isEmpty() ? column.expression : column.expression + u" AS "_s + column.alias;
    if (typed != shown) {
        const qsizetype as = typed.lastIndexOf(u" AS "_s, -1, Qt::CaseInsensitive);
        column.expression = (as < 0 ? typed : typed.first(as)).trimmed();
        column.alias = as < 0 ? QString() : typed.sliced(as + 4).trimmed();
        if (column.alias.startsWith(u'[') && column.alias.endsWith(u']'))
            column.alias = column.alias.sliced(1, column.alias.size() - 2);
    }
    if (column.expression.isEmpty()) {
        if (!isNew)
            diagram_.RemoveColumn(size_t(row));
        return QTimer::singleShot(0, this, &DiagramPage::Changed); // the cell's editor is still open
    }
    column.condition = grid_->item(row, ConditionColumn)->text().trimmed();
    if (!isNew) {
        column.shown = grid_->item(row, ShowColumn)->checkState() == Qt::Checked;
        column.total = Total(qobject_cast<QComboBox*>(grid_->cellWidget(row, TotalColumn))->currentIndex());
        column.sort = ColumnOrder(qobject_cast<QComboBox*>(grid_->cellWidget(row, OrderColumn))->currentIndex());
    }
    diagram_.SetColumn(size_t(row), column);
    draft_.SetText(diagram_.Statement());
    QTimer::singleShot(0, this, &DiagramPage::Changed);
}

// Del takes a line away; Ctrl+Up and Ctrl+Down move it.
bool DiagramPage::eventFilter(QObject* watched, QEvent* event)
{
    if (watched != grid_ || event->type() != QEvent::KeyPress)
        return QWidget::eventFilter(watched, event);
    const auto* key = static_cast<QKeyEvent*>(event);
    const int row = grid_->currentRow();
    const bool moves = key->modifiers() & Qt::ControlModifier;
    if (row < 0 || size_t(row) >= diagram_.Columns().size())
        return false;
    if (key->key() == Qt::Key_Delete) {
        diagram_.RemoveColumn(size_t(row));
    } else if (moves && (key->key() == Qt::Key_Up || key->key() == Qt::Key_Down)) {
        const int to = row + (key->key() == Qt::Key_Up ? -1 : 1);
        if (to < 0 || size_t(to) >= diagram_.Columns().size())
            return true;
        diagram_.MoveColumn(size_t(row), size_t(to));
        grid_->setCurrentCell(to, grid_->currentColumn());
    } else {
        return false;
    }
    Changed();
    return true;
}

// --- the first records --------------------------------------------------------------------------------------

void DiagramPage::ShowFirstRecords()
{
    const QString statement = draft_.Statement();
    if (statement == shownRecordsOf_ || !isVisible())
        return;
    shownRecordsOf_ = statement;
    FirstRecords first;
    if (!statement.isEmpty()) {
        const WaitCursor waiting;
        first = ReadFirstRecords(connection_, database_, statement, kRecords, kRecordsBudgetMs);
    }
    records_->clear();
    records_->setRowCount(int(first.rows.size()));
    records_->setColumnCount(int(first.columns.size()));
    for (int column = 0; column < records_->columnCount(); ++column) {
        const FirstRecords::Column& shown = first.columns[size_t(column)];
        records_->setHorizontalHeaderItem(column, new QTableWidgetItem(shown.name));
        for (int row = 0; row < records_->rowCount(); ++row) {
            auto* item = new QTableWidgetItem(first.rows[size_t(row)].value(column).simplified());
            item->setTextAlignment(Qt::AlignVCenter | (shown.rightAligned ? Qt::AlignRight : Qt::AlignLeft));
            records_->setItem(row, column, item);
        }
    }
    records_->resizeColumnsToContents();
    QString note = StringText(Str::DiagramFirst);
    if (!first.error.isEmpty())
        note = first.error;
    else if (first.stopped)
        note = StringText(Str::DiagramFirstSlow, {QString::number(kRecordsBudgetMs / 1000.0)});
    else if (first.rows.empty() && !statement.isEmpty())
        note = StringText(Str::DiagramFirstNone);
    recordsNote_->setText(note);
    records_->setVisible(first.error.isEmpty() && !first.stopped);
}

} // namespace mirel
