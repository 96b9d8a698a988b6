// What the planner writes, run by the engine it is written for.
#include "dialect/plan_fixture.h"
#include "provider/sqlite/dialect_functions.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <sqlite3.h>

#include <memory>

namespace mirel::sqlite {
namespace {

using namespace Qt::StringLiterals;

// A database in memory with the tables of TestSchema and one record in each; the engine's own functions are
// stood in for by plain ones.
class WrittenSql : public ::testing::Test {
protected:
    WrittenSql()
    {
        sqlite3* opened = nullptr;
        EXPECT_EQ(sqlite3_open(":memory:", &opened), SQLITE_OK);
        database_.reset(opened);
        sqlite3_db_config(opened, SQLITE_DBCONFIG_DQS_DML, 0, nullptr);
        sqlite3_limit(opened, SQLITE_LIMIT_EXPR_DEPTH, kMaxExpressionDepth);
        EXPECT_EQ(RegisterDialectFunctions(opened), SQLITE_OK);
        const auto add = [opened](const char* name, int arguments, auto* function) {
            sqlite3_create_function(opened, name, arguments, SQLITE_UTF8, nullptr, function, nullptr, nullptr);
        };
        add(kSortKeyFunction, 1, Same);
        add(kDateFunction, 1, StoredDate);
        add(kLikeFunction, 2, Like);
        Run("CREATE TABLE Items (Name VARCHAR(10), Qty INTEGER, Small SMALLINT, Price FLOAT, Made DATETIME,"
            " Sold BIT, Note TEXT, Photo LONG VARBINARY);"
            "CREATE TABLE Orders (Item VARCHAR(10), Qty INTEGER, [Ship To] VARCHAR(40));"
            "CREATE TABLE Old (Day DATE, Name TEXT);"
            "CREATE TABLE [Order Details] (\"a]b\" INTEGER);"
            "INSERT INTO Items VALUES ('Ärger',7,2,2.5,'2001-07-04 09:05:00',1,NULL,x'00');"
            "INSERT INTO Orders VALUES ('Ärger',3,'Köln');"
            "INSERT INTO Old VALUES ('2001-07-04T00:00:00','x');"
            "INSERT INTO [Order Details] VALUES (5);");
    }

    // What the statement's first record holds, its fields separated by "|"; the error where there is one.
    QString First(const QString& statement)
    {
        const PlanResult planned = PlanStatement(statement, dialect::TestSchema());
        if (const auto* failure = std::get_if<PlanFailure>(&planned))
            return u"refused: "_s + QString::number(quint32(failure->code), 16);
        return QString::fromUtf8(Run(SqlOf(std::get<Plan>(planned))));
    }

    QByteArray Run(const QByteArray& sql)
    {
        QByteArray record;
        char* error = nullptr;
        if (sqlite3_exec(database_.get(), sql.constData(), Keep, &record, &error) == SQLITE_OK)
            return record;
        const QByteArray message(error);
        sqlite3_free(error);
        const std::optional<Hr> refused = StoreFailure({message.constData(), size_t(message.size())});
        return refused ? "stores not: " + QByteArray::number(quint32(*refused), 16) : message;
    }

private:
    struct Closer {
        void operator()(sqlite3* database) const { sqlite3_close(database); }
    };

    static QByteArray SqlOf(const Plan& plan)
    {
        if (const auto* change = std::get_if<ChangePlan>(&plan))
            return change->sql;
        const auto& select = std::get<SelectPlan>(plan);
        QByteArray sql = select.distinct ? "SELECT DISTINCT " : "SELECT ";
        sql += select.columns.front();
        for (size_t i = 1; i < select.columns.size(); ++i)
            sql += ',' + select.columns[i];
        if (!select.from.isEmpty())
            sql += " FROM " + select.from;
        if (!select.where.isEmpty())
            sql += " WHERE " + select.where;
        return sql + ' ' + select.group + ' ' + OrderClause(select.order);
    }

