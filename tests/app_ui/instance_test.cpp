// A second start with a database that a window has open.
#include "app/instance.h"
#include "app_ui/program_fixture.h"
#include "support/printing.h"
#include "tableview/ui/table_view.h"

#include <QProcess>
#include <QTest>

#include <csignal>
#include <future>
#include <unistd.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class InstanceTest : public ProgramFixture {
protected:
    static constexpr int kPatienceMs = 20'000;

    void MakeShop()
    {
        Start();
        ASSERT_TRUE(Commands().NewDatabase(path_));
        ASSERT_TRUE(Execute(u"CREATE TABLE [Birds] ([Name] Varchar(40))"_s));
        Commands().Refill();
    }
    QByteArray Name() const { return InstanceName(folder_.path(), path_, {}); }
    // As another process would, while this one's window lives.
    Instance::Answer HandOver(const QByteArray& name, const InstanceRequest& request)
    {
        std::future<Instance::Answer> answer =
            std::async(std::launch::async, [&] { return Instance::HandOver(name, request, kPatienceMs); });
        EXPECT_TRUE(QTest::qWaitFor(
            [&] { return answer.wait_for(std::chrono::seconds(0)) == std::future_status::ready; }, kPatienceMs));
        return answer.get();
    }
    void StartProgram(QProcess& program, const QStringList& arguments = {})
    {
        program.start(QStringLiteral(MIREL_WINDOW), QStringList{u"--home"_s, folder_.path(), path_} + arguments);
        ASSERT_TRUE(program.waitForStarted());
    }
    void Kill(QProcess& program)
    {
        program.kill();
        EXPECT_TRUE(program.waitForFinished(kPatienceMs));
    }

    const QString path_ = PathOf(u"shop.cdb"_s);
};

TEST(InstanceRequest, ReadsBackAndRefusesWhatIsNone)
{
    for (const InstanceRequest& request :
         {InstanceRequest{}, InstanceRequest{ViewKey{EntryKind::Form, u"a \"b\"\n"_s}, "token"}})
        EXPECT_EQ(ReadInstanceRequest(InstanceRequestLine(request)), request);
    for (const QByteArray& line :
         {QByteArray("GET / HTTP/1.0"), QByteArray("[]"), QByteArray("{\"view\":\"x\"}"), QByteArray()})
        EXPECT_FALSE(ReadInstanceRequest(line)) << line.toStdString();
}

TEST_F(InstanceTest, TheNameIsThatOfTheDatabaseWhateverItIsCalled)
{
    MakeShop();
    ASSERT_TRUE(QFile::link(path_, PathOf(u"link.cdb"_s)));
    EXPECT_EQ(InstanceName(folder_.path(), PathOf(u"link.cdb"_s), {}), Name());
    EXPECT_NE(InstanceName(folder_.path(), PathOf(u"other.cdb"_s), {}), Name());
    EXPECT_NE(InstanceName(folder_.path(), path_, ViewKey{EntryKind::Form, u"F"_s}), Name());
    EXPECT_NE(InstanceName(u"/elsewhere"_s, path_, {}), Name());
}

TEST_F(InstanceTest, TheWindowComesForwardAndOpensWhatIsWanted)
{
    MakeShop();
    Show({800, 500});
    Instance instance;
    Frame().AnswerOtherStarts(instance);
    Frame().showMinimized();
    EXPECT_EQ(HandOver(Name(), {}), Instance::Answer::Taken);
    EXPECT_TRUE(QTest::qWaitFor([&] { return !Frame().isMinimized(); }, kPatienceMs));
    EXPECT_EQ(HandOver(Name(), {ViewKey{EntryKind::Table, u"Birds"_s}, {}}), Instance::Answer::Taken);
    EXPECT_TRUE(
        QTest::qWaitFor([&] { return qobject_cast<CTableView*>(Tabs().Front()) != nullptr; }, kPatienceMs));
    EXPECT_EQ(HandOver(Name(), {ViewKey{EntryKind::Query, u"None"_s}, {}}), Instance::Answer::Taken);
    EXPECT_TRUE(QTest::qWaitFor([&] { return prompt_.shown.size() == 1; }, kPatienceMs));

    ASSERT_TRUE(Commands().NewDatabase(PathOf(u"other.cdb"_s)));
    Frame().ShowState();
    EXPECT_EQ(HandOver(Name(), {}), Instance::Answer::Nobody) << "it has another one open by now";
    EXPECT_EQ(HandOver(InstanceName(folder_.path(), PathOf(u"other.cdb"_s), {}), {}), Instance::Answer::Taken);
    EXPECT_TRUE(Frame().close());
    EXPECT_TRUE(instance.Name().isEmpty()) << "a closing window takes nothing over";
}

TEST_F(InstanceTest, TheSecondStartEndsAndAStuckOrDeadFirstDoesNotKeepItFromRunning)
{
    MakeShop();
    program_.reset();
    QProcess first;
    StartProgram(first);
    for (int i = 0; i < 3000 && Instance::HandOver(Name(), {}, kPatienceMs) != Instance::Answer::Taken; ++i)
        ::usleep(10'000);
    for (const QStringList& arguments : {QStringList(), QStringList{u"--table"_s, u"Birds"_s}}) {
        QProcess second;
        StartProgram(second, arguments);
        ASSERT_TRUE(second.waitForFinished(kPatienceMs)) << "it shows a window of its own";
        EXPECT_EQ(second.exitCode(), 0);
    }
    EXPECT_EQ(first.state(), QProcess::Running);

    ::kill(pid_t(first.processId()), SIGSTOP);
    ASSERT_TRUE(QFile::remove(PathOf(u"Mirel.ini"_s))); // each run writes it
    QProcess third;
    StartProgram(third);
    for (int i = 0; i < 3000 && !QFile::exists(PathOf(u"Mirel.ini"_s)); ++i)
        ::usleep(10'000);
    EXPECT_TRUE(QFile::exists(PathOf(u"Mirel.ini"_s)));
    EXPECT_EQ(third.state(), QProcess::Running);
    ::kill(pid_t(first.processId()), SIGCONT);
    Kill(third);
    Kill(first);
    EXPECT_EQ(Instance::HandOver(Name(), {}, kPatienceMs), Instance::Answer::Nobody);
}

TEST_F(InstanceTest, AnotherDatabaseAndAPictureHaveAProcessOfTheirOwn)
{
    MakeShop();
    program_.reset();
    Instance first;
    ASSERT_TRUE(first.Take(Name())); // and never answers
    QProcess picture;
    StartProgram(picture, {u"--picture"_s, PathOf(u"p.png"_s)});
    ASSERT_TRUE(picture.waitForFinished(kPatienceMs));
    EXPECT_TRUE(QFile::exists(PathOf(u"p.png"_s)));
}

} // namespace
} // namespace mirel
