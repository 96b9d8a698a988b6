#include "csvimport/csv_detect.h"

#include "csvimport/csv_reader.h"
#include "csvimport/csv_sample.h"
#include "csvimport/date_guess.h"
#include "csvimport/reader_fault.h"
#include "csvimport/text_encoding.h"
#include "csvimport/type_guess.h"
#include "csvimport/utf8_source.h"
#include "platform/system_reason.h"
#include "resources/string_table.h"

#include <algorithm>

namespace mirel {
namespace {

using namespace Qt::StringLiterals;

constexpr qint64 kSampleBytes = 256 * 1024;
constexpr int kMostColumns = 2000;    // of a table
constexpr size_t kMoreTextsTaken = 8; // than usual: a line with more of them has separators in its last text
constexpr qint64 kLinesPerProgress = 1024;

LineEnds LineEndsOf(const QByteArray& utf8)
{
    qsizetype pairs = 0;
    qsizetype lone[2] = {0, 0}; // LF, CR
    for (qsizetype i = 0; i < utf8.size(); ++i) {
        if (utf8[i] == '\r' && i + 1 < utf8.size() && utf8[i + 1] == '\n') {
            ++pairs;
            ++i;
        } else if (utf8[i] == '\r' || utf8[i] == '\n') {
            ++lone[utf8[i] == '\r' ? 1 : 0];
        }
    }
    const int kinds = int(pairs > 0) + int(lone[0] > 0) + int(lone[1] > 0);
    if (kinds != 1)
        return kinds == 0 ? LineEnds::None : LineEnds::Mixed;
    return pairs > 0 ? LineEnds::CrLf : lone[0] > 0 ? LineEnds::Lf : LineEnds::Cr;
}

template <typename T>
std::vector<T> Known(const std::optional<T>& known, std::vector<T> otherwise)
{
    return known ? std::vector<T>{*known} : otherwise;
}

class Detection {
public:
    Detection(QIODevice& file, const CsvGiven& given, UserPrompt& prompt)
        : file_(file)
        , given_(given)
        , prompt_(prompt)
    {
        CsvFormat& format = found_.format;
        format.dates = given.dates.value_or(format.dates);
        format.decimal = given.decimal.value_or(format.decimal);
    }

    bool Execute()
    {
        return FindEncoding() && TakeSample() && FindMarks() && ScanColumns() && NameColumns() && ChooseTypes();
    }
    const CsvFound& Found() const { return found_; }

private:
    struct Column {
        TypeGuess type;
        DateGuess dates;
    };

    bool Tell(Str message, const QStringList& arguments = {})
    {
        prompt_.Show({message, arguments});
        return false;
    }

    bool Rewind() { return file_.seek(0) || Tell(Str::ImportCannotRead, {SystemReason(file_)}); }

    bool FindEncoding()
    {
        if (file_.isSequential())
            return Tell(Str::ImportDetectNeedsFile);
        if (!Rewind())
            return false;
        const std::unique_ptr<Progress> progress =
            prompt_.StartProgress({Str::ImportScanProgress, {}}, file_.size());
        TextLook look;
        switch (LookAtText(file_, *progress, look)) {
        case LookResult::CannotRead:
            return Tell(Str::ImportCannotRead, {SystemReason(file_)});
        case LookResult::Stopped:
            return false;
        case LookResult::Done:
            break;
        }
        found_.format.encoding = given_.encoding.value_or(look.Encoding());
        found_.format.dropNuls = look.HasNuls(found_.format.encoding);
        hasMarks_ = look.hasMarks;
        return true;
    }

    bool TakeSample()
    {
        if (!Rewind())
            return false;
        Utf8Source source(file_, found_.format.encoding);
        QByteArray sample(kSampleBytes, Qt::Uninitialized);
        qint64 filled = 0;
        qint64 count = 1;
        while (filled < sample.size() && (count = source.Read(sample.data() + filled, sample.size() - filled)) > 0)
            filled += count;
        if (count < 0)
            return source.IsMalformed() ? Tell(Str::ImportNotText, {found_.format.encoding})
                                        : Tell(Str::ImportCannotRead, {SystemReason(file_)});
        sample.truncate(filled);
        if (sample.trimmed().isEmpty())
            return Tell(Str::ImportNoText);
        found_.lineEnds = LineEndsOf(sample);
        sample_.emplace(sample, count == 0);
        return true;
    }

