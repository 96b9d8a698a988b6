// A query is written with every tool of the dialog, at a handheld's size and at a desktop's, and used afterwards.
// With MIREL_PICTURES=<folder> in the environment each step is painted there.
#include "querybuilder/ui/query_dialog.h"

#include "platform/profile.h"
#include "platform/ui/error_line.h"
#include "platform/ui/window_place.h"
#include "querybuilder/statement_history.h"
#include "querybuilder/ui/diagram_canvas.h"
#include "querybuilder/ui/diagram_page.h"
#include "querybuilder/ui/name_lists.h"
#include "querybuilder/ui/result_window.h"
#include "resources/string_table.h"
#include "support/ui/window_sizes.h"
#include "tableview/people_fixture.h"
#include "tableview/ui/export_wizard.h"
#include "tableview/ui/table_view.h"

#include <QApplication>
#include <QComboBox>
#include <QCompleter>
#include <QDir>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QMenu>
#include <QPushButton>
#include <QStackedWidget>
#include <QTabWidget>
#include <QTableWidget>
#include <QTest>
#include <QTimer>
#include <QToolButton>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const QString kStatement =
    u"SELECT Customers.City, SUM(Orders.Qty) FROM Customers INNER JOIN Orders ON Customers.CustomerID = "
    u"Orders.CustomerID WHERE Orders.Qty > 5 GROUP BY Customers.City ORDER BY Customers.City"_s;

class QueryDialog : public PeopleFixture {
protected:
    QueryDialog()
    {
        Run(u"CREATE TABLE Customers ([CustomerID] Integer,[Company] Varchar(20),[City] Varchar(20))"_s);
        Run(u"CREATE TABLE Orders ([OrderNo] Integer,[CustomerID] Integer,[Qty] Integer,[Paid] Bit)"_s);
        for (const QString& values : {u"1,'Ann','Oslo'"_s, u"2,'Bob','Cork'"_s, u"3,'Cy','Oslo'"_s})
            Run(u"INSERT INTO Customers VALUES(%1)"_s.arg(values));
        for (const QString& values : {u"1,1,6,TRUE"_s, u"2,2,7,FALSE"_s, u"3,3,8,TRUE"_s, u"4,1,2,TRUE"_s})
            Run(u"INSERT INTO Orders VALUES(%1)"_s.arg(values));
    }

    // A dialog over a window of that size.
    void Open(QSize size, QueryRequest request = {.table = u"Customers"_s}, CQueryDialog::Take take = {})
    {
        dialog.reset();
        draft = std::make_unique<QueryDraft>(std::move(request), prompt);
        window.resize(size);
        window.show();
        dialog = std::make_unique<CQueryDialog>(
            *draft, QueryServices{connection, path, store, prompt, &history, {}, [this] { ++changes; }}, take,
            &window);
        dialog->show();
        QApplication::setActiveWindow(dialog.get());
        ASSERT_TRUE(QTest::qWaitForWindowActive(dialog.get()));
        narrow = IsHandheldSize(dialog->size());
        EXPECT_LE(dialog->height(), size.height());
    }
    void Paint(QWidget& shown, const QString& name) const
    {
        QApplication::processEvents();
        const QString folderName = qEnvironmentVariable("MIREL_PICTURES");
        if (!folderName.isEmpty()) {
            QTest::qWait(300); // a page that was just shown is laid out in steps
            EXPECT_TRUE(shown.grab().save(
                QDir(folderName).filePath(u"query-%1-%2.png"_s.arg(name, narrow ? u"240"_s : u"1100"_s))));
        }
    }
    template <typename Widget = QWidget>
    Widget& Part(const QString& name) const
    {
        auto* part = dialog->findChild<Widget*>(name);
        EXPECT_TRUE(part) << name.toStdString();
        return *part;
    }
    void Show(int tab) const { dialog->findChild<QTabWidget*>()->setCurrentIndex(tab); }
    QPushButton& Button(Str text) const
    {
        for (auto* button : dialog->findChildren<QPushButton*>()) {
            if (button->text() == StringText(text))
                return *button;
        }
        ADD_FAILURE() << "no button " << StringText(text).toStdString();
        return Part<QPushButton>(u"run"_s);
    }
    QString Why() const
    {
        for (auto* pages : dialog->findChildren<QStackedWidget*>()) {
            if (auto* reason = qobject_cast<QLabel*>(pages->currentWidget()); reason && pages->isVisible())
                return reason->text();
        }
        return {};
    }

