#include "forms/ui/pair_editor.h"

#include "data/catalog.h"
#include "forms/control_types.h"
#include "forms/design/new_controls.h"
#include "forms/ui/expression_desk_dialog.h"
#include "platform/ui/look_roles.h"
#include "resources/string_table.h"

#include <QComboBox>
#include <QGridLayout>
#include <QHeaderView>
#include <QPushButton>
#include <QStyledItemDelegate>
#include <QTableWidget>
#include <QVBoxLayout>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr int kRowsShown = 5;
constexpr int kButtonsInRow = 2;

// Offers the fields of the form's table for the targets of assignments; others may be typed.
class TargetDelegate : public QStyledItemDelegate {
public:
    TargetDelegate(const SheetContext& context, QObject* parent)
        : QStyledItemDelegate(parent)
        , context_(context)
    {
    }

    QWidget* createEditor(QWidget* parent, const QStyleOptionViewItem&, const QModelIndex&) const override
    {
        auto* box = new QComboBox(parent);
        box->setEditable(true);
        for (const ResultField& field : context_.maker.Fields())
            box->addItem(FieldSource(context_.maker.Design().Form().tableName.Text(), field.name));
        return box;
    }
    void setEditorData(QWidget* editor, const QModelIndex& index) const override
    {
        static_cast<QComboBox*>(editor)->setEditText(index.data(Qt::EditRole).toString());
    }
    void setModelData(QWidget* editor, QAbstractItemModel* model, const QModelIndex& index) const override
    {
        model->setData(index, static_cast<QComboBox*>(editor)->currentText());
    }

private:
    const SheetContext context_;
};

} // namespace

PairEditor::PairEditor(const PropertyDef& def, const SheetContext& context, QWidget* parent)
    : PropertyEditor(parent)
    , kind_(def.kind)
    , context_(context)
    , table_(new QTableWidget(0, 2, this))
    , remove_(new QPushButton(StringText(Str::PropRemoveRow), this))
    , up_(new QPushButton(StringText(Str::PropRowUp), this))
    , down_(new QPushButton(StringText(Str::PropRowDown), this))
    , desk_(new QPushButton(StringText(Str::PropDesk), this))
{
    table_->setHorizontalHeaderLabels({StringText(AreColumns() ? Str::PropColumnName : Str::PropTarget),
                                       StringText(AreColumns() ? Str::PropColumnExpression : Str::PropValue)});
    table_->horizontalHeader()->setSectionResizeMode(QHeaderView::Stretch);
    table_->verticalHeader()->hide();
    table_->setSelectionBehavior(QAbstractItemView::SelectRows);
    table_->setSelectionMode(QAbstractItemView::SingleSelection);
    table_->setAccessibleName(StringText(def.caption));
    table_->setTabKeyNavigation(false);
    table_->setFixedHeight((kRowsShown + 1) * (fontMetrics().lineSpacing() + 8) + 4);
    if (!AreColumns())
        table_->setItemDelegateForColumn(0, new TargetDelegate(context, table_));
    auto* add = new QPushButton(StringText(Str::PropAddRow), this);
    auto* all = new QPushButton(StringText(Str::PropAllFields), this);
    all->setToolTip(StringText(Str::PropAllFieldsTip));
    auto* grid = new QGridLayout;
    grid->setSpacing(spacing::kTight);
    int place = 0;
    for (QPushButton* button : {add, remove_, all, up_, down_, desk_}) {
        button->setMinimumWidth(1);
        button->setSizePolicy(QSizePolicy::Expanding, QSizePolicy::Fixed);
        grid->addWidget(button, place / kButtonsInRow, place % kButtonsInRow);
        ++place;
    }
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins({});
    column->setSpacing(spacing::kTight);
    column->addWidget(table_);
    column->addLayout(grid);
    setFocusProxy(table_);
    connect(add, &QPushButton::clicked, this, &PairEditor::Add);
    connect(all, &QPushButton::clicked, this, &PairEditor::AddAllFields);
    connect(remove_, &QPushButton::clicked, this, &PairEditor::Remove);
    connect(up_, &QPushButton::clicked, this, [this] { Move(-1); });
    connect(down_, &QPushButton::clicked, this, [this] { Move(1); });
    connect(desk_, &QPushButton::clicked, this, &PairEditor::OpenDesk);
    connect(table_, &QTableWidget::itemChanged, this, &PairEditor::Tell);
    connect(table_, &QTableWidget::itemSelectionChanged, this, &PairEditor::ShowButtons);
    ShowButtons();
}

