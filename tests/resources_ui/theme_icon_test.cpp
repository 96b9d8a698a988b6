#include "resources/ui/theme_icon.h"

#include "support/printing.h"

#include <gtest/gtest.h>

#include <QApplication>
#include <QDir>
#include <QImage>
#include <QPalette>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

QImage Painted(const QIcon& icon, QIcon::Mode mode = QIcon::Normal)
{
    return icon.pixmap(QSize(24, 24), mode).toImage().convertToFormat(QImage::Format_ARGB32);
}

// The colour of the drawing's fullest pixel.
QColor InkOf(const QImage& image)
{
    QColor fullest(Qt::transparent);
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x) {
            if (image.pixelColor(x, y).alpha() > fullest.alpha())
                fullest = image.pixelColor(x, y);
        }
    }
    return fullest;
}

TEST(ThemeIcon, EveryDrawingOfOursCanBePainted)
{
    UseOwnIconsOnly();
    ASSERT_FALSE(ThemeIcon(u"mirel-table").isNull());
    const QStringList files = QDir(u":/icons"_s).entryList({u"*.svg"_s});
    EXPECT_GT(files.size(), 20);
    for (const QString& file : files)
        EXPECT_GT(InkOf(Painted(ThemeIcon(file.chopped(4)))).alpha(), 200) << file.toStdString();
}

TEST(ThemeIcon, UnknownNamesGiveNoIcon)
{
    EXPECT_TRUE(ThemeIcon(u"no-such-drawing").isNull());
    EXPECT_TRUE(ThemeIcon(u"").isNull());
}

TEST(ThemeIcon, FollowsThePaletteAfterItWasMade)
{
    UseOwnIconsOnly();
    const QIcon icon = ThemeIcon(u"go-next");
    const QPalette before = QApplication::palette();
    for (const QColor& colour : {QColor(10, 20, 30), QColor(240, 230, 220)}) {
        QPalette palette = before;
        palette.setColor(QPalette::Active, QPalette::ButtonText, colour);
        palette.setColor(QPalette::Disabled, QPalette::ButtonText, Qt::gray);
        QApplication::setPalette(palette);
        const QColor ink = InkOf(Painted(icon));
        EXPECT_NEAR(ink.red(), colour.red(), 2);
        EXPECT_NEAR(ink.blue(), colour.blue(), 2);
        EXPECT_NEAR(InkOf(Painted(icon, QIcon::Disabled)).red(), QColor(Qt::gray).red(), 2);
    }
    QApplication::setPalette(before);
}

} // namespace
} // namespace mirel
