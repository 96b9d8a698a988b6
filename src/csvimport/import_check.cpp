#include "csvimport/import_check.h"

#include "data/provider_error.h"

#include <algorithm>

namespace mirel {
namespace {

// What the table itself will say of a cell's size.
Hr FitsField(const Cell& cell, const ResultField& field)
{
    if (cell.kind == Cell::Kind::Text && field.type == FieldType::Text && field.size > 0)
        return cell.bytes.size() > size_t(field.size) && Utf16Length(cell.bytes) > field.size ? Hr::Overflow
                                                                                              : Hr::Ok;
    if (cell.kind != Cell::Kind::Integer || field.size == kWideIntegerSize)
        return Hr::Ok;
    const bool fits = field.type == FieldType::SmallInt  ? cell.integer == qint16(cell.integer)
                      : field.type == FieldType::Integer ? cell.integer == qint32(cell.integer)
                                                         : true;
    return fits ? Hr::Ok : Hr::Overflow;
}

} // namespace

ImportCheck::ImportCheck(QIODevice& file, const ImportPlan& plan, std::span<const ResultField> fields,
                         KeyIndex* index, OnFailure onFailure)
    : fields_(fields.begin(), fields.end())
    , index_(index)
    , onFailure_(onFailure)
    , lines_(file, plan, fields_)
    , keyAt_(PlacesOfKey(plan.key, fields_))
{
}

bool ImportCheck::Step(qint64 lines)
{
    for (qint64 i = 0; i < lines; ++i) {
        switch (lines_.Next()) {
        case ImportLines::Result::End:
            return false;
        case ImportLines::Result::Failed:
            if (!Fail(lines_.Failure()))
                return false;
            break;
        case ImportLines::Result::Record:
            if (!TakeRecord())
                return false;
            break;
        }
    }
    return true;
}

bool ImportCheck::TakeRecord()
{
    const std::span<const Cell> cells = lines_.Cells();
    for (size_t i = 0; i < cells.size(); ++i) {
        const Hr fits = FitsField(cells[i], fields_[i]);
        if (!Failed(fits))
            continue;
        lines_.Refuse(ProviderErrorText(nullptr, fits, {}), int(i));
        return Fail(lines_.Failure());
    }
    if (index_ && !index_->AddLine(KeyIndex::KeyOf(cells, keyAt_), lines_.Line())) {
        lineOfSeveral_ = lines_.Line();
        return false;
    }
    ++goodLines_;
    return true;
}

bool ImportCheck::Fail(const LineFailure& failure)
{
    ++failingLines_;
    if (failures_.size() < kMostKept)
        failures_.push_back(failure);
    return onFailure_ == OnFailure::GoOn && lines_.StepOver();
}

std::vector<int> PlacesOfKey(const QStringList& key, std::span<const ResultField> fields)
{
    std::vector<int> places;
    for (const QString& name : key) {
        const auto field = std::ranges::find_if(fields, [&name](const ResultField& each) {
            return each.name.compare(name, Qt::CaseInsensitive) == 0;
        });
        if (field != fields.end())
            places.push_back(int(field - fields.begin()));
    }
    return places;
}

} // namespace mirel