    bool FindMarks()
    {
        CsvFormat& format = found_.format;
        std::vector<bool> doubled = {false};
        if (hasMarks_)
            doubled = {true, false};
        sample_->FindMarks(format,
                           {Known(given_.separator, {u',', u';', u'\t', u'|', u' ', u':'}),
                            Known<char16_t>(given_.quote, {u'"', u'\''}), Known(given_.doubledQuotes, doubled)});
        ChooseQuote();
        const std::vector<CsvSample::Record> records = sample_->CutBy(format).records;
        format.namesInFirstLine = given_.namesInFirstLine.value_or(LooksLikeHeader(records));
        return true;
    }

    // Both marks enclose under the plain rule; the file's own one is that which encloses more texts.
    void ChooseQuote()
    {
        CsvFormat& format = found_.format;
        if (given_.quote || format.doubledQuotes)
            return;
        CsvFormat bare = format;
        bare.quote = 0;
        qint64 singles = 0;
        qint64 doubles = 0;
        for (const CsvSample::Record& record : sample_->CutBy(bare).records) {
            for (const std::string& text : record) {
                singles += text.size() > 1 && text.front() == '\'' && text.back() == '\'';
                doubles += text.size() > 1 && text.front() == '"' && text.back() == '"';
            }
        }
        format.quote = singles > doubles ? u'\'' : u'"';
    }

    // Looks at every text of the file. A second time when the first look shows a wrong guess: a quoted text that
    // never ends, or lines with far more texts than usual.
    bool ScanColumns()
    {
        int most = kMostColumns;
        for (;;) {
            bool neverClosed = false;
            if (!ScanOnce(most, neverClosed))
                return false;
            if (neverClosed && !given_.doubledQuotes) {
                found_.format.doubledQuotes = false;
                neverClosed = false;
                ChooseQuote();
                if (!ScanOnce(most, neverClosed))
                    return false;
            }
            const size_t usual = UsualWidth();
            if (columns_.size() <= usual + kMoreTextsTaken || most < kMostColumns)
                return found_.records > 0 || !first_.isEmpty() || Tell(Str::ImportNoText);
            most = int(usual);
        }
    }

    bool ScanOnce(int most, bool& neverClosed)
    {
        columns_.clear();
        widths_.clear();
        first_.clear();
        found_.records = found_.failingLines = 0;
        if (!Rewind())
            return false;
        const std::unique_ptr<Progress> progress =
            prompt_.StartProgress({Str::ImportScanProgress, {}}, file_.size());
        CsvReader reader(file_, found_.format);
        bool isHeader = found_.format.namesInFirstLine;
        for (qint64 lines = 1;; ++lines) {
            if (lines % kLinesPerProgress == 0 && !progress->Advance(reader.BytesConsumed()))
                return false;
            const CsvReader::Result result = reader.Next(most);
            if (result == CsvReader::Result::End)
                return true;
            if (result == CsvReader::Result::Fault) {
                neverClosed = reader.LastFault() == CsvReader::Fault::QuoteNeverClosed;
                if (neverClosed && !given_.doubledQuotes)
                    return true;
                const UserMessage fault = MessageOfFault(reader, file_);
                if (!reader.StepOverFault()) {
                    prompt_.Show(fault);
                    return false;
                }
                ++found_.failingLines;
                continue;
            }
            if (reader.Texts().empty() && widths_.size() > 2)
                continue;
            if (isHeader)
                first_ = TextsOf(reader.Texts());
            else
                AddRecord(reader.Texts());
            isHeader = false;
        }
    }

