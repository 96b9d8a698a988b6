#include "app/favorites.h"
#include "support/printing.h"

#include <gtest/gtest.h>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

const QString kStamp = u"20011024153012"_s;

TEST(FavoritesFile, KeepsEveryName)
{
    const QStringList entries = {u"table:Bird Strikes"_s, u"query:50% off\tand\nmore"_s,
                                 u"form:Größe \U0001F600"_s, u"table:%41"_s};
    EXPECT_EQ(FavoritesOf(WithFavorites({}, kStamp, entries), kStamp), entries);
}

TEST(FavoritesFile, LeavesOtherDatabasesAlone)
{
    const QByteArray one = "19990101000000\ttable:A\tform:\xFF\n";
    const QByteArray own = "20011024153012\ttable:B\tquery:C\r\n";
    const QByteArray longer = "200110241530123\ttable:D\n";
    const QByteArray file = one + longer + own + "junk without a line end";

    EXPECT_EQ(FavoritesOf(file, kStamp), (QStringList{u"table:B"_s, u"query:C"_s}));
    EXPECT_EQ(WithFavorites(file, kStamp, {u"form:E"_s}),
              one + longer + "20011024153012\tform:E\n" + "junk without a line end\n");
    EXPECT_EQ(WithFavorites(file, kStamp, {}), one + longer + "junk without a line end\n");
    EXPECT_EQ(FavoritesOf(file, u"20011024"_s), QStringList()) << "the beginning of a stamp";
    EXPECT_EQ(FavoritesOf(file, {}), QStringList());
}

} // namespace
} // namespace mirel
