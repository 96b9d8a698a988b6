#include "querybuilder/ui/query_dialog.h"

#include "data/catalog.h"
#include "data/db_recordset.h"
#include "data/provider_error.h"
#include "forms/form_query.h"
#include "platform/ui/elided_label.h"
#include "platform/ui/error_line.h"
#include "platform/ui/look_roles.h"
#include "platform/ui/scrolled_page.h"
#include "platform/ui/wait_cursor.h"
#include "platform/ui/window_place.h"
#include "querybuilder/statement_history.h"
#include "querybuilder/ui/diagram_page.h"
#include "querybuilder/ui/name_lists.h"
#include "querybuilder/ui/result_window.h"
#include "resources/string_table.h"
#include "resources/ui/theme_icon.h"
#include "tableview/saved_queries.h"

#include <QCloseEvent>
#include <QCoreApplication>
#include <QDialogButtonBox>
#include <QGridLayout>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QPushButton>
#include <QShortcut>
#include <QStackedWidget>
#include <QTabWidget>
#include <QToolButton>
#include <QVBoxLayout>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr QSize kFirstSize(880, 600);
constexpr int kListsWidth = 190;
constexpr int kLeastDiagramWidth = 640; // what is narrower has no room to draw
constexpr int kLeastDiagramHeight = 420;
constexpr qsizetype kRecentShown = 70; // characters

} // namespace

CQueryDialog::CQueryDialog(QueryDraft& draft, const QueryServices& services, Take take, QWidget* parent)
    : QDialog(parent)
    , draft_(draft)
    , services_(services)
    , take_(std::move(take))
    , lists_(services.connection, services.database, services.prompt)
    , tabs_(new QTabWidget(this))
    , names_(new NameLists(lists_, draft.Table(), this))
    , error_(new ErrorLine(this))
{
    setWindowTitle(StringText(Str::QueryTitle));
    auto* grid = new QGridLayout(this);
    grid->setSpacing(spacing::kTight);
    grid->addWidget(MakeNameRow(), 0, 0, 1, 2);
    grid->addWidget(MakeTabs(), 1, 0);
    grid->addWidget(error_, 3, 0, 1, 2);
    grid->addWidget(MakeButtons(), 4, 0, 1, 2);
    grid->setRowStretch(1, 1);
    grid->setColumnStretch(0, 1);
    Connect();
    resize(kFirstSize);
    FillSmallWindow(*this, *parent);
    FitSize();
    ShowTab(SqlTab);
    sql_->setFocus();
}

// --- parts --------------------------------------------------------------------------------------------------

QWidget* CQueryDialog::MakeNameRow()
{
    auto* row = new QWidget(this);
    const bool hasName = draft_.Request().nameUse != QueryRequest::Name::None;
    row->setVisible(hasName);
    name_ = new QLineEdit(draft_.Name(), row);
    name_->setObjectName(u"queryName"_s);
    name_->setMaxLength(int(kMaxNameLength));
    name_->setAccessibleName(StringText(Str::QueryName).remove(u'&'));
    if (draft_.Request().nameUse == QueryRequest::Name::Offered)
        name_->setPlaceholderText(StringText(Str::QueryNameOffered));
    auto* label = new QLabel(StringText(Str::QueryName), row);
    label->setBuddy(name_);
    auto* line = new QHBoxLayout(row);
    line->setContentsMargins({});
    line->addWidget(label);
    line->addWidget(name_, 1);
    connect(name_, &QLineEdit::textChanged, this, [this](const QString& name) { draft_.SetName(name); });
    return row;
}

QWidget* CQueryDialog::MakeSqlPage()
{
    auto* page = new QWidget(tabs_);
    sql_ = new StatementEdit(
        [this](const QString& before) { return CompletionAt(before, draft_.Statement(), lists_); }, page);
    sql_->setObjectName(u"sql"_s);
    sql_->setAccessibleName(StringText(Str::QuerySqlCommand).remove(u'&'));
    sql_->SetLines(3, 0);
    auto* label = new QLabel(draft_.FixesSelect()
                                 ? StringText(Str::QueryFixedSelect, {draft_.Request().selectClause.trimmed()})
                                 : StringText(Str::QuerySqlCommand),
                             page);
    label->setBuddy(sql_);
    auto* column = new QVBoxLayout(page);
    column->setContentsMargins(spacing::kTight, spacing::kTight, spacing::kTight, spacing::kTight);
    column->setSpacing(spacing::kTight);
    column->addWidget(label);
    column->addWidget(sql_, 1);
    connect(sql_, &QPlainTextEdit::textChanged, this, [this] {
        if (!showing_)
            draft_.SetText(sql_->toPlainText());
    });
    return page;
}

