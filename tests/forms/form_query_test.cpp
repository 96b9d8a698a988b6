#include "forms/form_query.h"

#include "support/printing.h"

#include <gtest/gtest.h>

#include <QHash>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

std::optional<QString> TextOf(QStringView name)
{
    static const QHash<QString, QString> texts = {{u"Town"_s, u"Cork"_s},
                                                  {u"Ship To"_s, u"O'Brien"_s},
                                                  {u"Empty"_s, u""_s},
                                                  {u"Hostile"_s, u"x' OR 1=1 --"_s},
                                                  {u"Quotes"_s, u"5\""_s}};
    const auto at = texts.find(name.toString());
    return at == texts.end() ? std::nullopt : std::optional(*at);
}

struct Row {
    const char16_t* query;
    const char16_t* completed;
};

void ExpectCompleted(const std::vector<Row>& rows)
{
    for (const Row& row : rows) {
        const QString query = QString::fromUtf16(row.query);
        EXPECT_EQ(CompleteQuery(query, u"My Birds"_s, TextOf), QString::fromUtf16(row.completed));
    }
}

TEST(CompleteQuery, PutsTheFormsTableWhereFromIsMissing)
{
    ExpectCompleted({
        {u"SELECT *", u"SELECT * FROM [My Birds]"},
        {u"SELECT * ;", u"SELECT * FROM [My Birds]"},
        {u"SELECT * WHERE A=1", u"SELECT * FROM [My Birds] WHERE A=1"},
        {u"SELECT *\r\nwhere A=1 order by B", u"SELECT * FROM [My Birds] where A=1 order by B"},
        {u"SELECT * ORDER BY B", u"SELECT * FROM [My Birds] ORDER BY B"},
        {u"SELECT A,COUNT(*) GROUP BY A", u"SELECT A,COUNT(*) FROM [My Birds] GROUP BY A"},
        {u"SELECT * INNER JOIN T ON T.A=B WHERE C=1", u"SELECT * FROM [My Birds] INNER JOIN T ON T.A=B WHERE C=1"},
        {u"SELECT * LEFT JOIN T ON T.A=B", u"SELECT * FROM [My Birds] LEFT JOIN T ON T.A=B"},
        {u"SELECT LEFT(A,2) WHERE A='x FROM y'", u"SELECT LEFT(A,2) FROM [My Birds] WHERE A='x FROM y'"},
        {u"SELECT * FROM T WHERE A=1", u"SELECT * FROM T WHERE A=1"},
        {u"SELECT [FROM] FROM T", u"SELECT [FROM] FROM T"},
        {u"SELECT *\nFROM T\tWHERE A='x\ny'", u"SELECT * FROM T WHERE A='x\ny'"},
        {u"T", u"T"},
        {u"SELECT 'never closed", u"SELECT 'never closed"},
    });
}

TEST(CompleteQuery, PutsTextsOfControlsInAsLiterals)
{
    ExpectCompleted({
        {u"SELECT * FROM T WHERE A=&[Town]", u"SELECT * FROM T WHERE A='Cork'"},
        {u"SELECT * FROM T WHERE A=&Town AND B=1", u"SELECT * FROM T WHERE A='Cork' AND B=1"},
        {u"SELECT * FROM T WHERE A=&[Ship To]", u"SELECT * FROM T WHERE A='O''Brien'"},
        {u"SELECT * FROM T WHERE A=&[Empty]", u"SELECT * FROM T WHERE A=NULL"},
        {u"SELECT * FROM T WHERE A LIKE '%&[Ship To]%'", u"SELECT * FROM T WHERE A LIKE '%O''Brien%'"},
        {u"SELECT * FROM T WHERE A LIKE '&[Empty]%'", u"SELECT * FROM T WHERE A LIKE '%'"},
        {u"SELECT * FROM T WHERE A=\"&[Quotes]&[Ship To]\"", u"SELECT * FROM T WHERE A=\"5\"\"O'Brien\""},
        {u"SELECT * FROM T WHERE A=&[Hostile]", u"SELECT * FROM T WHERE A='x'' OR 1=1 --'"},
        {u"SELECT * FROM T WHERE A='&[Hostile]'", u"SELECT * FROM T WHERE A='x'' OR 1=1 --'"},
    });
}

TEST(CompleteQuery, LeavesWhatNamesNoControl)
{
    ExpectCompleted({
        {u"SELECT [A]&[B] FROM T", u"SELECT [A]&[B] FROM T"}, // joins two fields
        {u"SELECT * FROM T WHERE A='R&Town'", u"SELECT * FROM T WHERE A='R&Town'"},
        {u"SELECT [R&[Town] FROM T", u"SELECT [R&[Town] FROM T"},
        {u"SELECT * FROM T WHERE A=&[Town", u"SELECT * FROM T WHERE A=&[Town"},
        {u"SELECT * FROM T WHERE A=&", u"SELECT * FROM T WHERE A=&"},
    });
}

} // namespace
} // namespace mirel