    // Takes a field (empty: the table) into a clause as a person does: in a wide dialog chosen in the lists and
    // taken by the clause's button, in a narrow one picked into the clause's box.
    void Pick(Str clause, const QString& table, const QString& field)
    {
        auto* names = dialog->findChild<NameLists*>();
        if (narrow) {
            Part<StatementEdit>(StringText(clause)).setFocus();
            const auto boxes = names->findChildren<QComboBox*>();
            boxes[0]->setCurrentText(table);
            Q_EMIT boxes[0]->textActivated(table);
            const int entry = field.isEmpty() ? 0 : boxes[1]->findText(field);
            boxes[1]->setCurrentIndex(entry);
            Q_EMIT boxes[1]->activated(entry);
            return;
        }
        const auto lists = names->findChildren<QListWidget*>();
        lists[0]->setCurrentItem(lists[0]->findItems(table, Qt::MatchExactly).value(0));
        if (!field.isEmpty())
            lists[1]->setCurrentItem(lists[1]->findItems(field, Qt::MatchExactly).value(0));
        QTest::mouseClick(&Button(clause), Qt::LeftButton);
    }

    // Runs what is written; gives the first record that the table view shows.
    QStringList RunAndRead()
    {
        QStringList first;
        QTimer::singleShot(0, dialog.get(), [&] {
            auto* result = qobject_cast<CResultWindow*>(QApplication::activeModalWidget());
            ASSERT_TRUE(result);
            auto& browser = const_cast<RecordBrowser&>(result->View().Browser()); // its records are read here
            for (int i = 0; i < browser.FieldCount(); ++i)
                first += browser.Recordset().ValueText(i);
            first += QString::number(browser.Recordset().RecordCount());
            Paint(*result, u"result"_s);
            result->reject();
        });
        Part<QPushButton>(u"run"_s).click();
        return first;
    }

    QTemporaryDir home;
    FormStore store{home.filePath(u"q.raf"_s)};
    Profile profile{home.filePath(u"p.ini"_s)};
    StatementHistory history{profile, u"db"_s};
    QWidget window;
    std::unique_ptr<QueryDraft> draft;
    std::unique_ptr<CQueryDialog> dialog;
    bool narrow = false;
    int changes = 0;
};