    void AddRecord(std::span<const std::string_view> texts)
    {
        ++found_.records;
        if (widths_.size() <= texts.size())
            widths_.resize(texts.size() + 1);
        ++widths_[texts.size()];
        while (columns_.size() < texts.size())
            columns_.push_back({TypeGuess(found_.format.dates, found_.format.decimal), DateGuess()});
        for (size_t i = 0; i < texts.size(); ++i) {
            columns_[i].type.Add(texts[i]);
            columns_[i].dates.Add(texts[i]);
        }
    }

    size_t UsualWidth() const
    {
        const size_t usual = size_t(std::ranges::max_element(widths_) - widths_.begin());
        return std::max({usual, size_t(first_.size()), size_t(1)});
    }

    bool NameColumns()
    {
        const size_t count = std::max({columns_.size(), size_t(first_.size()), size_t(1)});
        columns_.resize(count, {TypeGuess(found_.format.dates), DateGuess()});
        QStringList names = first_;
        names.resize(qsizetype(count));
        found_.columns = found_.format.namesInFirstLine ? ColumnsNamed(names) : NumberedColumns(int(count));
        return true;
    }

    bool ChooseTypes()
    {
        if (!given_.decimal) {
            const auto has = [this](bool (TypeGuess::*kind)() const) {
                return std::ranges::count_if(columns_, [kind](const Column& each) { return (each.type.*kind)(); });
            };
            if (has(&TypeGuess::HasDecimalComma) > has(&TypeGuess::HasDecimalPoint))
                found_.format.decimal = u',';
        }
        if (!given_.dates)
            ChooseDates();
        for (size_t i = 0; i < columns_.size(); ++i)
            found_.columns[i] = Typed(columns_[i], found_.columns[i].field, i);
        return true;
    }

    // Numbers come first: 20010704 is an integer.
    static bool IsDate(const Column& column)
    {
        const FieldType type = column.type.Column().type;
        return column.dates.MayBeAny() &&
               (type == FieldType::Text || type == FieldType::Memo || type == FieldType::Date);
    }

    // An order that is certain in one column is taken for the others.
    void ChooseDates()
    {
        DateOrder order = DateOrderOfLocale();
        for (const Column& column : columns_) {
            if (IsDate(column) && column.dates.IsUnambiguous())
                order = column.dates.Best(order).order;
        }
        const auto first = std::ranges::find_if(
            columns_, [](const Column& each) { return IsDate(each) && each.dates.HasDates(); });
        if (first != columns_.end())
            found_.format.dates = first->dates.Best(order);
    }

    ImportColumn Typed(Column& column, const QString& name, size_t position)
    {
        if (found_.format.decimal == u',')
            column.type.TakeDecimalComma();
        ImportColumn typed = column.type.Column();
        typed.field = name;
        if (!given_.dates && IsDate(column)) {
            typed.type = FieldType::Date;
            const DateFormat own = column.dates.Best(found_.format.dates.order);
            typed.dates = own == found_.format.dates ? std::nullopt : std::optional(own);
        } else if (!given_.dates && typed.type == FieldType::Date) {
            typed.dates = DateFormat();
        }
        // What a separator at each line's end makes is no column.
        typed.ignored = column.type.IsEmpty() && position > 0 && position + 1 == columns_.size() &&
                        found_.records > 0 && first_.value(qsizetype(position)).isEmpty();
        if (column.type.LongestText() > CellReader::kMaxTextUnits)
            found_.longTexts = CellReader::LongTexts::KeepWhole;
        return typed;
    }

    QIODevice& file_;
    const CsvGiven& given_;
    UserPrompt& prompt_;
    CsvFound found_;
    bool hasMarks_ = false;
    std::optional<CsvSample> sample_;
    QStringList first_; // the header's texts
    std::vector<Column> columns_;
    std::vector<qint64> widths_; // records by their number of texts
};

} // namespace

bool DetectCsv(QIODevice& file, const CsvGiven& given, CsvFound& found, UserPrompt& prompt)
{
    Detection detection(file, given, prompt);
    if (!detection.Execute())
        return false;
    found = detection.Found();
    return true;
}

} // namespace mirel
