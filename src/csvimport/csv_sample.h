#pragma once

#include "csvimport/csv_format.h"

#include <QByteArray>

#include <string>
#include <vector>

namespace mirel {

// The beginning of a text file in UTF-8, cut into records in one way or another to see which way suits it.
class CsvSample {
public:
    // `isWhole`: the file ends with these bytes.
    CsvSample(QByteArray utf8, bool isWhole);

    using Record = std::vector<std::string>;
    struct Cut {
        std::vector<Record> records;
        bool neverClosed = false; // a quoted text does not end
    };
    Cut CutBy(const CsvFormat& format) const;

    // Fills separator, quotation mark and doubled marks with what suits the sample best. A setting that is known
    // is only looked for among its own value.
    struct Candidates {
        std::vector<char16_t> separators;
        std::vector<char16_t> quotes;
        std::vector<bool> doubled;
    };
    void FindMarks(CsvFormat& format, const Candidates& candidates) const;

private:
    struct Fit {
        double score = -1;
        double share = 0; // of the records that have the usual number of texts
        bool neverClosed = false;
    };
    Fit FitOf(const CsvFormat& format) const;

    QByteArray utf8_;
    bool isWhole_;
};

// Whether the first record looks like the names of the columns below it.
bool LooksLikeHeader(const std::vector<CsvSample::Record>& records);

} // namespace mirel