QStackedWidget* CQueryDialog::Refusable(QWidget* page, QLabel*& reason)
{
    auto* pages = new QStackedWidget(tabs_);
    reason = new QLabel(pages);
    reason->setWordWrap(true);
    reason->setAlignment(Qt::AlignCenter);
    reason->setMargin(spacing::kRoom);
    reason->setTextFormat(Qt::PlainText);
    reason->setForegroundRole(QPalette::PlaceholderText);
    pages->addWidget(page);
    pages->addWidget(reason);
    return pages;
}

QWidget* CQueryDialog::MakeTabs()
{
    builder_ = new BuilderPage(
        draft_, lists_,
        [this] {
            return BuilderPage::Chosen{names_->Table(), names_->Field()};
        },
        tabs_);
    builder_->layout()->setContentsMargins(spacing::kTight, spacing::kTight, spacing::kTight, spacing::kTight);
    diagram_ = new DiagramPage(draft_, lists_, services_.connection, services_.database, tabs_);
    tabs_->addTab(MakeSqlPage(), StringText(Str::QueryTabSql));
    tabs_->addTab(Refusable(Scrolled(builder_), whyNoBuilder_), StringText(Str::QueryTabBuilder));
    tabs_->addTab(Refusable(diagram_, whyNoDiagram_), StringText(Str::QueryTabDiagram));
    tabs_->setTabToolTip(SqlTab, StringText(Str::SqlTip));
    tabs_->setTabToolTip(BuilderTab, StringText(Str::BuilderTip));
    tabs_->setTabToolTip(DiagramTab, StringText(Str::DiagramTip));
    tabs_->setUsesScrollButtons(false);
    return tabs_;
}

QWidget* CQueryDialog::MakeButtons()
{
    auto* row = new QWidget(this);
    auto* run = new QPushButton(StringText(Str::QueryRun), row);
    run->setObjectName(u"run"_s);
    run->setToolTip(StringText(Str::QueryRunTip));
    run->setAutoDefault(false);
    recentButton_ = new QToolButton(row);
    recentButton_->setIcon(ThemeIcon(u"document-open-recent"));
    recentButton_->setToolTip(StringText(Str::QueryRecentTip));
    recentButton_->setText(StringText(Str::QueryRecent));
    recentButton_->setAccessibleName(StringText(Str::QueryRecent));
    recentButton_->setPopupMode(QToolButton::InstantPopup);
    recentButton_->setFocusPolicy(Qt::StrongFocus);
    recentButton_->setVisible(services_.history != nullptr);
    recent_ = new QMenu(recentButton_);
    recent_->setToolTipsVisible(true);
    recentButton_->setMenu(recent_);
    connect(recent_, &QMenu::aboutToShow, this, &CQueryDialog::FillRecent);
    const bool saves = draft_.Request().nameUse == QueryRequest::Name::Required;
    auto* save = new QPushButton(
        saves ? StringText(Str::QuerySave) : QCoreApplication::translate("QPlatformTheme", "OK"), row);
    save->setObjectName(u"save"_s);
    save->setToolTip(saves ? StringText(Str::QuerySaveTip) : QString());
    save->setAutoDefault(false);
    auto* cancel = new QPushButton(QCoreApplication::translate("QPlatformTheme", "Cancel"), row);
    cancel->setAutoDefault(false);
    for (QPushButton* button : {run, save, cancel})
        button->setMinimumWidth(3 * fontMetrics().height());
    auto* line = new QHBoxLayout(row);
    line->setContentsMargins({});
    line->setSpacing(spacing::kTight);
    line->addWidget(run);
    line->addWidget(recentButton_);
    line->addStretch(1);
    line->addWidget(save);
    line->addWidget(cancel);
    connect(run, &QPushButton::clicked, this, &CQueryDialog::Run);
    connect(save, &QPushButton::clicked, this, &CQueryDialog::Accept);
    connect(cancel, &QPushButton::clicked, this, &CQueryDialog::reject);
    return row;
}

void CQueryDialog::Connect()
{
    connect(tabs_, &QTabWidget::currentChanged, this, &CQueryDialog::ShowTab);
    connect(names_, &NameLists::tablePicked, this, [this](const QString& table) {
        switch (tabs_->currentIndex()) {
        case SqlTab:
            return sql_->Insert(ClauseKind::Plain, FieldReference(table));
        case BuilderTab:
            return builder_->isVisible() ? builder_->InsertTable(table) : void();
        default:
            return diagram_->isVisible() ? diagram_->AddTable(table) : void();
        }
    });
    connect(names_, &NameLists::fieldPicked, this, [this](const QString& table, const QString& field) {
        switch (tabs_->currentIndex()) {
        case SqlTab:
            return sql_->Insert(ClauseKind::Plain, QueryDiagram::Reference(table, field));
        case BuilderTab:
            return builder_->isVisible() ? builder_->InsertField(table, field) : void();
        default:
            return diagram_->isVisible() ? diagram_->AddField(table, field) : void();
        }
    });
    const auto onKey = [this](const QKeySequence& keys, auto call) {
        connect(new QShortcut(keys, this), &QShortcut::activated, this, call);
    };
    onKey(Qt::Key_F5, &CQueryDialog::Run);
    onKey(Qt::CTRL | Qt::Key_S, &CQueryDialog::Accept);
}