    static int Keep(void* record, int count, char** values, char**)
    {
        auto& text = *static_cast<QByteArray*>(record);
        if (!text.isEmpty())
            return 0;
        for (int i = 0; i < count; ++i)
            text += (i > 0 ? "|" : "") + QByteArray(values[i] ? values[i] : "NULL");
        return 0;
    }

    static void Same(sqlite3_context* context, int, sqlite3_value** arguments)
    {
        sqlite3_result_value(context, arguments[0]);
    }
    static void StoredDate(sqlite3_context* context, int, sqlite3_value** arguments)
    {
        static constexpr int kDateAndTime = 19;
        if (sqlite3_value_type(arguments[0]) == SQLITE_NULL)
            return;
        sqlite3* database = sqlite3_context_db_handle(context);
        sqlite3_stmt* statement = nullptr;
        sqlite3_prepare_v2(database, "SELECT replace(datetime(?1),' 00:00:00','')", -1, &statement, nullptr);
        sqlite3_bind_value(statement, 1, arguments[0]);
        sqlite3_step(statement);
        EXPECT_LE(sqlite3_column_bytes(statement, 0), kDateAndTime);
        sqlite3_result_value(context, sqlite3_column_value(statement, 0));
        sqlite3_finalize(statement);
    }
    static void Like(sqlite3_context* context, int, sqlite3_value** arguments)
    {
        const auto* text = reinterpret_cast<const char*>(sqlite3_value_text(arguments[0]));
        const auto* pattern = reinterpret_cast<const char*>(sqlite3_value_text(arguments[1]));
        if (text && pattern)
            sqlite3_result_int(context, sqlite3_strlike(pattern, text, 0) == 0);
    }