TEST_F(QueryDialog, WritesTheSameStatementByEachTool)
{
    const QStringList first = {u"Cork"_s, u"7"_s, u"2"_s};
    for (const QSize size : {kHandheld, kDesktop}) {
        Open(size);
        QTest::keyClicks(&Part<StatementEdit>(u"sql"_s), kStatement);
        QTest::keyClick(&Part<StatementEdit>(u"sql"_s), Qt::Key_Escape); // the list that completes
        Paint(*dialog, u"sql"_s);
        EXPECT_EQ(draft->Statement(), kStatement);
        EXPECT_EQ(RunAndRead(), first);
        EXPECT_EQ(history.Statements().value(0), kStatement);

        Open(size);
        Show(1);
        Pick(Str::ClauseSelect, u"Customers"_s, u"City"_s);
        Part<StatementEdit>(u"SELECT"_s).insertPlainText(u", SUM(Orders.Qty)"_s);
        Pick(Str::ClauseFrom, u"Customers"_s, {});
        if (narrow) {
            Pick(Str::ClauseJoin, u"Orders"_s, {});
            Pick(Str::ClauseOn, u"Customers"_s, u"CustomerID"_s);
            Part<StatementEdit>(u"ON"_s).insertPlainText(u" ="_s);
            Pick(Str::ClauseOn, u"Orders"_s, u"CustomerID"_s);
        } else {
            Pick(Str::ClauseJoin, u"Orders"_s, {}); // proposes ON
        }
        Pick(Str::ClauseWhere, u"Orders"_s, u"Qty"_s);
        Part<StatementEdit>(u"WHERE"_s).insertPlainText(u" > 5 GROUP BY Customers.City"_s);
        Pick(Str::ClauseOrder, u"Customers"_s, u"City"_s);
        Paint(*dialog, u"builder"_s);
        EXPECT_EQ(draft->Statement(), kStatement);
        EXPECT_EQ(RunAndRead(), first);
        Show(0);
        EXPECT_EQ(Part<StatementEdit>(u"sql"_s).toPlainText(), kStatement);
        Show(1); // groups have no box
        EXPECT_EQ(Why(), StringText(Str::BuilderHasNoBox, {u"GROUP BY"_s}));
        Paint(*dialog, u"builder-why"_s);
        EXPECT_EQ(draft->Statement(), kStatement);
    }
    EXPECT_TRUE(dialog->findChild<QTabWidget*>()->isTabVisible(2));
    Open(kHandheld);
    EXPECT_FALSE(dialog->findChild<QTabWidget*>()->isTabVisible(2));
}

TEST_F(QueryDialog, DrawsTheStatement)
{
    Open(kDesktop);
    Show(2);
    Paint(*dialog, u"diagram-empty"_s);
    const auto lists = dialog->findChild<NameLists*>()->findChildren<QListWidget*>();
    for (const QString& table : {u"Customers"_s, u"Orders"_s}) {
        lists[0]->setCurrentItem(lists[0]->findItems(table, Qt::MatchExactly).value(0));
        QTest::keyClick(lists[0], Qt::Key_Return);
    }
    const auto tick = [this](const QString& table, const QString& field) {
        auto* fields = Part<DiagramBox>(table).findChild<QListWidget*>();
        fields->findItems(field, Qt::MatchExactly).value(0)->setCheckState(Qt::Checked);
    };
    tick(u"Customers"_s, u"City"_s);
    tick(u"Orders"_s, u"Qty"_s);
    auto* grid = &Part<QTableWidget>(u"diagramGrid"_s);
    ASSERT_EQ(grid->rowCount(), 3);
    const auto choose = [grid](int row, int column, int choice) {
        auto* box = qobject_cast<QComboBox*>(grid->cellWidget(row, column));
        box->setCurrentIndex(choice);
        Q_EMIT box->activated(choice);
        QApplication::processEvents();
    };
    choose(0, 2, int(ColumnOrder::Ascending));
    choose(1, 1, int(Total::Sum));
    grid->item(2, 0)->setText(u"Orders.Qty"_s);
    QApplication::processEvents();
    grid->item(2, 3)->setText(u"> 5"_s);
    QApplication::processEvents();
    grid->item(2, 4)->setCheckState(Qt::Unchecked);
    QApplication::processEvents();
    EXPECT_EQ(draft->Statement(), kStatement);
    QTest::qWait(400);
    const auto* shown = &Part<QTableWidget>(u"firstRecords"_s);
    ASSERT_EQ(shown->rowCount(), 2);
    EXPECT_EQ(shown->item(1, 1)->text(), u"14");
    Paint(*dialog, u"diagram"_s);
    EXPECT_EQ(RunAndRead(), (QStringList{u"Cork"_s, u"7"_s, u"2"_s}));

    Show(0);
    EXPECT_EQ(Part<StatementEdit>(u"sql"_s).toPlainText(), kStatement);
    Show(2); // reads back what it wrote
    EXPECT_EQ(draft->Statement(), kStatement);
    EXPECT_EQ(grid->rowCount(), 4);
    Show(0);
    Part<StatementEdit>(u"sql"_s).setPlainText(u"SELECT 1 + 1"_s);
    Show(2);
    EXPECT_EQ(Why(), StringText(Str::DiagramCannotDraw));
    EXPECT_EQ(draft->Statement(), u"SELECT 1 + 1");
}

