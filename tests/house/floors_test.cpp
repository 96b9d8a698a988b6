// The house has floors: an include goes down or stays in its folder. The list is the one in ARCHITECTURE.md.
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QDirIterator>
#include <QFile>
#include <QRegularExpression>

#include <algorithm>
#include <array>

namespace {

using namespace Qt::StringLiterals;

// Ground first. A path belongs to the longest entry that it begins with; ui folders stand above all.
constexpr std::array kFloors = {
    "resources", "platform", "help",      "provider/dialect", "provider",    "provider/sqlite", "data", "result",
    "expr",      "forms",    "tableview", "querybuilder",     "tableeditor", "csvimport",       "app",  "cli"};

int FloorOf(const QString& path)
{
    if (path.contains(u"/ui/"_s))
        return int(kFloors.size());
    int floor = -1;
    qsizetype longest = 0;
    for (size_t i = 0; i < kFloors.size(); ++i) {
        const QString prefix = QString::fromLatin1(kFloors[i]) + u'/';
        if (path.startsWith(prefix) && prefix.size() > longest) {
            floor = int(i);
            longest = prefix.size();
        }
    }
    return floor;
}

// The one place above an engine that may name it.
bool IsProviderList(const QString& path)
{
    return path == "provider/providers.cpp"_L1;
}

struct Include {
    QString from;
    QString what;
    bool local; // in quotes
};

QList<Include> IncludesOfTheTree(const QString& root)
{
    QList<Include> includes;
    static const QRegularExpression line(uR"(^\s*#\s*include\s*([<"])([^>"]+)[>"])"_s,
                                         QRegularExpression::MultilineOption);
    QDirIterator files(root, {u"*.h"_s, u"*.cpp"_s}, QDir::Files, QDirIterator::Subdirectories);
    while (files.hasNext()) {
        QFile file(files.next());
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        auto matches = line.globalMatch(QString::fromUtf8(file.readAll()));
        while (matches.hasNext()) {
            const QRegularExpressionMatch match = matches.next();
            includes += {file.fileName().mid(root.size() + 1), match.captured(2), match.captured(1) == u"\""_s};
        }
    }
    return includes;
}

const QString kRoot = QStringLiteral(MIREL_SOURCE_DIR "/src");

TEST(Floors, IncludesGoDownOrStay)
{
    const QList<Include> includes = IncludesOfTheTree(kRoot);
    ASSERT_GT(includes.size(), 20);
    for (const Include& include : includes) {
        if (!include.local || include.what.endsWith(u".moc") || IsProviderList(include.from))
            continue;
        const int from = FloorOf(include.from);
        const int to = FloorOf(include.what);
        EXPECT_GE(from, 0) << include.from.toStdString() << " stands on no floor";
        EXPECT_GE(to, 0) << include.from.toStdString() << ": name the folder in #include \""
                         << include.what.toStdString() << '"';
        EXPECT_LE(to, from) << include.from.toStdString() << " includes " << include.what.toStdString();
    }
}

TEST(Floors, CoreKnowsNoWidgetsAndNothingAboveTheProviderKnowsTheStore)
{
    static const QRegularExpression widgets(
        u"^Q(Widget|Application|Dialog|MessageBox|MainWindow|Table|List(View|Widget)|Push|Line|Combo|Gui|Pain|Icon|Font|Menu|Action)"_s);
    for (const Include& include : IncludesOfTheTree(kRoot)) {
        if (include.local)
            continue;
        if (!include.from.contains(u"/ui/"_s)) {
            EXPECT_FALSE(widgets.match(include.what).hasMatch())
                << include.from.toStdString() << " includes " << include.what.toStdString();
        }
        if (!include.from.startsWith(u"provider/sqlite/"_s)) {
            EXPECT_NE(include.what, u"sqlite3.h"_s) << include.from.toStdString();
        }
    }
}

} // namespace
