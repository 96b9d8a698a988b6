#pragma once

#include "platform/tap.h"

#include <QAbstractListModel>
#include <QListView>
#include <QStyledItemDelegate>

namespace mirel {

// A line of an EntryList.
struct EntryLine {
    QString name;
    QString detail; // second, dimmer line; empty: the entry has one line
    QString toolTip;
    QStringView icon; // name for ThemeIcon
    bool dimmed = false;

    friend bool operator==(const EntryLine&, const EntryLine&) = default;
};

// A list of entries with icon, name and a second, dimmer line. It says which entry was tapped and how often;
// what that means is its owner's to decide. Enter is told apart from taps, and opens always.
class EntryList : public QListView {
    Q_OBJECT
public:
    explicit EntryList(QWidget* parent = nullptr);

    void SetLines(std::vector<EntryLine> lines);
    int Row() const { return currentIndex().row(); } // from 0; -1: none
    void SetRow(int row);                            // tells nobody
    int HeightOfAll() const;

Q_SIGNALS:
    void RowChanged(int row);
    void Tapped(int row, mirel::Tap tap);
    void EnterPressed(int row);

protected:
    void keyPressEvent(QKeyEvent* event) override;

private:
    class Model;
    Model* model_;
    bool filling_ = false;
};

class EntryDelegate : public QStyledItemDelegate {
    Q_OBJECT
public:
    using QStyledItemDelegate::QStyledItemDelegate;

    void paint(QPainter* painter, const QStyleOptionViewItem& option, const QModelIndex& index) const override;
    QSize sizeHint(const QStyleOptionViewItem& option, const QModelIndex& index) const override;
};

} // namespace mirel
