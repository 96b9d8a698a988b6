#include "tableview/quick_find.h"

#include "data/provider_error.h"
#include "result/cell_text.h"

#include <QElapsedTimer>

#include <algorithm>

namespace mirel {
namespace {

constexpr qint64 kRecordsAtOnce = 512; // between two looks at the clock
constexpr unsigned char kBeyondAscii = 0x80;

char Lower(char letter)
{
    return letter >= 'A' && letter <= 'Z' ? char(letter + ('a' - 'A')) : letter;
}

// `needle` is in lower case already. Letters beyond ASCII keep their bytes: they are none of the needle's.
bool ContainsAscii(std::string_view text, std::string_view needle)
{
    return std::search(text.begin(), text.end(), needle.begin(), needle.end(),
                       [](char a, char b) { return Lower(a) == b; }) != text.end();
}

} // namespace

void QuickFind::Begin(const QString& text, Direction direction, From from)
{
    text_ = text;
    direction_ = direction;
    from_ = from;
    wrapped_ = false;
    looked_ = 0;
    asciiText_ = text.toLower().toUtf8();
    if (std::ranges::any_of(asciiText_, [](char letter) { return uchar(letter) >= kBeyondAscii; }))
        asciiText_.clear();
    TakeUpFields();
    const bool nothing = text.isEmpty() || fields_.empty() || browser_.SelectedRecord() < 0;
    state_ = nothing ? State::NotFound : State::Searching;
    if (nothing)
        return;
    const auto at = std::ranges::find(fields_, browser_.SelectedField());
    start_ = {browser_.SelectedRecord(), at == fields_.end() ? 0 : int(at - fields_.begin())};
    next_ = start_.record;
}

void QuickFind::TakeUpFields()
{
    fields_.clear();
    const bool list = browser_.CurrentPresentation() == Presentation::List;
    for (int field = 0; field < browser_.FieldCount(); ++field) {
        if (!list || browser_.IsVisible(field))
            fields_.push_back(field);
    }
}

bool QuickFind::Matches(const Cell& cell, int field) const
{
    const FieldType type = browser_.TypeOfField(field);
    if (cell.kind == Cell::Kind::Null || cell.kind == Cell::Kind::Binary)
        return false;
    if (cell.kind == Cell::Kind::Text && type != FieldType::Date && !asciiText_.isEmpty())
        return ContainsAscii(cell.bytes, std::string_view(asciiText_.constData(), size_t(asciiText_.size())));
    return GridText(cell, type, browser_.Settings().words, TableViewSettings::kNoColumnLimit)
        .contains(text_, Qt::CaseInsensitive);
}

// Of the record where it began only one side of the selected cell is looked at first; the other one, and where it
// was not the beginning the cell itself, once all other records are through.
bool QuickFind::IsWithin(CellPlace place) const
{
    if (place.record != start_.record)
        return true;
    if (place.column == start_.column)
        return (from_ == From::SelectedCell) != wrapped_;
    return ((place.column > start_.column) == (direction_ == Direction::Forward)) != wrapped_;
}

std::optional<int> QuickFind::MatchIn(std::span<const Cell> cells, qint64 record) const
{
    const int count = int(cells.size());
    for (int i = 0; i < count; ++i) {
        const int column = direction_ == Direction::Forward ? i : count - 1 - i;
        if (IsWithin({record, column}) && Matches(cells[size_t(column)], fields_[size_t(column)]))
            return column;
    }
    return {};
}

// The way on needs no count of the records: a large result would have to be walked through for it first.
bool QuickFind::ReadOn(int budgetMs, std::optional<CellPlace>& found)
{
    QElapsedTimer clock;
    clock.start();
    bool read = true;
    do {
        const qint64 left = wrapped_ ? start_.record + 1 - next_ : kRecordsAtOnce;
        const ReadRange range{.first = next_, .count = std::min(left, kRecordsAtOnce), .fields = fields_};
        qint64 record = next_;
        read = browser_.Recordset().Read(range, [&](std::span<const Cell> cells) {
            if (const std::optional<int> column = MatchIn(cells, record))
                found = CellPlace{record, *column};
            ++record;
            return !found;
        });
        const bool isAtEnd = record - next_ < kRecordsAtOnce;
        looked_ += record - next_;
        next_ = record;
        if (found || !isAtEnd)
            continue;
        if (wrapped_)
            state_ = State::NotFound;
        wrapped_ = true;
        next_ = 0;
    } while (read && !found && state_ == State::Searching && clock.elapsed() < budgetMs);
    return read;
}

bool QuickFind::ReadBack(int budgetMs, std::optional<CellPlace>& found)
{
    QElapsedTimer clock;
    clock.start();
    bool read = true;
    do {
        const qint64 end = wrapped_ ? start_.record : 0;
        const qint64 begin = std::max(next_ - kRecordsAtOnce + 1, end);
        qint64 record = begin;
        const ReadRange range{.first = begin, .count = next_ - begin + 1, .fields = fields_};
        read = browser_.Recordset().Read(range, [&](std::span<const Cell> cells) {
            if (const std::optional<int> column = MatchIn(cells, record))
                found = CellPlace{record, *column};
            ++record;
            return true;
        });
        looked_ += next_ - begin + 1;
        next_ = begin - 1;
        if (found || next_ >= end)
            continue;
        if (wrapped_)
            state_ = State::NotFound;
        wrapped_ = true;
        next_ = browser_.Recordset().RecordCount() - 1;
    } while (read && !found && state_ == State::Searching && clock.elapsed() < budgetMs);
    return read;
}

QuickFind::State QuickFind::Step(int budgetMs)
{
    if (state_ != State::Searching)
        return state_;
    std::optional<CellPlace> found;
    const bool read = direction_ == Direction::Forward ? ReadOn(budgetMs, found) : ReadBack(budgetMs, found);
    if (!read)
        state_ = State::Failed;
    else if (found)
        state_ = browser_.GoToCell(found->record, fields_[size_t(found->column)]) ? State::Found : State::Failed;
    return state_;
}

} // namespace mirel
