// What the dialect's LIKE, ORDER BY and dates mean on real tables.
#include "provider/database_fixture.h"

#include <QRandomGenerator>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class EngineFunctions : public DatabaseFixture {
protected:
    EngineFunctions() { Run(u"CREATE TABLE T (A Varchar(50))"_s); }

    void Add(const QStringList& texts)
    {
        for (const QString& text : texts)
            Run(u"INSERT INTO T (A) VALUES ('%1')"_s.arg(text));
    }
};

TEST_F(EngineFunctions, LikeIgnoresCaseAndKnowsPercentAlone)
{
    const struct {
        QString text;
        QString pattern;
        bool matches;
    } rows[] = {
        {u"Hamburg"_s, u"ham%"_s, true},
        {u"Hamburg"_s, u"%BURG"_s, true},
        {u"Hamburg"_s, u"%amb%"_s, true},
        {u"Hamburg"_s, u"h%m%g"_s, true},
        {u"Hamburg"_s, u"amb"_s, false},
        {u"Hamburg"_s, u"%amb"_s, false},
        {u"Hamburg"_s, u"Ha%amburg"_s, false},
        {u"Hamburg"_s, u"%%"_s, true},
        {u"a_b"_s, u"A_B"_s, true},
        {u"axb"_s, u"a_b"_s, false},
        {u"ÄPFEL"_s, u"äpf%"_s, true},
        {u"Äpfel"_s, u"%FEL"_s, true},
        {u"Straße"_s, u"%STRAßE%"_s, true},
        {u"Zürich Kloten"_s, u"%KLOT%"_s, true},
        {u"5 \u212A"_s, u"%k"_s, true},       // the Kelvin sign
        {u"Gro\u017Fse"_s, u"gros%"_s, true}, // a long s
        {u"Äußere Größe"_s, u"%re%GRÖSSE%"_s, false},
        {u"Äußere Größe"_s, u"%re%GRÖßE%"_s, true},
        {u"ab"_s, u"ab%b"_s, false},
        {u""_s, u"%"_s, true},
        {u""_s, u""_s, true},
    };
    for (const auto& row : rows) {
        Run(u"DELETE FROM T"_s);
        Add({row.text});
        EXPECT_EQ(!Rows(u"SELECT A FROM T WHERE A LIKE '%1'"_s.arg(row.pattern)).isEmpty(), row.matches)
            << row.text.toStdString() << " LIKE " << row.pattern.toStdString();
    }
}

TEST_F(EngineFunctions, TextIsOrderedByLanguageNullsFirstTiesExactly)
{
    Add({u"zebra"_s, u"Äpfel"_s, u"apfel"_s, u"Zebra"_s, u"Apfel"_s, u"öl"_s, u"banane"_s});
    Run(u"INSERT INTO T (A) VALUES (NULL)"_s);
    const QStringList sorted = {u"~"_s,      u"Apfel"_s, u"apfel"_s, u"Äpfel"_s,
                                u"banane"_s, u"öl"_s,    u"Zebra"_s, u"zebra"_s};
    EXPECT_EQ(Rows(u"SELECT A FROM T ORDER BY A"_s), sorted);
    EXPECT_EQ(Rows(u"SELECT A FROM T ORDER BY A"_s, CursorType::Static), sorted);
    const QStringList reversed(sorted.rbegin(), sorted.rend());
    EXPECT_EQ(Rows(u"SELECT A FROM T ORDER BY A DESC"_s, CursorType::Static), reversed);
}

// Results in the order of one text are sorted here, piece by piece of the keys; the engine's own sorting, which
// does two terms, must agree on texts that differ late, only by case, or not at all.
TEST_F(EngineFunctions, OwnSortingAndTheEnginesHaveTheSameOrder)
{
    constexpr std::array kWords = {"flock", "Flock", "runway ", "tower", "Öl", "a", "", "0"};
    QRandomGenerator random(7);
    const QString longStart(400, u'x');
    QByteArray insert = "INSERT INTO T (A) VALUES (NULL)";
    for (int i = 0; i < 2000; ++i) {
        QString text = i % 5 == 0 ? longStart : QString();
        for (int words = random.bounded(6); words > 0; --words)
            text += QString::fromUtf8(kWords[size_t(random.bounded(int(kWords.size())))]);
        insert += ",('" + text.toUtf8() + "')";
    }
    Outside(insert);
    for (const QString& direction : {u""_s, u" DESC"_s}) {
        const QString source = u"SELECT A FROM T ORDER BY A"_s + direction;
        const QStringList byEngine = Rows(source + u",A"_s + direction);
        EXPECT_EQ(Read(*Open(source), {.count = 3000}), byEngine) << source.toStdString();
        EXPECT_EQ(Rows(source), byEngine) << source.toStdString();
    }
}

TEST_F(EngineFunctions, ForeignDatesCompareAndSortAsDates)
{
    const QString foreign = PathOf(u"foreign.db"_s);
    Outside(foreign, "CREATE TABLE D (n INTEGER, d TIMESTAMP);"
                     "INSERT INTO D VALUES (1,'2001-07-04T12:00:00+02:00'),(2,2452094.0),(3,994291200),"
                     "(4,'2001-07-04 08:30'),(5,'soon'),(6,994291200123),(7,'17:30')");
    auto cursor = provider->CreateRecordset();
    ASSERT_EQ(cursor->Open(u"SELECT n,d FROM D WHERE d>='2001-07-04' ORDER BY d"_s, foreign, CursorType::Static,
                           LockType::ReadOnly),
              Hr::Ok);
    EXPECT_EQ(Read(*cursor), (QStringList{u"4|2001-07-04 08:30:00"_s, u"1|2001-07-04 10:00:00"_s,
                                          u"3|2001-07-05"_s, u"6|2001-07-05 00:00:00.123"_s}));
    ASSERT_EQ(cursor->Open(u"SELECT d FROM D WHERE n=2 OR n=5 OR n=7 ORDER BY n"_s, foreign, CursorType::Static,
                           LockType::ReadOnly),
              Hr::Ok);
    EXPECT_EQ(Read(*cursor), (QStringList{u"2001-07-03 12:00:00"_s, u"soon"_s, u"1899-12-30 17:30:00"_s}));
    ASSERT_EQ(cursor->MoveTo(1), Hr::Ok);
    EXPECT_EQ(FieldOf(*cursor), Value::Text(u"soon"_s));
}

} // namespace
} // namespace mirel
