#include "app/ui/colors_dialog.h"
#include "app/ui/display_look.h"
#include "app/ui/fonts_dialog.h"
#include "support/printing.h"

#include <gtest/gtest.h>

#include <QApplication>
#include <QCheckBox>
#include <QComboBox>
#include <QFontDatabase>
#include <QLineEdit>
#include <QTest>
#include <QToolButton>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

TEST(FontsDialog, OpensOnTheDescriptionAndGivesTheEditedOneBack)
{
    QWidget window;
    FontDesc font;
    font.faceName = QFontDatabase::families().last();
    font.size = 14;
    font.underline = 1;
    font.color = 0x0000FF;
    CFontsDialog dialog(font, &window);
    EXPECT_EQ(dialog.Chosen(), font);
    dialog.findChildren<QCheckBox*>()[0]->click();
    dialog.findChildren<QComboBox*>()[1]->setCurrentText(u"20"_s);
    font.bold = 1;
    font.size = 20;
    EXPECT_EQ(dialog.Chosen(), font);
    const auto* sample = dialog.findChild<QLineEdit*>();
    EXPECT_EQ(sample->text(), u"AaBbCcXxYyZz"_s);
    EXPECT_EQ(sample->font().weight(), QFont::Bold);
    EXPECT_EQ(sample->font().pointSize(), 20);
    EXPECT_EQ(sample->palette().color(QPalette::Text), QColor(Qt::red));
}

TEST(FontsDialog, TakesTheFirstFaceAndSizeWhereTheScreenHasNoSuchOne)
{
    QWidget window;
    FontDesc font;
    font.faceName = u"No Such Face"_s;
    font.size = 13;
    const CFontsDialog dialog(font, &window);
    EXPECT_EQ(dialog.Chosen().faceName, QFontDatabase::families().first());
    EXPECT_EQ(dialog.Chosen().size, 6);
}

TEST(ColorsDialog, OpensOnTheColorAndTakesASwatchACodeOrNone)
{
    QWidget window;
    CColorsDialog dialog(QColor(1, 2, 3), CColorsDialog::Unset::Offered, &window);
    EXPECT_EQ(dialog.Chosen(), QColor(1, 2, 3));
    auto* code = dialog.findChild<QLineEdit*>();
    EXPECT_EQ(code->text(), u"#010203"_s);
    for (QToolButton* button : dialog.findChildren<QToolButton*>()) {
        if (button->toolTip() == u"#ffffff"_s)
            button->click();
    }
    EXPECT_EQ(dialog.Chosen(), QColor(Qt::white));
    code->setFocus();
    code->selectAll();
    QTest::keyClicks(code, u"#00ff00"_s);
    EXPECT_EQ(dialog.Chosen(), QColor(Qt::green));
    for (QToolButton* button : dialog.findChildren<QToolButton*>()) {
        if (!button->text().isEmpty())
            button->click();
    }
    EXPECT_FALSE(dialog.Chosen());
}

TEST(ViewLook, NamesNoColorThatNobodyChose)
{
    const QPalette before = QApplication::palette();
    QPalette dark = before;
    dark.setColor(QPalette::Text, Qt::cyan);
    dark.setColor(QPalette::Base, Qt::black);
    QApplication::setPalette(dark);
    QWidget widget;
    DrawAsList(widget, {.background = QColor(Qt::darkRed), .text = {}});
    EXPECT_EQ(widget.palette().color(QPalette::Base).rgb(), QColor(Qt::darkRed).rgb());
    EXPECT_EQ(widget.palette().color(QPalette::Text).rgb(), QColor(Qt::cyan).rgb());
    DrawAsList(widget, {.background = QColor(Qt::cyan), .text = {}});
    EXPECT_EQ(widget.palette().color(QPalette::Text).rgb(), QColor(Qt::black).rgb()) << "cyan on cyan";
    DrawAsList(widget, {});
    EXPECT_EQ(widget.palette().color(QPalette::Base).rgb(), QColor(Qt::black).rgb());
    QApplication::setPalette(before);
}

} // namespace
} // namespace mirel