    std::unique_ptr<sqlite3, Closer> database_;
};

TEST_F(WrittenSql, GivesWhatTheDialectMeans)
{
    const std::vector<std::pair<QString, QString>> rows = {
        {u"Qty/2, Qty-(2-1), Qty-2-1, -(-Qty), -Qty*2, Qty%4"_s, u"3.5|6|4|7|-14|3"_s},
        {u"(Qty+1)*2, Qty+1*2, 8/(Qty-3)/2, Qty/0"_s, u"16|9|1.0|NULL"_s},
        {u"Name & Note, Name || Note, Name + '!', 'n' & Qty + 1"_s, u"Ärger|NULL|Ärger!|n8"_s},
        {u"Price * 40 & ' EUR', 'made ' & Made, 1.50 & '', 'on ' & NOW() - NOW()"_s,
         u"100 EUR|made 7/4/2001 9:05:00 AM|1.5|on 0"_s},
        {u"'a' & (Note & ('b' & Qty)) & 'c', 'x' || ('y' || Name), IIF(Qty=1,'a',IIF(Qty=7,'b','c'))"_s,
         u"ab7c|xyÄrger|b"_s},
        {u"UPPER(Name), LOWER('ÀB'), UPPER(Note), LENGTH(Name)"_s, u"ÄRGER|àb|NULL|5"_s},
        {u"LEFT(Name,2), RIGHT(Name,2), RIGHT(Name,0), LEFT(Name,-1), RIGHT(Name,9)"_s, u"Är|er|||Ärger"_s},
        {u"MID(Name,2,3), SUBSTR(Name,4), INSTR(Name,'g'), REPLACE(Name,'r','R')"_s, u"rge|er|3|ÄRgeR"_s},
        {u"ROUND(2.567,1), ABS(-3), INT(-2.5), INT(2.5), TRIM('  x '), NZ(Note,'none')"_s, u"2.6|3|-3|2|x|none"_s},
        {u"YEAR(Made), MONTH(Made), DAY('7/4/2001'), HOUR(Made), MINUTE(Made)"_s, u"2001|7|4|9|5"_s},
        {u"Made + 1, 1 + Made, Made - 0.5, Made - Made"_s,
         u"2001-07-05 09:05:00|2001-07-05 09:05:00|2001-07-03 21:05:00|0.0"_s},
        {u"IIF(Qty > 5, 'many', 'few'), COALESCE(Note, NULL, Name)"_s, u"many|Ärger"_s},
        {u"NOT Name LIKE 'x%', Name NOT LIKE '%RG%', NOT Note LIKE 'x'"_s, u"1|0|NULL"_s},
        {u"Qty BETWEEN 1 AND 7 AND Small = 2, Qty NOT IN (1,2), Note IS NULL, Note = NULL"_s, u"1|1|1|NULL"_s},
        {u"(Qty = 7) = (Small = 2), Sold IS TRUE, (Note IS NULL) IS FALSE, TRUE, FALSE"_s, u"1|1|0|1|0"_s},
        {u"Qty = 7 OR Qty = 8 AND Small = 9, (Qty = 7 OR Qty = 8) AND Small = 9"_s, u"1|0"_s},
        {u"'it''s', \"say \"\"so\"\"\", 99999999999999999999 > 1"_s, u"it's|say \"so\"|1"_s},
        {u"Sold = -1, Sold = 'yes', Sold <> 0, Sold < 5, Sold = TRUE"_s, u"1|1|1|1|1"_s},
        {u"Qty = 7, Qty <> 7, Qty < 7, Qty <= 7, Qty > 7, Qty >= 7"_s, u"1|0|0|1|0|1"_s},
        {u"Qty <= 6, Qty <= 8, Qty >= 6, Qty >= 8, Qty BETWEEN 7 AND 7"_s, u"0|1|1|0|1"_s},
        {u"'2.50' LIKE 2.50, '2.5' LIKE 2.50, Qty LIKE 7"_s, u"1|0|1"_s}, // a number is the text that was written
        {u"Qty = '7', Name = 'ärger', Small < 99999, Made = '7/4/2001 9:05'"_s, u"1|0|1|1"_s},
    };
    for (const auto& [expressions, expected] : rows)
        EXPECT_EQ(First(u"SELECT "_s + expressions + u" FROM Items"_s), expected) << qPrintable(expressions);
    EXPECT_EQ(First(u"SELECT 'a"_s + QChar(u'\0') + u"b' = Name FROM Items"_s), u"0"_s);
}

TEST_F(WrittenSql, IsAcceptedInEveryShape)
{
    const std::vector<std::pair<QString, QString>> rows = {
        {u"[order details]"_s, u"5"_s},
        {u"SELECT Day FROM Old WHERE Day = '7/4/2001' AND Day IS NOT NULL ORDER BY Day DESC"_s,
         u"2001-07-04T00:00:00"_s},
        {u"SELECT i.Qty, [Ship To] FROM Items i INNER JOIN Orders ON i.Name = Orders.Item ORDER BY 2, i.Qty"_s,
         u"7|Köln"_s},
        {u"SELECT Old.Name FROM (Items LEFT JOIN Orders ON Items.Qty = Orders.Qty) INNER JOIN Old ON 1 = 1"_s,
         u"x"_s},
        {u"SELECT Item AS n, COUNT(*) FROM Orders GROUP BY n, 'x' HAVING SUM(Qty) > 2 ORDER BY COUNT(*), n"_s,
         u"Ärger|1"_s},
        {u"SELECT DISTINCT Name FROM Items ORDER BY Name"_s, u"Ärger"_s},
        {u"SELECT COUNT(*), COUNT(Note), COUNT(DISTINCT Qty), AVG(Qty), MIN(Made) FROM Items"_s,
         u"1|0|1|7.0|2001-07-04 09:05:00"_s},
        {u"SELECT COUNT(*) FROM Items HAVING COUNT(*) > 1"_s, u""_s},
        {u"SELECT 1 + 1"_s, u"2"_s},
    };
    for (const auto& [statement, expected] : rows)
        EXPECT_EQ(First(statement), expected) << qPrintable(statement);
}

TEST_F(WrittenSql, StoresWhatFitsAndRefusesTheRest)
{
    const auto first = [this](const QString& columns) { return First(u"SELECT "_s + columns + u" FROM Items"_s); };
    EXPECT_EQ(First(u"UPDATE Items SET Qty = Qty * 2, Name = UPPER(Name), Made = Made + 1, Sold = Qty = 0"_s),
              u""_s);
    EXPECT_EQ(first(u"Qty, Name, Made, Sold"_s), u"14|ÄRGER|2001-07-05 09:05:00|0"_s);
    EXPECT_EQ(First(u"UPDATE Items SET Qty = Price"_s), u"stores not: 80040e07"_s);
    EXPECT_EQ(First(u"UPDATE Items SET Small = Qty * 10000"_s), u"stores not: 80040e57"_s);
    EXPECT_EQ(First(u"UPDATE Items SET Name = Name || Name || 'x'"_s), u"stores not: 80040e57"_s);
    EXPECT_EQ(First(u"UPDATE Items SET Made = Name"_s), u"stores not: 80040e07"_s);
    EXPECT_EQ(first(u"Qty, Small, Name"_s), u"14|2|ÄRGER"_s);
    EXPECT_EQ(First(u"INSERT INTO Items (Name, Qty, Made) VALUES ('a', 1 + 1, '1/2/2003')"_s), u""_s);
    EXPECT_EQ(First(u"DELETE FROM Items WHERE Items.Qty = 14"_s), u""_s);
    EXPECT_EQ(first(u"Name, Qty, Made"_s), u"a|2|2003-01-02"_s);
}

TEST_F(WrittenSql, StaysWithinTheEnginesDepth)
{
    // Either the dialect refuses, or the engine accepts: whatever nests, however deep.
    const std::vector<std::pair<QString, QString>> shapes = {
        {u"UPPER("_s, u")"_s},
        {u"REPLACE("_s, u",'a','b')"_s},
        {u"COALESCE(Name,"_s, u")"_s},
        {u"RIGHT("_s, u",2)"_s},
        {u"1+("_s, u")"_s},
        {u"LEFT('x',"_s, u")"_s},
        {u"'a' & ("_s, u")"_s},
        {u"Qty IN (1,"_s, u")"_s},
        {u"NOT "_s, u""_s},
        {u"- "_s, u""_s},
        {u"1 BETWEEN 2 AND ("_s, u")"_s},
        {u"IIF(1,2,"_s, u")"_s},
        {u"IIF(1,"_s, u",2)"_s},
        {u"IIF("_s, u",1,2)"_s},
        {u"INT("_s, u")"_s},
        {u"(1=1 OR 1=1 AND "_s, u")"_s},
        {u"1/("_s, u")"_s},
    };
    for (const auto& [open, close] : shapes) {
        bool refused = false;
        for (int depth = 1; depth < 120; ++depth) {
            const QString expression = open.repeated(depth) + u"Small"_s + close.repeated(depth);
            const QString result = First(u"SELECT "_s + expression + u" FROM Items"_s);
            refused = result == u"refused: 80040e14"_s;
            ASSERT_FALSE(result.contains(u"overflow"_s) || result.contains(u"depth"_s))
                << qPrintable(open) << " at " << depth << ": " << qPrintable(result);
            if (refused)
                break;
        }
        EXPECT_TRUE(refused) << qPrintable(open);
    }
}

TEST_F(WrittenSql, CarriesThousandsOfConditions)
{
    QString filter = u"Qty > 0"_s;
    for (int i = 100; i < 5100; ++i)
        filter = u" ("_s + filter + u") AND (NOT(Qty = "_s + QString::number(i) + u" OR Name LIKE '%nothing%'))"_s;
    EXPECT_EQ(First(u"SELECT Qty FROM Items WHERE"_s + filter), u"7"_s);
}

} // namespace
} // namespace mirel::sqlite
