#pragma once

#include "csvimport/import_lines.h"
#include "csvimport/key_index.h"

#include <span>
#include <vector>

namespace mirel {

// Reads a file as an import would and writes nothing: which lines will fail, and with a key how many records are
// added and changed. What only the table knows (an index that wants different values) shows when it is written.
class ImportCheck {
public:
    static constexpr size_t kMostKept = 200; // failures, in the order of the file

    enum class OnFailure { Stop, GoOn };
    // Everything outlives the check. `index` may be null; it takes in the lines.
    ImportCheck(QIODevice& file, const ImportPlan& plan, std::span<const ResultField> fields, KeyIndex* index,
                OnFailure onFailure);

    // Reads on; false once there is nothing more to read.
    [[nodiscard]] bool Step(qint64 lines);

    qint64 GoodLines() const { return goodLines_; }
    qint64 FailingLines() const { return failingLines_; }
    qint64 BytesConsumed() const { return lines_.BytesConsumed(); }
    void CountWhatWasCut(ImportReport& report) const { lines_.CountWhatWasCut(report); }
    const std::vector<LineFailure>& Failures() const { return failures_; }
    // The line whose key names several records, which no run takes; 0: none.
    qint64 LineOfSeveral() const { return lineOfSeveral_; }

private:
    bool TakeRecord();
    bool Fail(const LineFailure& failure);

    std::vector<ResultField> fields_;
    KeyIndex* index_;
    OnFailure onFailure_;
    ImportLines lines_;
    std::vector<int> keyAt_; // of the fields
    std::vector<LineFailure> failures_;
    qint64 goodLines_ = 0;
    qint64 failingLines_ = 0;
    qint64 lineOfSeveral_ = 0;
};

// Where the key's fields are among those that the plan fills.
std::vector<int> PlacesOfKey(const QStringList& key, std::span<const ResultField> fields);

} // namespace mirel
