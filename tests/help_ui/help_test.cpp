// The help: every topic that a view names has its page, every link and picture is there, nothing is wider than a
// handheld's screen.
#include "app/ui/look.h"
#include "help/help_topics.h"
#include "help/ui/help_desk.h"
#include "help/ui/help_window.h"
#include "resources/string_rows.h"
#include "resources/string_table.h"
#include "support/printing.h"
#include "support/ui/screen_checks.h"
#include "support/ui/spoken_in_windows.h"
#include "support/ui/window_sizes.h"
#include "tableview/ui/options_dialog.h"

#include <QAbstractTextDocumentLayout>
#include <QApplication>
#include <QCheckBox>
#include <QDirIterator>
#include <QImage>
#include <QLineEdit>
#include <QListWidget>
#include <QPushButton>
#include <QRegularExpression>
#include <QStyle>
#include <QTest>
#include <QToolButton>
#include <QWhatsThis>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

QString TextOf(const QString& path)
{
    QFile file(path);
    EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << path.toStdString();
    return QString::fromUtf8(file.readAll());
}

QStringList AllOf(const QString& text, const QString& pattern)
{
    QStringList found;
    auto matches = QRegularExpression(pattern).globalMatch(text);
    while (matches.hasNext())
        found += matches.next().captured(1);
    return found;
}

// Of the sources: what is a view or a dialog of ours.
QStringList ClassesOfViews()
{
    QStringList classes;
    QDirIterator files(QStringLiteral(MIREL_SOURCE_DIR "/src"), {u"*.h"_s, u"*.cpp"_s}, QDir::Files,
                       QDirIterator::Subdirectories);
    while (files.hasNext())
        classes += AllOf(TextOf(files.next()), uR"(class (C\w+) (?:final )?: public (?:QDialog|HostedView))"_s);
    return classes;
}

class Help : public ::testing::TestWithParam<const char*> {
protected:
    Help()
    {
        if (GetParam() != std::string_view("en"))
            spoken_ = std::make_unique<SpokenInWindows>(QString::fromLatin1(GetParam()));
    }
    std::unique_ptr<SpokenInWindows> spoken_;
};
INSTANTIATE_TEST_SUITE_P(In, Help, ::testing::Values("en", "de"), [](const auto& each) { return each.param; });

TEST_P(Help, HasAPageForEveryViewAndDialog)
{
    const QString page = TextOf(HelpBrowser::PagePath());
    const QStringList topics = AllOf(page, uR"x(<a name="(\w+)">)x"_s);
    EXPECT_EQ(QSet(topics.begin(), topics.end()).size(), topics.size()) << "two pages of one name";
    for (const HelpTopic& row : HelpTopics())
        EXPECT_TRUE(topics.contains(QStringView(row.topic))) << QStringView(row.topic).toUtf8().toStdString();
    const QStringList classes = ClassesOfViews();
    ASSERT_GT(classes.size(), 15);
    for (const QString& each : classes)
        EXPECT_FALSE(HelpTopicOfClass(each).isEmpty()) << each.toStdString() << " has no row in help_topics.cpp";
}

