#include "csvimport/csv_sample.h"

#include "csvimport/csv_reader.h"
#include "csvimport/date_guess.h"
#include "csvimport/type_guess.h"

#include <QBuffer>

#include <algorithm>
#include <map>
#include <set>

namespace mirel {
namespace {

constexpr size_t kMostRecords = 400;

// How far a character is believed to be a separator: blanks and colons also occur inside texts and times.
double TrustIn(char16_t separator)
{
    switch (separator) {
    case u' ':
    case u':':
        return 0.4;
    case u'|':
        return 0.95;
    default:
        return 1;
    }
}

enum class Decimals { PointOnly, Any };

bool IsTyped(std::string_view text, Decimals decimals)
{
    TypeGuess guess({.order = DateOrder::YearMonthDay});
    guess.Add(text);
    DateGuess dates;
    dates.Add(text);
    return guess.Column().type != FieldType::Text || dates.MayBeAny() ||
           (decimals == Decimals::Any && guess.HasDecimalComma());
}

// The number of texts that most records have.
struct Width {
    size_t texts = 0;
    double share = 0;
};
Width UsualWidth(const std::vector<CsvSample::Record>& records)
{
    std::map<size_t, size_t> counts;
    for (const CsvSample::Record& record : records)
        ++counts[record.size()];
    Width usual;
    for (const auto& [texts, count] : counts) {
        const double share = double(count) / double(records.size());
        if (share >= usual.share)
            usual = {texts, share};
    }
    return usual;
}

double TypedShare(const std::vector<CsvSample::Record>& records, Decimals decimals)
{
    constexpr size_t kMostTexts = 4000;
    size_t texts = 0;
    size_t typed = 0;
    for (const CsvSample::Record& record : records) {
        for (const std::string& text : record) {
            if (text.empty())
                continue;
            if (++texts > kMostTexts)
                return double(typed) / double(kMostTexts);
            typed += IsTyped(text, decimals);
        }
    }
    return texts == 0 ? 0 : double(typed) / double(texts);
}

// What one column says for its first text being a name: above 0 for, below against.
int HeaderVote(const std::vector<CsvSample::Record>& records, size_t column)
{
    const std::string& first = records[0][column];
    TypeGuess types({.order = DateOrder::YearMonthDay});
    DateGuess dates;
    bool occursAgain = false;
    std::set<size_t> lengths;
    for (const CsvSample::Record& record : std::vector(records.begin() + 1, records.end())) {
        if (column >= record.size() || record[column].empty())
            continue;
        types.Add(record[column]);
        dates.Add(record[column]);
        occursAgain = occursAgain || record[column] == first;
        lengths.insert(record[column].size());
    }
    if (types.IsEmpty())
        return 0;
    constexpr int kSurely = 2;
    if (IsTyped(first, Decimals::Any))
        return -kSurely;
    const bool restIsTyped = types.Column().type == FieldType::Integer ||
                             types.Column().type == FieldType::Double || types.Column().type == FieldType::Date ||
                             types.Column().type == FieldType::YesNo || types.HasDecimalComma() ||
                             dates.MayBeAny();
    if (restIsTyped && !first.empty())
        return kSurely;
    if (occursAgain)
        return -kSurely;
    return !first.empty() && lengths.size() == 1 && records.size() > 3 && !lengths.contains(first.size()) ? 1 : 0;
}

} // namespace

CsvSample::CsvSample(QByteArray utf8, bool isWhole)
    : utf8_(std::move(utf8))
    , isWhole_(isWhole)
{
}

CsvSample::Cut CsvSample::CutBy(const CsvFormat& format) const
{
    CsvFormat shown = format;
    shown.encoding = QStringLiteral("UTF-8");
    shown.dropNuls = true;
    QBuffer device;
    device.setData(utf8_);
    Cut cut;
    if (!device.open(QIODevice::ReadOnly))
        return cut;
    CsvReader reader(device, shown);
    while (cut.records.size() < kMostRecords) {
        const CsvReader::Result result = reader.Next();
        if (result == CsvReader::Result::End)
            break;
        if (result == CsvReader::Result::Fault) {
            cut.neverClosed =
                cut.neverClosed || (reader.LastFault() == CsvReader::Fault::QuoteNeverClosed && isWhole_);
            if (!isWhole_ || !reader.StepOverFault())
                break;
            continue;
        }
        if (!reader.Texts().empty())
            cut.records.emplace_back(reader.Texts().begin(), reader.Texts().end());
    }
    // The last one may be cut short by the sample's end.
    if (!isWhole_ && cut.records.size() > 2 && cut.records.size() < kMostRecords)
        cut.records.pop_back();
    return cut;
}

CsvSample::Fit CsvSample::FitOf(const CsvFormat& format) const
{
    const Cut cut = CutBy(format);
    Fit fit{.neverClosed = cut.neverClosed};
    if (cut.records.empty())
        return fit;
    constexpr double kOneColumn = 0.11; // above texts that blanks or colons cut
    const Width width = UsualWidth(cut.records);
    fit.share = width.share;
    if (width.texts < 2) {
        const double typed = TypedShare(cut.records, Decimals::PointOnly);
        fit.score = kOneColumn + 0.6 * typed * typed * typed * fit.share; // nearly all must be
        return fit;
    }
    const double spread = 1 - 1 / double(width.texts);
    const double typed = 0.5 + 0.5 * TypedShare(cut.records, Decimals::Any);
    fit.score = TrustIn(format.separator) * fit.share * spread * typed;
    return fit;
}

void CsvSample::FindMarks(CsvFormat& format, const Candidates& candidates) const
{
    Fit best;
    const CsvFormat start = format;
    for (const char16_t separator : candidates.separators) {
        for (const char16_t quote : candidates.quotes) {
            for (const bool doubled : candidates.doubled) {
                CsvFormat tried = start;
                tried.separator = separator;
                tried.quote = quote;
                tried.doubledQuotes = doubled;
                const Fit fit = FitOf(tried);
                if (fit.score <= best.score || (fit.neverClosed && candidates.doubled.size() > 1))
                    continue;
                best = fit;
                format = tried;
            }
        }
    }
}

bool LooksLikeHeader(const std::vector<CsvSample::Record>& records)
{
    if (records.size() < 2)
        return false;
    const CsvSample::Record& first = records[0];
    int votes = 0;
    for (size_t column = 0; column < first.size(); ++column)
        votes += HeaderVote(records, column);
    if (votes != 0)
        return votes > 0;
    // All are texts: names differ from one another and from all that follows, and are short.
    constexpr size_t kLongName = 64;
    std::set<std::string> names;
    return std::ranges::all_of(first, [&names](const std::string& name) {
        return !name.empty() && name.size() <= kLongName && names.insert(name).second;
    });
}

} // namespace mirel
