// Filters of every operator and type on the sample's real records, held against what plain SQL counts in a copy of
// the file.
#include "app/sample_database.h"
#include "data/filter_condition.h"
#include "support/printing.h"
#include "support/scripted_prompt.h"
#include "support/sqlite_file.h"
#include "tableview/field_lists.h"
#include "tableview/record_browser.h"

#include <gtest/gtest.h>

#include <QFile>
#include <QTemporaryDir>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class FilterOnData : public ::testing::Test {
protected:
    // The sample takes a moment to make, and no test changes it.
    static void SetUpTestSuite()
    {
        folder_ = new QTemporaryDir;
        DbConnection connection;
        ScriptedPrompt prompt;
        const ProgramFolder programs = ProgramFolder::Find(folder_->path());
        DatabaseSession session(connection, programs, prompt);
        const SampleDatabase sample(programs, QStringLiteral(MIREL_SOURCE_DIR "/samples"));
        ASSERT_TRUE(sample.Open(session)) << prompt.shown.join(u'\n').toStdString();
        path_ = session.Location().Text();
        session.Close();
        ASSERT_TRUE(QFile::copy(path_, CopyPath()));
    }
    static void TearDownTestSuite()
    {
        delete folder_;
        folder_ = nullptr;
    }
    static QString CopyPath() { return folder_->filePath(u"copy.db"_s); }

    QString Counted(const QString& table, const QByteArray& condition)
    {
        return plain_.Text("SELECT count(*) FROM \"" + table.toUtf8() + "\" WHERE " + condition);
    }
    QString Shown() { return QString::number(browser_.Recordset().RecordCount()); }
    void Open(const QString& table)
    {
        ASSERT_TRUE(browser_.Open(RecordBrowser::StatementOfTable(table))) << table.toStdString();
    }

    inline static QTemporaryDir* folder_ = nullptr;
    inline static QString path_;

    SqliteFile plain_{CopyPath()};
    DbConnection connection_;
    ScriptedPrompt prompt_;
    FieldLists lists_{connection_, path_, prompt_};
    RecordBrowser browser_{connection_, path_, prompt_, {}};
};

TEST_F(FilterOnData, FindsWhatTheOperatorSays)
{
    const struct Row {
        QString table;
        QString field;
        QString operatorText;
        QString value;
        QByteArray condition;
        QString toOperator = {};
        QString toValue = {};
    } rows[] = {
        {u"Bird Strikes"_s, u"Airport Name"_s, u"contains"_s, u"intl"_s, "instr(\"Airport Name\",'INTL')>0"},
        {u"Bird Strikes"_s, u"Wildlife Species"_s, u"not contains"_s, u"bird"_s,
         "instr(lower(\"Wildlife Species\"),'bird')=0"},
        {u"Bird Strikes"_s, u"Wildlife Species"_s, u"begins with"_s, u" 'Turkey' "_s,
         "substr(\"Wildlife Species\",1,6)='Turkey'"},
        {u"Bird Strikes"_s, u"Wildlife Species"_s, u"not begins with"_s, u"\"Unknown\""_s,
         "substr(\"Wildlife Species\",1,7)<>'Unknown'"},
        {u"Bird Strikes"_s, u"Wildlife Species"_s, u"ends with"_s, u"Hawk"_s,
         "lower(substr(\"Wildlife Species\",-4))='hawk'"},
        {u"Bird Strikes"_s, u"Wildlife Species"_s, u"not ends with"_s, u"gull"_s,
         "lower(substr(\"Wildlife Species\",-4))<>'gull'"},
        {u"Airports"_s, u"Name"_s, u"contains"_s, u"O'Hare"_s, "instr(Name,'O''Hare')>0"},
        {u"Airports"_s, u"State"_s, u">="_s, u"C"_s, "State>='C' AND State<'F'", u"<"_s, u"F"_s},
        {u"Bird Strikes"_s, u"Cost Total $"_s, u"="_s, u"0"_s, "\"Cost Total $\"=0"},
        {u"Bird Strikes"_s, u"Cost Total $"_s, u"not ="_s, u"0"_s, "\"Cost Total $\"<>0"},
        {u"Bird Strikes"_s, u"Cost Total $"_s, u">"_s, u"100000"_s, "\"Cost Total $\">100000"},
        {u"Bird Strikes"_s, u"Cost Total $"_s, u"<="_s, u"100000"_s, "\"Cost Total $\"<=100000"},
        {u"Bird Strikes"_s, u"Speed IAS in knots"_s, u">="_s, u"100"_s,
         "\"Speed IAS in knots\">=100 AND \"Speed IAS in knots\"<150", u"<"_s, u"150"_s},
        {u"Airports"_s, u"Latitude"_s, u"="_s, u"31.95376472"_s, "Latitude=31.95376472"},
        {u"Airports"_s, u"Latitude"_s, u"not ="_s, u"31.95376472"_s, "Latitude<>31.95376472"},
        {u"Airports"_s, u"Latitude"_s, u">"_s, u"60"_s, "Latitude>60"},
        {u"Airports"_s, u"Longitude"_s, u">="_s, u"-90.5"_s, "Longitude>=-90.5 AND Longitude<=-80", u"<="_s,
         u"-80"_s},
        {u"Bird Strikes"_s, u"Flight Date"_s, u"="_s, u"1/9/1990"_s, "\"Flight Date\"='1990-01-09'"},
        {u"Bird Strikes"_s, u"Flight Date"_s, u"not ="_s, u"1/9/1990"_s, "\"Flight Date\"<>'1990-01-09'"},
        {u"Bird Strikes"_s, u"Flight Date"_s, u"<"_s, u"1/1/1995"_s, "\"Flight Date\"<'1995-01-01'"},
        {u"Bird Strikes"_s, u"Flight Date"_s, u">="_s, u"9/10/1996"_s,
         "\"Flight Date\">='1996-09-10' AND \"Flight Date\"<='1997-02-01'", u"<="_s, u"2/1/1997"_s},
        {u"Orders"_s, u"Paid"_s, u"is true"_s, u""_s, "Paid<>0"},
        {u"Orders"_s, u"Paid"_s, u"is false"_s, u""_s, "Paid=0", u"is true"_s, u""_s},
        {u"Orders"_s, u"Remark"_s, u"contains"_s, u"gate"_s, "instr(Remark,'gate')>0"},
        {u"Orders"_s, u"Remark"_s, u"not contains"_s, u"gate"_s, "instr(Remark,'gate')=0"},
    };
    for (const Row& row : rows) {
        const FilterDraft draft{.table = row.table,
                                .field = row.field,
                                .type = lists_.TypeOf(row.table, row.field),
                                .fromTo = !row.toOperator.isEmpty(),
                                .operatorText = row.operatorText,
                                .valueText = row.value,
                                .toOperatorText = row.toOperator,
                                .toValueText = row.toValue};
        Open(row.table);
        EXPECT_TRUE(browser_.AddCondition(draft.Condition()))
            << draft.Condition().toStdString() << prompt_.shown.join(u'\n').toStdString();
        const QString expected = Counted(row.table, row.condition);
        EXPECT_NE(expected, u"0"_s) << "a row that proves nothing: " << row.condition.toStdString();
        EXPECT_EQ(Shown(), expected) << draft.Condition().toStdString();
    }
}