TEST_P(Help, FollowsItsLinksAndFindsItsPictures)
{
    const QString path = HelpBrowser::PagePath();
    const QString page = TextOf(path);
    const QStringList topics = AllOf(page, uR"x(<a name="(\w+)">)x"_s);
    for (const QString& link : AllOf(page, uR"x(href="([^"]*)")x"_s))
        EXPECT_TRUE(link.startsWith(u'#') && topics.contains(link.mid(1))) << link.toStdString();
    const QStringList pictures = AllOf(page, uR"x(src="([^"]*)")x"_s);
    EXPECT_GE(pictures.size(), 4);
    for (const QString& picture : pictures)
        EXPECT_FALSE(QImage(QDir::cleanPath(QFileInfo(path).path() + u'/' + picture)).isNull())
            << picture.toStdString();
}

TEST_P(Help, IsNoWiderThanAHandheld)
{
    QWidget window;
    const auto [style, palette] = std::pair(QApplication::style()->objectName(), QApplication::palette());
    for (const QSize size : kWindowSizes) {
        ASSERT_TRUE(UsePalette(size.width() == 320 ? u"dark" : u"light"));
        window.resize(size);
        window.show();
        ShowHelp(window, u"main"_s);
        auto* help = window.findChild<CHelpWindow*>();
        ASSERT_TRUE(help);
        ExpectFits(*help, QString::fromLatin1(GetParam()) + u"-help"_s, size);
        const auto* text = help->findChild<HelpBrowser*>();
        EXPECT_LE(text->document()->size().width(), text->viewport()->width()) << size.width();
        delete help;
    }
    QApplication::setStyle(style);
    QApplication::setPalette(palette);
}

TEST_P(Help, SaysSomethingOfEachControlInItsTable)
{
    for (const ControlHelp& row : ControlHelps()) {
        const QString label = StringText(row.label);
        EXPECT_EQ(HelpOfControl(row.viewClass, label), row.text) << label.toStdString();
        EXPECT_FALSE(StringText(row.text).isEmpty()) << label.toStdString();
    }
    EXPECT_EQ(HelpOfControl(u"COptionsDialog", {}), std::nullopt);
    EXPECT_EQ(HelpOfControl(u"CNobody", StringText(Str::OptionMaximum)), std::nullopt);
}

// The offscreen platform tells of an active window a moment later.
bool IsActiveSoon(const QWidget& window)
{
    return QTest::qWaitFor(
        [&window] { return QApplication::activeWindow() == &window && QApplication::focusWidget(); });
}

class HelpWindow : public ::testing::Test {
protected:
    HelpWindow()
    {
        window_.resize(800, 600);
        window_.show();
        EXPECT_TRUE(QTest::qWaitFor([this] { return QApplication::activeWindow() == &window_; }));
    }
    CHelpWindow& Show(const QString& topic)
    {
        ShowHelp(window_, topic);
        EXPECT_EQ(window_.findChildren<CHelpWindow*>().size(), 1);
        help_ = window_.findChild<CHelpWindow*>();
        EXPECT_TRUE(IsActiveSoon(*help_));
        return *help_;
    }
    QString Topic() const { return help_->findChild<HelpBrowser*>()->source().fragment(); }
    void Press(Qt::Key key, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        QTest::keyClick(QApplication::focusWidget(), key, modifiers);
    }

    QWidget window_;
    CHelpWindow* help_ = nullptr;
};

TEST_F(HelpWindow, GoesBackAndForward)
{
    Show(u"filter"_s);
    Show(u"sort"_s);
    EXPECT_EQ(Topic(), u"sort"_s);
    Press(Qt::Key_Left, Qt::AltModifier);
    EXPECT_EQ(Topic(), u"filter"_s);
    Press(Qt::Key_Right, Qt::AltModifier);
    EXPECT_EQ(Topic(), u"sort"_s);
    Press(Qt::Key_Home, Qt::AltModifier);
    EXPECT_EQ(Topic(), u"contents"_s);
    auto* pages = help_->findChild<QListWidget*>();
    ASSERT_TRUE(pages->isVisible());
    QListWidgetItem* third = pages->item(2);
    QTest::mouseClick(pages->viewport(), Qt::LeftButton, {}, pages->visualItemRect(third).center());
    EXPECT_EQ(Topic(), third->data(Qt::UserRole).toString());
    Press(Qt::Key_Escape);
    EXPECT_FALSE(help_->isVisible());
}

TEST_F(HelpWindow, FindsATextAndStartsAgainAtTheTop)
{
    Show(u"contents"_s);
    auto* text = help_->findChild<HelpBrowser*>();
    Press(Qt::Key_F, Qt::ControlModifier);
    auto* line = help_->findChild<QLineEdit*>();
    ASSERT_EQ(QApplication::focusWidget(), line);
    QTest::keyClicks(line, u"byte-order"_s);
    const int first = text->textCursor().selectionStart();
    EXPECT_EQ(text->textCursor().selectedText().toLower(), u"byte-order"_s);
    Press(Qt::Key_Return);
    EXPECT_EQ(text->textCursor().selectionStart(), first) << "it is there once";
    line->clear();
    QTest::keyClicks(line, u"squirrel"_s);
    EXPECT_EQ(line->toolTip(), StringText(Str::FindNothing));
}

// --- help in dialogs --------------------------------------------------------------------------------------------

class Desk : public HelpWindow {
protected:
    // It belongs to the application, and answers for every test after this one.
    static void SetUpTestSuite()
    {
        desk_ = new HelpDesk(*qobject_cast<QApplication*>(QCoreApplication::instance()));
    }
    static void TearDownTestSuite() { delete desk_; }
    static HelpDesk* desk_;
};
HelpDesk* Desk::desk_ = nullptr;

TEST_F(Desk, AnswersF1InADialogWithItsPage)
{
    COptionsDialog dialog({}, &window_);
    dialog.setModal(true);
    dialog.show();
    ASSERT_TRUE(IsActiveSoon(dialog));
    Press(Qt::Key_F1);
    help_ = dialog.findChild<CHelpWindow*>();
    ASSERT_TRUE(help_) << "over the dialog, which blocks every other window";
    EXPECT_EQ(Topic(), u"options"_s);
    help_->close();
    dialog.findChild<QPushButton*>(u"helpOfDialog"_s)->click();
    EXPECT_TRUE(dialog.isVisible());
    QTest::keyClick(&dialog, Qt::Key_Return);
    EXPECT_FALSE(dialog.isVisible()) << "Enter accepts, and does not press the question mark";
}

TEST_F(Desk, SaysWhatAControlIsAndOtherwiseOpensThePage)
{
    COptionsDialog dialog({}, &window_);
    QCheckBox* sort = nullptr;
    for (QCheckBox* box : dialog.findChildren<QCheckBox*>()) {
        if (box->text() == StringText(Str::OptionSortByHeader))
            sort = box;
    }
    ASSERT_TRUE(sort);
    EXPECT_EQ(HelpDesk::TextOf(*sort), StringText(Str::WhatSortByHeader));
    dialog.show();
    ASSERT_TRUE(IsActiveSoon(dialog));
    QTest::keyClick(sort, Qt::Key_F1, Qt::ShiftModifier);
    QWidget* shown = nullptr;
    for (QWidget* each : QApplication::topLevelWidgets())
        shown = each->inherits("QWhatsThat") ? each : shown;
    EXPECT_TRUE(shown);
    QWhatsThis::hideText();
    EXPECT_FALSE(dialog.findChild<CHelpWindow*>());
    QWidget plain(&dialog);
    EXPECT_EQ(HelpDesk::TextOf(plain), QString());
    plain.setGeometry(0, 0, 20, 20);
    plain.show();
    plain.raise();
    QWhatsThis::enterWhatsThisMode();
    QTest::mouseClick(&plain, Qt::LeftButton);
    EXPECT_TRUE(dialog.findChild<CHelpWindow*>());
    EXPECT_FALSE(QWhatsThis::inWhatsThisMode()) << "the next tap would be a question again";
}

} // namespace
} // namespace mirel