TEST_F(QueryDialog, SavesOpensChangesAndExports)
{
    Open(kHandheld);
    Part<StatementEdit>(u"sql"_s).setPlainText(kStatement);
    Part<QPushButton>(u"save"_s).click(); // without a name
    EXPECT_TRUE(dialog->isVisible());
    EXPECT_TRUE(Part<QLineEdit>(u"queryName"_s).hasFocus());
    QTest::keyClicks(&Part<QLineEdit>(u"queryName"_s), u"By city"_s);
    QTest::keyClick(dialog.get(), Qt::Key_S, Qt::ControlModifier);
    EXPECT_EQ(dialog->result(), QDialog::Accepted);
    ASSERT_TRUE(store.FindQuery(u"By city"));
    EXPECT_EQ(store.FindQuery(u"By city")->text.Text(), kStatement);
    EXPECT_EQ(store.FindQuery(u"By city")->tableName.Text(), u"Customers");

    Open(kDesktop, {.name = u"By city"_s, .statement = kStatement, .table = u"Customers"_s});
    Part<StatementEdit>(u"sql"_s).setPlainText(kStatement + u" DESC"_s);
    Part<QPushButton>(u"save"_s).click();
    EXPECT_EQ(store.FindQuery(u"By city")->text.Text(), kStatement + u" DESC"_s);

    // Exported by the wizard, whose source is chosen in the builder.
    ExportDraft out(connection, path, prompt);
    ASSERT_TRUE(out.SetSource(u"SELECT * FROM Customers"_s));
    const WriteQuery write = [](const QueryWanted& wanted, const TakeQuery& take, QWidget&) {
        EXPECT_EQ(wanted.statement, u"SELECT * FROM Customers");
        EXPECT_FALSE(take({}, u"SELECT nothing FROM nowhere"_s));
        EXPECT_TRUE(take({}, kStatement));
    };
    CExportWizard wizard(out, u"By city"_s, path, write, &window);
    for (auto* button : wizard.findChildren<QPushButton*>()) {
        if (button->text() == StringText(Str::ExportQuery))
            button->click();
    }
    EXPECT_EQ(out.Source(), kStatement);
    ASSERT_TRUE(out.ChoosePath(home.filePath(u"out.csv"_s)));
    EXPECT_TRUE(out.Run());
    QFile written(home.filePath(u"out.csv"_s));
    ASSERT_TRUE(written.open(QIODevice::ReadOnly));
    EXPECT_EQ(QString::fromUtf8(written.readAll()), u"\"Cork\",7\r\n\"Oslo\",14\r\n");
}

TEST_F(QueryDialog, MarksThePlaceOfAFault)
{
    for (const QSize size : {kHandheld, kDesktop}) {
        Open(size);
        Show(1);
        Part<StatementEdit>(u"SELECT"_s).setPlainText(u"Cty"_s);
        Part<StatementEdit>(u"FROM"_s).setPlainText(u"Customers"_s);
        prompt.shown.clear();
        Part<QPushButton>(u"run"_s).click();
        EXPECT_EQ(prompt.shown.size(), 1);
        auto& sql = Part<StatementEdit>(u"sql"_s);
        ASSERT_TRUE(sql.HasFault());
        EXPECT_EQ(sql.extraSelections().first().cursor.selectedText(), u"Cty");
        EXPECT_FALSE(dialog->findChild<ErrorLine*>()->Text().isEmpty());
        Paint(*dialog, u"fault"_s);
        QTest::keyClicks(&sql, u"x"_s);
        EXPECT_FALSE(sql.HasFault());
    }
}

