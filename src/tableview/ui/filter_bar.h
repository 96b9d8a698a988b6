#pragma once

#include "result/open_result.h"

#include <QFrame>
#include <QWidget>

#include <vector>

class QToolButton;

namespace mirel {

// One condition: its words, which a tap opens a menu on, and a cross that takes it off.
class FilterChip : public QFrame {
    Q_OBJECT

public:
    FilterChip(const OpenResult::Filter& filter, QWidget* parent);

    QToolButton* Words() const { return words_; }
    QToolButton* Cross() const { return cross_; }
    // Its words cut to what `widthPx` leaves.
    void FitTo(int widthPx);
    int WholeWidth() const;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QString text_;
    bool on_;
    QToolButton* words_;
    QToolButton* cross_;
};

// The conditions in force above the records, a chip each: changed, switched off and on again, and taken off one by
// one. As many lines as the chips need; hidden while there are none.
class FilterBar : public QWidget {
    Q_OBJECT

public:
    enum class Offers { All, SwitchAndRemove };
    FilterBar(Offers offers, QWidget* parent);

    void Show(const std::vector<OpenResult::Filter>& filters);

Q_SIGNALS:
    void removed(int filter);
    void switched(int filter);
    void changeRequested(int filter);
    void addRequested();

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    void MakeChip(int filter);
    void OpenMenu(int filter);
    void PlaceChips();

    Offers offers_;
    std::vector<OpenResult::Filter> filters_;
    std::vector<FilterChip*> chips_;
    QToolButton* add_;
};

} // namespace mirel
