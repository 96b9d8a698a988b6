#include "querybuilder/ui/builder_page.h"

#include "data/catalog.h"
#include "platform/ui/look_roles.h"
#include "querybuilder/query_diagram.h"
#include "resources/string_table.h"

#include <QEvent>
#include <QGridLayout>
#include <QLabel>
#include <QPushButton>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

struct BoxDef {
    Str caption;
    Str tip; // of its button
    bool hasButton;
    bool takesTable; // the button takes the chosen table, else the field
    ClauseKind kind;
    int wideLines;
};
// In the order of ClauseDefs.
constexpr std::array kBoxes = {
    BoxDef{Str::ClauseSelect, Str::ClauseSelectTip, true, false, ClauseKind::List, 3},
    BoxDef{Str::ClauseFrom, Str::ClauseFromTip, true, true, ClauseKind::List, 1},
    BoxDef{Str::ClauseJoin, Str::ClauseJoinTip, true, true, ClauseKind::Plain, 1},
    BoxDef{Str::ClauseOn, Str::ClauseOn, false, false, ClauseKind::Condition, 2},
    BoxDef{Str::ClauseWhere, Str::ClauseWhereTip, true, false, ClauseKind::Condition, 3},
    BoxDef{Str::ClauseOrder, Str::ClauseOrderTip, true, false, ClauseKind::List, 2},
};

} // namespace

BuilderPage::BuilderPage(QueryDraft& draft, FieldLists& lists, std::function<Chosen()> chosen, QWidget* parent)
    : QWidget(parent)
    , draft_(draft)
    , lists_(lists)
    , chosen_(std::move(chosen))
    , current_(draft.FixesSelect() ? 1 : 0)
{
    static_assert(kBoxes.size() == kClauses);
    auto* grid = new QGridLayout(this);
    grid->setContentsMargins({});
    grid->setSpacing(spacing::kTight);
    for (size_t i = 0; i < kClauses; ++i) {
        boxes_[i] = new StatementEdit(
            [this](const QString& before) { return CompletionAt(before, draft_.Statement(), lists_); }, this);
        boxes_[i]->setObjectName(StringText(kBoxes[i].caption));
        boxes_[i]->setAccessibleName(StringText(Str::ClauseBoxName, {StringText(kBoxes[i].caption)}));
        boxes_[i]->installEventFilter(this);
        connect(boxes_[i], &QPlainTextEdit::textChanged, this, &BuilderPage::TakeClauses);
        captions_[i] = Caption(i);
        if (i == 0 && draft_.FixesSelect()) { // not to be changed, and not to take room
            boxes_[i]->hide();
            captions_[i]->hide();
            continue;
        }
        grid->addWidget(captions_[i], int(i), 0,
                        kBoxes[i].hasButton ? Qt::AlignTop : Qt::AlignTop | Qt::AlignRight);
        grid->addWidget(boxes_[i], int(i), 1);
    }
    grid->setColumnStretch(1, 1);
    SetNarrow(false);
}

QWidget* BuilderPage::Caption(size_t clause)
{
    const QString text = StringText(kBoxes[clause].caption);
    if (!kBoxes[clause].hasButton) {
        auto* label = new QLabel(text, this);
        label->setMargin(spacing::kTight);
        return label;
    }
    auto* button = new QPushButton(text, this);
    button->setToolTip(StringText(kBoxes[clause].tip));
    button->setAutoDefault(false);
    button->setMinimumWidth(fontMetrics().horizontalAdvance(StringText(Str::ClauseOrder)) + spacing::kWide);
    button->setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Fixed);
    connect(button, &QPushButton::clicked, this, [this, clause] { TakeChosen(clause); });
    return button;
}

StatementEdit* BuilderPage::BoxOf(QString QueryClauses::*clause) const
{
    for (size_t i = 0; i < kClauses; ++i) {
        if (ClauseDefs()[i].text == clause)
            return boxes_[i];
    }
    return nullptr;
}

void BuilderPage::ShowClauses()
{
    showing_ = true;
    for (size_t i = 0; i < kClauses; ++i)
        boxes_[i]->SetText(draft_.Clauses().*ClauseDefs()[i].text);
    showing_ = false;
}

void BuilderPage::TakeClauses()
{
    if (showing_)
        return;
    QueryClauses clauses;
    for (size_t i = 0; i < kClauses; ++i)
        clauses.*ClauseDefs()[i].text = boxes_[i]->toPlainText();
    draft_.SetClauses(clauses);
}

void BuilderPage::SetNarrow(bool narrow)
{
    for (size_t i = 0; i < kClauses; ++i) {
        const int lines = narrow ? 1 : kBoxes[i].wideLines;
        boxes_[i]->SetLines(lines, lines > 1 && kBoxes[i].kind != ClauseKind::Plain ? 0 : lines);
        const bool grows = !narrow && lines > 1 && !(i == 0 && draft_.FixesSelect());
        static_cast<QGridLayout*>(layout())->setRowStretch(int(i), grows ? lines : 0);
    }
}

// --- what the lists and the buttons insert ------------------------------------------------------------------

bool BuilderPage::eventFilter(QObject* watched, QEvent* event)
{
    if (event->type() == QEvent::FocusIn) {
        for (size_t i = 0; i < kClauses; ++i)
            current_ = boxes_[i] == watched ? i : current_;
    }
    return QWidget::eventFilter(watched, event);
}

void BuilderPage::FocusBox()
{
    boxes_[current_]->setFocus();
}

void BuilderPage::InsertTable(const QString& table)
{
    boxes_[current_]->Insert(kBoxes[current_].kind, FieldReference(table));
}

void BuilderPage::InsertField(const QString& table, const QString& field)
{
    boxes_[current_]->Insert(kBoxes[current_].kind, QueryDiagram::Reference(table, field));
}

void BuilderPage::TakeChosen(size_t clause)
{
    const Chosen chosen = chosen_();
    current_ = clause;
    if (kBoxes[clause].takesTable ? chosen.table.isEmpty() : chosen.field.isEmpty())
        return boxes_[clause]->setFocus();
    if (ClauseDefs()[clause].text == &QueryClauses::join)
        JoinTable(chosen.table);
    else if (kBoxes[clause].takesTable)
        InsertTable(chosen.table);
    else
        InsertField(chosen.table, chosen.field);
}

// The table, and where nothing stands there yet, what it has in common with one in FROM.
void BuilderPage::JoinTable(const QString& table)
{
    StatementEdit* join = BoxOf(&QueryClauses::join);
    StatementEdit* on = BoxOf(&QueryClauses::on);
    const QString from = BoxOf(&QueryClauses::from)->toPlainText();
    join->Insert(ClauseKind::Plain, FieldReference(table));
    if (!on->toPlainText().trimmed().isEmpty() || from.trimmed().isEmpty())
        return;
    const std::optional<QueryDiagram> tables = QueryDiagram::Read(u"SELECT * FROM "_s + from);
    if (!tables)
        return;
    for (const DiagramTable& other : tables->Tables()) {
        if (const std::optional<DiagramJoin> proposed = ProposedJoin(other, {table, {}}, lists_)) {
            on->SetText(QueryDiagram::Reference(proposed->left, proposed->leftField) + u" = "_s +
                        QueryDiagram::Reference(proposed->right, proposed->rightField));
            return;
        }
    }
}

} // namespace mirel
