#include "app/ui/look.h"
#include "platform/ui/look_roles.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QDirIterator>
#include <QFile>
#include <QRegularExpression>

#include <cmath>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

double Luminance(const QColor& color)
{
    const auto linear = [](double channel) {
        return channel <= 0.03928 ? channel / 12.92 : std::pow((channel + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(color.redF()) + 0.7152 * linear(color.greenF()) + 0.0722 * linear(color.blueF());
}

double Contrast(const QColor& one, const QColor& other)
{
    const double a = Luminance(one) + 0.05;
    const double b = Luminance(other) + 0.05;
    return std::max(a, b) / std::min(a, b);
}

TEST(Look, KeepsRolesApartFromTheGroundsTheyAreDrawnOn)
{
    using enum LookRole;
    constexpr double kText = 4.5;
    constexpr double kEdge = 3.0;
    constexpr double kLine = 1.4;
    const struct {
        LookRole role;
        std::vector<LookRole> grounds;
        double least;
    } rows[] = {
        {Text, {Window, Base, Alternate}, kText},    {Dim, {Window, Base, Alternate}, kText},
        {Accent, {Window, Base, Alternate}, kText},  {AccentText, {Accent}, kText},
        {Warning, {Window, Base, Alternate}, kText}, {Error, {Window, Base, Alternate}, kText},
        {Edge, {Window, Base, Alternate}, kEdge},    {Line, {Base, Alternate}, kLine},
    };
    for (const LookScheme scheme : {LookScheme::Light, LookScheme::Dark}) {
        for (const auto& row : rows) {
            for (const LookRole ground : row.grounds) {
                EXPECT_GE(Contrast(ColorOfRole(row.role, scheme), ColorOfRole(ground, scheme)), row.least)
                    << "role " << int(row.role) << " on " << int(ground) << " of scheme " << int(scheme);
            }
        }
        // Tints of selected rows and of refused editors.
        for (const auto& [over, under, ink] : {std::tuple(Accent, Base, Text), std::tuple(Error, Window, Error)}) {
            const QColor ground =
                Blend(ColorOfRole(over, scheme), ColorOfRole(under, scheme), over == Error ? 0.1F : 0.26F);
            EXPECT_GE(Contrast(ColorOfRole(ink, scheme), ground), kText) << int(over) << " " << int(scheme);
        }
    }
}

TEST(Look, FindsItsRolesInAnyPalette)
{
    for (const LookScheme scheme : {LookScheme::Light, LookScheme::Dark}) {
        const QPalette palette = PaletteOfScheme(scheme);
        EXPECT_EQ(SchemeOf(palette), scheme);
        for (int role = 0; role <= int(LookRole::Error); ++role)
            EXPECT_EQ(ColorOfRole(LookRole(role), palette).rgb(), ColorOfRole(LookRole(role), scheme).rgb())
                << role;
    }
}

// A colour named in a widget would be the one that nobody can read in the other palette. What a user chose or a
// form stores is no such name.
TEST(Look, IsTheOnlyPlaceThatNamesColors)
{
    const QStringList choosing = {u"look_roles"_s,   u"colors_dialog"_s, u"fonts_dialog"_s,
                                  u"display_look"_s, u"view_look"_s,     u"control_look"_s,
                                  u"theme_icon"_s,   u"pdf_export"_s}; // paper is white, ink black
    static const QRegularExpression named(
        u"\\bQColor\\s*[({]\\s*[\"\\d]|\\bQt::(black|white|red|green|blue|cyan|magenta|yellow|gray|dark\\w+|light\\w+Gray)\\b|#[0-9a-fA-F]{6}"_s);
    QDirIterator files(QStringLiteral(MIREL_SOURCE_DIR "/src"), {u"*.cpp"_s, u"*.h"_s}, QDir::Files,
                       QDirIterator::Subdirectories);
    int looked = 0;
    while (files.hasNext()) {
        const QString path = files.next();
        if (!path.contains(u"/ui/"_s) || choosing.contains(QFileInfo(path).baseName()))
            continue;
        QFile file(path);
        ASSERT_TRUE(file.open(QIODevice::ReadOnly));
        const QRegularExpressionMatch match = named.match(QString::fromUtf8(file.readAll()));
        EXPECT_FALSE(match.hasMatch()) << path.toStdString() << ": " << match.captured().toStdString();
        ++looked;
    }
    EXPECT_GT(looked, 50);
}

} // namespace
} // namespace mirel