// A narrow dialog has the lists as boxes below its tabs, a wide one beside them; only a large one draws.
void CQueryDialog::FitSize()
{
    auto* grid = static_cast<QGridLayout*>(layout());
    const bool narrow = IsHandheldSize(size());
    const bool draws = width() >= kLeastDiagramWidth && height() >= kLeastDiagramHeight && !draft_.FixesSelect();
    const Fit fit{narrow, draws};
    if (fit_ == fit)
        return;
    fit_ = fit;
    grid->removeWidget(names_);
    if (narrow)
        grid->addWidget(names_, 2, 0, 1, 2);
    else
        grid->addWidget(names_, 1, 1);
    names_->SetNarrow(narrow);
    names_->setMaximumWidth(narrow ? QWIDGETSIZE_MAX : kListsWidth);
    builder_->SetNarrow(narrow);
    const int margin = narrow ? spacing::kTight : spacing::kRoom;
    grid->setContentsMargins(margin, margin, margin, margin);
    if (!draws && tabs_->currentIndex() == DiagramTab)
        tabs_->setCurrentIndex(SqlTab);
    tabs_->setTabVisible(DiagramTab, draws);
    const auto asked = draws ? QSizePolicy::Preferred : QSizePolicy::Ignored; // what is hidden takes no room
    tabs_->widget(DiagramTab)->setSizePolicy(asked, asked);
}

void CQueryDialog::resizeEvent(QResizeEvent* event)
{
    QDialog::resizeEvent(event);
    if (recent_)
        FitSize();
}

// --- tabs ---------------------------------------------------------------------------------------------------

void CQueryDialog::ShowTab(int tab)
{
    error_->Clear();
    if (tab == BuilderTab) {
        const std::optional<SplitObstacle> obstacle = draft_.ShowClauses();
        whyNoBuilder_->setText(obstacle ? StringText(obstacle->reason, obstacle->arguments) : QString());
        static_cast<QStackedWidget*>(tabs_->widget(tab))->setCurrentIndex(obstacle ? 1 : 0);
        builder_->ShowClauses();
        if (!obstacle)
            builder_->FocusBox();
        return;
    }
    draft_.ShowText();
    showing_ = true;
    sql_->SetText(draft_.Text());
    showing_ = false;
    if (tab != DiagramTab)
        return sql_->setFocus();
    Str why{};
    const bool shown = diagram_->ShowStatement(why);
    whyNoDiagram_->setText(shown ? QString() : StringText(why));
    static_cast<QStackedWidget*>(tabs_->widget(tab))->setCurrentIndex(shown ? 0 : 1);
}

// --- running ------------------------------------------------------------------------------------------------

void CQueryDialog::Run()
{
    error_->Clear();
    QString statement = draft_.Statement().trimmed();
    if (statement.isEmpty())
        return error_->ShowError(StringText(Str::QueryNoStatement), {});
    if (draft_.FixesSelect()) // as the form completes it
        statement = CompleteQuery(statement, draft_.Table(), [](QStringView) { return QString(); });
    if (!OnlyReads(statement))
        return RunChange(statement);
    CResultWindow result(services_, this);
    if (!result.Show(statement))
        return MarkFaultOf(statement);
    if (services_.history)
        services_.history->Add(draft_.Statement().trimmed());
    result.exec();
    if (services_.changed)
        services_.changed();
}

void CQueryDialog::RunChange(const QString& statement)
{
    SavedQueries queries(services_.store, services_.prompt);
    const QString name = draft_.Name().trimmed().isEmpty() ? windowTitle() : draft_.Name().trimmed();
    if (!queries.AskIfItChanges(name, statement))
        return;
    DbRecordset run(services_.connection);
    bool done = false;
    {
        const WaitCursor waiting;
        done = run.Open(statement, services_.database, CursorType::ForwardOnly, LockType::ReadOnly);
    }
    if (!done) {
        ReportProviderError(services_.prompt, &run, run.LastResult());
        return MarkFault(statement, run);
    }
    run.Close();
    if (services_.history)
        services_.history->Add(statement);
    error_->ShowNote(StringText(Str::QueryRan));
    if (services_.changed)
        services_.changed();
}

