#pragma once

#include "tableview/cell_block.h"
#include "tableview/record_browser.h"

#include <QByteArray>
#include <QString>

#include <optional>

namespace mirel {

// Looks for a text in what the user reads in the cells of a result: from the selected cell on over the visible
// columns, record by record, around the end and back to where it began. Case does not count. Of a single record
// all fields are looked at.
//
// It works in slices, so that a window lives meanwhile: Begin, then Step until it says how it ended. The browser
// moves only when a text is found, and must outlive this.
class QuickFind {
public:
    enum class Direction { Forward, Backward };
    enum class State { Idle, Searching, Found, NotFound, Failed };
    // Whether the selected cell itself may be what is found: while the text is still being typed it may.
    enum class From { SelectedCell, BehindIt };

    explicit QuickFind(RecordBrowser& browser)
        : browser_(browser)
    {
    }

    // An empty text is found nowhere, and nothing is looked for.
    void Begin(const QString& text, Direction direction, From from);
    State Step(int budgetMs);
    void Stop() { state_ = State::Idle; }

    State Current() const { return state_; }
    bool HasWrapped() const { return wrapped_; } // past the last record, or the first
    qint64 Records() const { return looked_; }   // looked at since Begin

private:
    void TakeUpFields();
    bool Matches(const Cell& cell, int field) const;
    bool ReadOn(int budgetMs, std::optional<CellPlace>& found);
    bool ReadBack(int budgetMs, std::optional<CellPlace>& found);
    bool IsWithin(CellPlace place) const;
    // Takes up what a record of the slice holds: the first match of it that counts, in the walk's direction.
    std::optional<int> MatchIn(std::span<const Cell> cells, qint64 record) const;

    RecordBrowser& browser_;
    QString text_;
    QByteArray asciiText_; // in lower case; empty: the text is more than that
    Direction direction_ = Direction::Forward;
    From from_ = From::BehindIt;
    State state_ = State::Idle;
    std::vector<int> fields_;
    CellPlace start_; // its column is an index of fields_
    qint64 next_ = 0; // the record to look at
    qint64 looked_ = 0;
    bool wrapped_ = false;
};

} // namespace mirel
