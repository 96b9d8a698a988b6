// The designer's window as the user reaches it: by keyboard and mouse in a large window, by stylus in a small one.
#include "platform/ui/window_place.h"
#include "resources/string_table.h"
#include "tableeditor/design_fixture.h"
#include "tableeditor/ui/field_dialog.h"
#include "tableeditor/ui/table_dialog.h"

#include <QAction>
#include <QApplication>
#include <QComboBox>
#include <QDialogButtonBox>
#include <QLineEdit>
#include <QPushButton>
#include <QSpinBox>
#include <QTest>
#include <QTimer>
#include <QToolButton>
#include <QTreeWidget>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

class TableDialogTest : public DesignFixture {
protected:
    void Show(QSize size)
    {
        QApplication::setDoubleClickInterval(1); // so long a list that pops up is deaf to taps
        window_.resize(size);
        window_.show();
        ASSERT_TRUE(QTest::qWaitForWindowExposed(&window_));
        designer_ = std::make_unique<TableDesigner>(connection_, path_, prompt_, host_);
    }
    void Design(const QString& table = {})
    {
        if (!table.isEmpty()) {
            ASSERT_TRUE(designer_->Open(table));
        }
        dialog_ = std::make_unique<CTableDialog>(*designer_, &window_);
        dialog_->show();
        ASSERT_TRUE(QTest::qWaitForWindowActive(dialog_.get()));
    }
    QTreeWidget* List() { return dialog_->findChild<QTreeWidget*>(u"fields"_s); }
    QLineEdit* Name() { return dialog_->findChild<QLineEdit*>(u"tableName"_s); }
    QPushButton* Button(const QString& name) { return dialog_->findChild<QPushButton*>(name); }
    QToolButton* Tool(Str text)
    {
        for (QToolButton* button : dialog_->findChildren<QToolButton*>()) {
            if (button->defaultAction() && button->defaultAction()->text() == StringText(text))
                return button;
        }
        return nullptr;
    }
    QStringList Rows()
    {
        QStringList rows;
        for (int i = 0; i < List()->topLevelItemCount(); ++i) {
            const QTreeWidgetItem* item = List()->topLevelItem(i);
            rows += QStringList({item->text(0), item->text(1), item->text(2), item->text(3)}).join(u'|');
        }
        return rows;
    }
    void Tap(QWidget* widget, QPoint at = {})
    {
        ASSERT_NE(widget, nullptr);
        const QPoint place = at.isNull() ? widget->rect().center() : at;
        EXPECT_TRUE(widget->window()->rect().contains(widget->mapTo(widget->window(), place)))
            << "out of the window: " << widget->metaObject()->className();
        QTest::mouseClick(widget, Qt::LeftButton, {}, place);
    }
    void TapRow(int row) { Tap(List()->viewport(), List()->visualItemRect(List()->topLevelItem(row)).center()); }