TEST_F(QueryDialog, CompletesNames)
{
    for (const QSize size : {kHandheld, kDesktop}) {
        Open(size);
        auto& sql = Part<StatementEdit>(u"sql"_s);
        QTest::keyClicks(&sql, u"SELECT * FROM Cust"_s);
        auto* completer = sql.findChild<QCompleter*>();
        ASSERT_TRUE(completer->popup()->isVisible());
        EXPECT_LE(completer->popup()->width(), dialog->width());
        Paint(*completer->popup(), u"completion"_s);
        QTest::keyClick(completer->popup(), Qt::Key_Return);
        EXPECT_EQ(sql.toPlainText(), u"SELECT * FROM Customers");
    }
}

TEST_F(QueryDialog, RunsAChangeOnlyAfterItsQuestion)
{
    Open(kDesktop);
    Part<StatementEdit>(u"sql"_s).setPlainText(u"DELETE FROM Orders"_s);
    Part<QPushButton>(u"run"_s).click();
    EXPECT_EQ(Stored(u"SELECT COUNT(*) FROM Orders"_s), u"4");
    prompt.answers = {true};
    Part<QPushButton>(u"run"_s).click();
    EXPECT_EQ(Stored(u"SELECT COUNT(*) FROM Orders"_s), u"0");
    EXPECT_EQ(changes, 1);
    Show(1);
    EXPECT_EQ(Why(), StringText(Str::BuilderOnlySelect));
}

TEST_F(QueryDialog, AsksBeforeChangesAreLost)
{
    Open(kDesktop);
    dialog->reject(); // nothing to lose
    EXPECT_FALSE(dialog->isVisible());
    Open(kDesktop);
    Part<StatementEdit>(u"sql"_s).setPlainText(u"SELECT 1"_s);
    prompt.answers = {false, true};
    dialog->close();
    EXPECT_TRUE(dialog->isVisible());
    dialog->close();
    EXPECT_FALSE(dialog->isVisible());
    EXPECT_EQ(prompt.questions.size(), 2);
}

TEST_F(QueryDialog, KeepsAFixedSelectClauseOutOfSight)
{
    const QueryRequest request{.nameUse = QueryRequest::Name::None,
                               .statement = u"SELECT * WHERE Qty > 5"_s,
                               .table = u"Orders"_s,
                               .selectClause = u"SELECT *"_s};
    for (const QSize size : {kHandheld, kDesktop}) {
        Open(size, request);
        EXPECT_EQ(Part<StatementEdit>(u"sql"_s).toPlainText(), u"WHERE Qty > 5");
        Paint(*dialog, u"fixed-sql"_s);
        Show(1);
        EXPECT_FALSE(Part<StatementEdit>(u"SELECT"_s).isVisible());
        EXPECT_EQ(Part<StatementEdit>(u"WHERE"_s).toPlainText(), u"Qty > 5");
        Paint(*dialog, u"fixed-builder"_s);
        Part<StatementEdit>(u"ORDER BY"_s).setPlainText(u"Qty DESC"_s);
        EXPECT_EQ(RunAndRead(), (QStringList{u"3"_s, u"3"_s, u"8"_s, u"-1"_s, u"3"_s}));
        Part<QPushButton>(u"save"_s).click();
        EXPECT_EQ(draft->Statement(), u"SELECT * WHERE Qty > 5 ORDER BY Qty DESC");
        EXPECT_FALSE(dialog->findChild<QTabWidget*>()->isTabVisible(2));
    }
}

TEST_F(QueryDialog, StaysWhileItsCallerRefusesTheStatement)
{
    bool takes = false;
    Open(kDesktop, {.nameUse = QueryRequest::Name::Offered, .statement = u"SELECT Cty FROM Customers"_s},
         [&](const QString&, const QString&) { return takes; });
    Part<QPushButton>(u"save"_s).click();
    EXPECT_TRUE(dialog->isVisible());
    EXPECT_TRUE(Part<StatementEdit>(u"sql"_s).HasFault());
    takes = true;
    Part<QPushButton>(u"save"_s).click();
    EXPECT_FALSE(dialog->isVisible());
    EXPECT_TRUE(store.Queries().empty());
}

} // namespace
} // namespace mirel