std::vector<PairEditor::Pair> PairEditor::Split(const QString& source) const
{
    std::vector<Pair> pairs;
    if (AreColumns()) {
        for (const SourceColumn& column : SplitListColumns(source))
            pairs.push_back({column.name, column.expression});
    } else {
        for (const SourceAssignment& assignment : SplitAssignments(source))
            pairs.push_back({assignment.target, assignment.value});
    }
    return pairs;
}

std::vector<PairEditor::Pair> PairEditor::Shown() const
{
    std::vector<Pair> pairs;
    // The signs that part names from expressions cannot be in either.
    const auto text = [this](int row, int column) {
        const QTableWidgetItem* item = table_->item(row, column);
        QString typed = item ? item->text() : QString();
        typed.removeIf([](QChar sign) { return sign.unicode() < u' '; });
        return typed;
    };
    for (int row = 0; row < table_->rowCount(); ++row)
        pairs.push_back({text(row, 0), text(row, 1)});
    return pairs;
}

QString PairEditor::Joined() const
{
    std::vector<SourceColumn> columns;
    std::vector<SourceAssignment> assignments;
    for (const Pair& pair : Shown()) {
        columns.push_back({pair.first, pair.second});
        assignments.push_back({pair.first, pair.second});
    }
    return AreColumns() ? JoinListColumns(columns) : JoinAssignments(assignments);
}

void PairEditor::Fill(const std::vector<Pair>& pairs)
{
    showing_ = true;
    table_->setRowCount(int(pairs.size()));
    for (int row = 0; row < int(pairs.size()); ++row) {
        table_->setItem(row, 0, new QTableWidgetItem(pairs[size_t(row)].first));
        table_->setItem(row, 1, new QTableWidgetItem(pairs[size_t(row)].second));
    }
    showing_ = false;
    ShowButtons();
}

void PairEditor::Show(const QString& value)
{
    const std::vector<Pair> pairs = Split(value);
    if (pairs != Shown())
        Fill(pairs);
}

void PairEditor::Tell()
{
    if (!showing_)
        Q_EMIT changed(Joined());
}

void PairEditor::Add()
{
    std::vector<Pair> pairs = Shown();
    pairs.push_back({AreColumns() ? StringText(Str::PropColumnName) : QString(), QString()});
    Fill(pairs);
    Tell();
    table_->setCurrentCell(table_->rowCount() - 1, 0);
    table_->setFocus();
    table_->editItem(table_->currentItem());
}

// A column for each field of the table; an assignment for each control that shows one.
void PairEditor::AddAllFields()
{
    std::vector<Pair> pairs = Shown();
    const FormDef& form = context_.maker.Design().Form();
    for (const ResultField& field : context_.maker.Fields()) {
        const QString source = FieldSource(form.tableName.Text(), field.name);
        if (AreColumns()) {
            pairs.push_back({field.name, source});
            continue;
        }
        const bool known = std::ranges::find(pairs, source, &Pair::first) != pairs.end();
        const auto shows = std::ranges::find_if(form.controls, [&](const ControlDef& control) {
            const QString text = control.source.Text();
            return Has(control.type, HoldsValue) && control.fieldBound != 0 &&
                   (text == source || text == u"WHERE %1=1"_s.arg(source) || control.name.Text() == field.name);
        });
        if (!known && shows != form.controls.end())
            pairs.push_back({source, u'&' + BracketedName(shows->name.Text())});
    }
    Fill(pairs);
    Tell();
}

void PairEditor::Remove()
{
    const int row = table_->currentRow();
    if (row < 0)
        return;
    table_->removeRow(row);
    Tell();
    ShowButtons();
}

void PairEditor::Move(int by)
{
    std::vector<Pair> pairs = Shown();
    const int from = table_->currentRow();
    const int to = from + by;
    if (from < 0 || to < 0 || to >= int(pairs.size()))
        return;
    std::swap(pairs[size_t(from)], pairs[size_t(to)]);
    Fill(pairs);
    table_->selectRow(to);
    Tell();
}

void PairEditor::OpenDesk()
{
    const int row = table_->currentRow();
    if (row < 0)
        return;
    const DeskQuestion question{.text = table_->item(row, 1)->text(),
                                .mode = AreColumns() ? ExprMode::Value : ExprMode::Condition,
                                .isColumn = AreColumns()};
    CExpressionDesk desk(context_.desk, context_.maker, question, this);
    if (desk.exec() == QDialog::Accepted)
        table_->item(row, 1)->setText(desk.Text());
}

void PairEditor::ShowButtons()
{
    const int row = table_->currentRow();
    const bool any = row >= 0 && row < table_->rowCount();
    remove_->setEnabled(any);
    desk_->setEnabled(any);
    up_->setEnabled(any && row > 0);
    down_->setEnabled(any && row + 1 < table_->rowCount());
}

} // namespace mirel