    // Runs `actions` on the field dialog that `open` brings up.
    void InFieldDialog(const std::function<void()>& open, const std::function<void(CFieldDialog&)>& actions)
    {
        bool met = false;
        (void)Focused(); // its waiting would let the timer go off too soon
        QTimer::singleShot(0, dialog_.get(), [&] {
            auto* field = qobject_cast<CFieldDialog*>(QApplication::activeModalWidget());
            met = field != nullptr;
            if (field) {
                EXPECT_TRUE(QTest::qWaitFor([field] { return field->isAncestorOf(QApplication::focusWidget()); }));
                actions(*field);
                if (field->isVisible())
                    field->reject();
            }
        });
        open();
        EXPECT_TRUE(met);
        dialog_->activateWindow(); // no window manager does it here
    }
    // The widget with the keyboard's focus, once the window is active again after a dialog over it.
    static QWidget* Focused()
    {
        (void)QTest::qWaitFor([] { return QApplication::focusWidget() != nullptr; });
        return QApplication::focusWidget();
    }
    static void Keys(const QString& text) { QTest::keyClicks(Focused(), text); }
    static void Key(int key, Qt::KeyboardModifiers modifiers = {})
    {
        QTest::keyClick(Focused(), Qt::Key(key), modifiers);
    }
    // By the keyboard alone: name, the first letters of type and index, size.
    void TypeField(const QString& name, const QString& type, const QString& size, const QString& index)
    {
        InFieldDialog([] { Key(Qt::Key_Insert); },
                      [&](CFieldDialog&) {
                          Keys(name);
                          Key(Qt::Key_Tab);
                          Keys(type);
                          Key(Qt::Key_Tab);
                          if (!size.isEmpty()) {
                              Key(Qt::Key_A, Qt::ControlModifier);
                              Keys(size);
                              Key(Qt::Key_Tab);
                          }
                          Keys(index);
                          Key(Qt::Key_Return);
                      });
    }
    // By taps alone; the name comes from the input panel.
    void TapField(const QString& name, int type, int index)
    {
        InFieldDialog([this] { Tap(Tool(Str::DesignNewField)); },
                      [&](CFieldDialog& field) {
                          EXPECT_LE(field.width(), window_.width());
                          Tap(field.findChild<QLineEdit*>());
                          Keys(name);
                          const QList<QComboBox*> boxes = field.findChildren<QComboBox*>();
                          Choose(boxes[0], type);
                          Choose(boxes[1], index);
                          Tap(field.findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok));
                      });
    }
    void Choose(QComboBox* box, int row)
    {
        Tap(box);
        QAbstractItemView* view = box->view();
        ASSERT_TRUE(QTest::qWaitForWindowExposed(view->window()));
        const QModelIndex index = view->model()->index(row, 0);
        view->scrollTo(index);
        QTest::qWait(20);
        QTest::mouseMove(view->viewport(), view->visualRect(index).center());
        QTest::mouseClick(view->viewport(), Qt::LeftButton, {}, view->visualRect(index).center());
        EXPECT_EQ(box->currentIndex(), row);
    }

    QWidget window_;
    DesignHost host_;
    std::unique_ptr<TableDesigner> designer_;
    std::unique_ptr<CTableDialog> dialog_;
};

TEST_F(TableDialogTest, MakesATableByKeyboardAndMouseInALargeWindow)
{
    Show({1100, 700});
    Design();
    EXPECT_EQ(dialog_->windowTitle(), u"Mirel Create Table"_s);
    Keys(u"Items"_s);
    List()->setFocus();
    dialog_->findChild<QToolButton*>()->setFocus();
    InFieldDialog([this] { Tap(Tool(Str::DesignNewField)); },
                  [](CFieldDialog& field) {
                      EXPECT_EQ(field.findChild<QComboBox*>()->currentText(), u"Text"_s);
                      EXPECT_EQ(field.findChild<QSpinBox*>()->value(), 255);
                      Keys(u"Qty"_s);
                      Key(Qt::Key_Tab);
                      Keys(u"I"_s);
                      EXPECT_FALSE(field.findChild<QSpinBox*>()->isEnabled());
                      Key(Qt::Key_Tab);
                      Keys(u"A"_s);
                      Key(Qt::Key_Return);
                  });
    TypeField(u"Name"_s, u"T"_s, u"40"_s, u"N"_s);
    TypeField(u"Ship To"_s, u"M"_s, {}, u"N"_s);
    EXPECT_EQ(Rows(), QStringList({u"Qty|Integer||ASC"_s, u"Name|Text|40|NO"_s, u"Ship To|Memo||NO"_s}));
    TapRow(1);
    Key(Qt::Key_Up, Qt::ControlModifier);
    EXPECT_EQ(Rows(), QStringList({u"Name|Text|40|NO"_s, u"Qty|Integer||ASC"_s, u"Ship To|Memo||NO"_s}));
    EXPECT_EQ(List()->currentItem()->text(0), u"Name"_s);
    TapRow(2);
    Key(Qt::Key_Delete);
    EXPECT_EQ(prompt_.questions, QStringList()) << "nothing is lost in a list";
    prompt_.answers = {true};
    QTest::mouseClick(Button(u"create"_s), Qt::LeftButton);
    EXPECT_FALSE(dialog_->isVisible());
    EXPECT_EQ(prompt_.shown, QStringList{u"Table \"Items\" created."_s});
    EXPECT_EQ(Describe(u"Items"_s), u"Name Text 40 NO, Qty Integer ASC"_s);
}

