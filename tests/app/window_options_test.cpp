#include "app/window_options.h"

#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

TEST(WindowOptions, AreRead)
{
    QString complaint;
    const auto options =
        ParseWindowOptions({u"--home"_s, u"/h"_s, u"--picture=p.png"_s, u"--size"_s, u"240x320"_s, u"--table"_s,
                            u"Bird Strikes"_s, u"--palette"_s, u"dark"_s, u"my base.cdb"_s},
                           complaint);
    ASSERT_TRUE(options) << complaint.toStdString();
    EXPECT_EQ(options->home, u"/h"_s);
    EXPECT_EQ(options->picture, u"p.png"_s);
    EXPECT_EQ(options->size, QSize(240, 320));
    EXPECT_EQ(options->table, u"Bird Strikes"_s);
    EXPECT_EQ(options->palette, u"dark"_s);
    EXPECT_EQ(options->database, u"my base.cdb"_s);
    EXPECT_FALSE(options->sample);
}

TEST(WindowOptions, WrongOnesAreNamed)
{
    struct Row {
        QStringList arguments;
        QString named; // in the complaint
    };
    const Row rows[] = {
        {{u"--palet"_s}, u"palet"_s},
        {{u"--palette"_s, u"blue"_s}, u"blue"_s},
        {{u"--size"_s, u"0x320"_s}, u"0x320"_s},
        {{u"--size"_s, u"240"_s}, u"240"_s},
        {{u"--size"_s, u"99999x99999"_s}, u"99999x99999"_s},
        {{u"--home"_s}, u"home"_s},
        {{u"a.cdb"_s, u"b.cdb"_s}, u"b.cdb"_s},
        {{u"--table"_s, u"T"_s, u"--query"_s, u"Q"_s}, u"--query"_s},
    };
    for (const Row& row : rows) {
        QString complaint;
        EXPECT_FALSE(ParseWindowOptions(row.arguments, complaint)) << row.arguments.join(u' ').toStdString();
        EXPECT_TRUE(complaint.contains(row.named)) << complaint.toStdString();
    }
}

} // namespace
} // namespace mirel