// Of a statement that was refused: runs it again, for what the provider says of the place.
void CQueryDialog::MarkFaultOf(const QString& statement)
{
    DbRecordset again(services_.connection);
    if (!again.OpenSource(statement, services_.database, CursorType::ForwardOnly, LockType::ReadOnly))
        MarkFault(statement, again);
}

// On the "SQL" tab, where the place is; the clauses would have to be searched for it.
void CQueryDialog::MarkFault(const QString& statement, const DbRecordset& refused)
{
    const QString context = refused.ErrorContext();
    tabs_->setCurrentIndex(SqlTab);
    error_->ShowError(ProviderErrorText(&refused, refused.LastResult(), context).simplified(), {});
    std::optional<StatementPlace> place = FaultPlace(statement, context, lists_);
    if (!place)
        return;
    // What ran may have more in front than what is shown.
    const QString piece = statement.mid(place->begin, place->length);
    const QString shown = sql_->toPlainText();
    const qsizetype blanks = shown.size() - QStringView(shown).trimmed().size();
    if (shown.trimmed() == statement)
        place->begin += shown.indexOf(statement);
    else if (const qsizetype found = shown.indexOf(piece); !piece.isEmpty() && found >= 0)
        place->begin = found;
    else
        place = StatementPlace{shown.size() - blanks, 0};
    sql_->MarkFault(*place);
}

void CQueryDialog::FillRecent()
{
    recent_->clear();
    const QStringList statements = services_.history ? services_.history->Statements() : QStringList();
    for (const QString& statement : statements) {
        QString shown = statement.simplified();
        if (shown.size() > kRecentShown)
            shown = shown.first(kRecentShown) + u'…';
        const int room = width() - 3 * spacing::kSection;
        QAction* action =
            recent_->addAction(fontMetrics().elidedText(shown, Qt::ElideRight, room).replace(u'&', u"&&"_s));
        action->setToolTip(statement.toHtmlEscaped());
        connect(action, &QAction::triggered, this, [this, statement] { TakeStatement(statement); });
    }
    if (statements.isEmpty())
        recent_->addAction(StringText(Str::QueryRecentNone))->setEnabled(false);
}

// Instead of what is there, which Undo brings back.
void CQueryDialog::TakeStatement(const QString& statement)
{
    tabs_->setCurrentIndex(SqlTab);
    QTextCursor all(sql_->document());
    all.select(QTextCursor::Document);
    all.insertText(draft_.FixesSelect() ? WithoutSelectClause(statement, draft_.Request().selectClause)
                                        : statement);
    sql_->setFocus();
}

// --- leaving ------------------------------------------------------------------------------------------------

void CQueryDialog::Accept()
{
    error_->Clear();
    const QueryRequest::Name use = draft_.Request().nameUse;
    if (draft_.Statement().trimmed().isEmpty())
        return error_->ShowError(StringText(Str::QueryNoStatement), {});
    const bool saves = use == QueryRequest::Name::Required ||
                       (use == QueryRequest::Name::Offered && !draft_.Name().trimmed().isEmpty());
    const QString statement = draft_.Statement().trimmed();
    if (!saves && !SavedQueries(services_.store, services_.prompt).AskIfUnbalanced(statement))
        return;
    if (take_ && !take_(saves ? draft_.Name().trimmed() : QString(), statement))
        return MarkFaultOf(statement);
    if (!saves)
        return accept();
    switch (draft_.Save(services_.store)) {
    case QueryDraft::Saved::Yes:
        return accept();
    case QueryDraft::Saved::NameMissing:
        return name_->setFocus();
    case QueryDraft::Saved::No:
        break;
    }
}

void CQueryDialog::reject()
{
    if (!draft_.IsChanged() || services_.prompt.AskYesNo({Str::IgnoreChangesQuestion, {}}))
        QDialog::reject();
}

void CQueryDialog::closeEvent(QCloseEvent* event)
{
    event->ignore();
    reject();
}

std::optional<EditedQuery> EditQuery(const QueryRequest& request, const QueryServices& services, QWidget& window,
                                     CQueryDialog::Take take)
{
    QueryDraft draft(request, services.prompt);
    CQueryDialog dialog(draft, services, std::move(take), &window);
    if (dialog.exec() != QDialog::Accepted)
        return std::nullopt;
    const bool saved = request.nameUse != QueryRequest::Name::None && !draft.Name().trimmed().isEmpty();
    return EditedQuery{saved ? draft.Name() : QString(), draft.Statement()};
}

} // namespace mirel