TEST_F(FilterOnData, KeepsOrLeavesOutWhatTheCellHolds)
{
    for (const QString& table : {u"Bird Strikes"_s, u"Orders"_s, u"Contacts"_s}) {
        Open(table);
        const int fields = browser_.FieldCount();
        for (int field = 0; field < fields; ++field) {
            const QByteArray column = '"' + browser_.FieldName(field).toUtf8() + '"';
            const QByteArray first =
                "(SELECT " + column + " FROM \"" + table.toUtf8() + "\" ORDER BY rowid LIMIT 1)";
            EXPECT_TRUE(browser_.SelectCell(0, field));
            EXPECT_TRUE(browser_.FilterByCell(CellFilter::BySelection));
            EXPECT_EQ(Shown(), Counted(table, column + " IS " + first)) << column.toStdString();
            EXPECT_TRUE(browser_.RemoveFilter());
            EXPECT_TRUE(browser_.SelectCell(0, field));
            EXPECT_TRUE(browser_.FilterByCell(CellFilter::ExcludingSelection));
            EXPECT_EQ(Shown(), Counted(table, "NOT(" + column + '=' + first + ") OR (" + first + " IS NULL AND " +
                                                  column + " NOT NULL)"))
                << column.toStdString();
            EXPECT_TRUE(browser_.RemoveFilter());
        }
    }
    EXPECT_EQ(prompt_.shown, QStringList());
}

TEST_F(FilterOnData, AddsUpAndGivesWayAgain)
{
    Open(u"Bird Strikes"_s);
    EXPECT_TRUE(browser_.AddCondition(u"[Wildlife Species] = 'Turkey vulture' OR [Cost Total $] > 1000"_s));
    EXPECT_TRUE(browser_.AddCondition(u"[Origin State] = 'Texas' OR [Origin State] = 'Florida'"_s));
    EXPECT_EQ(Shown(),
              Counted(u"Bird Strikes"_s, "(\"Wildlife Species\"='Turkey vulture' OR \"Cost Total $\">1000) "
                                         "AND \"Origin State\" IN ('Texas','Florida')"));
    const QString before = Shown();
    EXPECT_FALSE(browser_.AddCondition(u"[No Such Field] = 1"_s));
    EXPECT_EQ(prompt_.shown.size(), 1);
    EXPECT_EQ(Shown(), before) << "a refused filter leaves the result as it was";
    EXPECT_TRUE(browser_.SortByTerms(u"[Cost Total $] DESC,[Flight Date]"_s));
    EXPECT_EQ(browser_.Recordset().ValueText(browser_.Recordset().FieldIndex(u"Cost Total $")),
              plain_.Text("SELECT max(\"Cost Total $\") FROM \"Bird Strikes\" WHERE \"Origin State\" IN "
                          "('Texas','Florida')"));
    EXPECT_TRUE(browser_.RemoveFilter());
    EXPECT_EQ(Shown(), u"10000"_s);
}

} // namespace
} // namespace mirel
