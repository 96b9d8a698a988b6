#pragma once

#include "resources/string_table.h"
#include "tableview/people_fixture.h"
#include "tableview/ui/cell_strip.h"
#include "tableview/ui/record_grid.h"
#include "tableview/ui/table_view.h"

#include <QAction>
#include <QApplication>
#include <QLineEdit>
#include <QTest>

#include <algorithm>

namespace mirel {

// A table view on the people, in a window of its own.
class TableViewFixture : public PeopleFixture {
protected:
    TableViewFixture()
    {
        view.resize(700, 400);
        EXPECT_TRUE(view.OpenTable(QStringLiteral("People")));
        view.show();
        EXPECT_TRUE(QTest::qWaitForWindowActive(&view));
    }

    // Keys go where the focus is, as they do for the user.
    void Press(Qt::Key key, Qt::KeyboardModifiers modifiers = Qt::NoModifier)
    {
        QTest::keyClick(QApplication::focusWidget(), key, modifiers);
    }
    void Type(const QString& text)
    {
        for (const QChar letter : text)
            QTest::keyClick(QApplication::focusWidget(), letter.toLatin1());
    }
    bool GridHasFocus() const { return QApplication::focusWidget() == grid; }
    QString Selected() const
    {
        return QStringLiteral("%1/%2").arg(browser.FieldName(browser.SelectedField()), browser.CounterText());
    }
    QAction* ActionOf(Str text) const
    {
        const QList<QAction*> actions = view.actions();
        return *std::ranges::find(actions, StringText(text), &QAction::text);
    }
    QLineEdit* Line() const { return view.findChild<CellStrip*>()->findChild<QLineEdit*>(); }

    CTableView view{connection, path, prompt, {}};
    const RecordBrowser& browser = view.Browser();
    RecordGrid* grid = view.findChild<RecordGrid*>();
};

} // namespace mirel