TEST_F(TableDialogTest, MakesATableByStylusOnASmallScreen)
{
    Show({240, 320});
    Design();
    EXPECT_EQ(dialog_->size(), QSize(240, 320));
    EXPECT_LE(dialog_->minimumSizeHint().width(), 240);
    Tap(Name());
    Keys(u"Birds"_s);
    TapField(u"Species"_s, 0, 1);
    TapField(u"Seen"_s, 4, 2);
    EXPECT_EQ(Rows(), QStringList({u"Species|Text|255|ASC"_s, u"Seen|DateTime||DESC"_s}));
    for (QToolButton* button : dialog_->findChildren<QToolButton*>()) {
        if (!button->isVisible())
            continue;
        EXPECT_GE(button->width(), 24);
        EXPECT_GE(button->height(), 24);
        EXPECT_LE(button->mapTo(dialog_.get(), button->rect().bottomRight()).x(), 240);
    }
    TapRow(0);
    Tap(Tool(Str::DesignMoveDown));
    prompt_.answers = {true};
    Tap(Button(u"create"_s));
    EXPECT_EQ(Describe(u"Birds"_s), u"Seen DateTime DESC, Species Text 255 ASC"_s);
}

TEST_F(TableDialogTest, ChangesATableAtOnce)
{
    Run(u"CREATE TABLE [T] ([A] Varchar(9),[B] Integer,[C] Text)"_s);
    Run(u"INSERT INTO [T] ([A],[B],[C]) VALUES ('12',1,'x')"_s);
    Run(u"INSERT INTO [T] ([A],[B],[C]) VALUES ('13',2,'y')"_s);
    Show({1100, 700});
    Design(u"T"_s);
    EXPECT_EQ(dialog_->windowTitle(), u"Mirel Edit Table"_s);
    EXPECT_EQ(List()->topLevelItem(0)->text(4), u"12  ·  13"_s);
    Key(Qt::Key_Down, Qt::ControlModifier);
    EXPECT_EQ(Describe(u"T"_s), u"B Integer NO, A Text 9 NO, C Memo NO"_s);

    prompt_.answers = {true};
    InFieldDialog([this] { Tap(Tool(Str::DesignChangeType)); },
                  [](CFieldDialog& field) {
                      EXPECT_EQ(Focused(), field.findChild<QComboBox*>());
                      Keys(u"I"_s);
                      Key(Qt::Key_Return);
                  });
    EXPECT_EQ(prompt_.questions.size(), 1);
    InFieldDialog([] { Key(Qt::Key_Return); },
                  [](CFieldDialog&) {
                      Keys(u"Count"_s);
                      Key(Qt::Key_Return);
                  });
    EXPECT_EQ(Describe(u"T"_s), u"B Integer NO, Count Integer NO, C Memo NO"_s);
    EXPECT_EQ(Records(u"SELECT B,[Count],C FROM T"_s), QStringList({u"1|1|12|x"_s, u"2|2|13|y"_s}));

    // What is refused stays in the dialog.
    InFieldDialog([] { Key(Qt::Key_F2); },
                  [this](CFieldDialog& field) {
                      Keys(u"b"_s);
                      Key(Qt::Key_Return);
                      EXPECT_TRUE(field.isVisible());
                      EXPECT_EQ(prompt_.shown, QStringList{StringText(Str::DesignFieldTaken, {u"b"_s})});
                      EXPECT_EQ(field.findChild<QLineEdit*>()->text(), u"b"_s);
                  });
    prompt_.shown.clear();
    prompt_.answers = {false, true};
    Key(Qt::Key_Delete);
    EXPECT_EQ(Rows().size(), 3);
    Key(Qt::Key_Delete);
    EXPECT_EQ(Describe(u"T"_s), u"B Integer NO, C Memo NO"_s);
    EXPECT_EQ(List()->currentItem()->text(0), u"C"_s);

    Name()->setFocus();
    Name()->selectAll();
    Keys(u"Tee"_s);
    Key(Qt::Key_Return);
    EXPECT_EQ(prompt_.shown, QStringList{u"Table \"T\" renamed to \"Tee\"."_s});
    EXPECT_TRUE(dialog_->isVisible());
    prompt_.answers = {true};
    QTest::mouseClick(Button(u"dropTable"_s), Qt::LeftButton);
    EXPECT_FALSE(dialog_->isVisible());
    EXPECT_EQ(Describe(u"Tee"_s), u"gone"_s);
}

} // namespace
} // namespace mirel
