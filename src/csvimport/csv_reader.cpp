#include "csvimport/csv_reader.h"

#include <QByteArrayView>

#include <algorithm>
#include <cstring>

namespace mirel {
namespace {

constexpr size_t kFirstBufferBytes = 256 * 1024;
constexpr size_t kNone = std::string_view::npos;

bool IsPlainText(std::string_view bytes)
{
    return std::memchr(bytes.data(), 0, bytes.size()) == nullptr &&
           QByteArrayView(bytes.data(), qsizetype(bytes.size())).isValidUtf8();
}

} // namespace

Utf8Mark::Utf8Mark(char16_t unit)
{
    if (unit == 0 || QChar::isSurrogate(unit))
        return;
    const QByteArray utf8 = QString(QChar(unit)).toUtf8();
    std::ranges::copy(utf8, bytes_.begin());
    length_ = size_t(utf8.size());
}

size_t Utf8Mark::Find(std::string_view text, size_t from) const
{
    if (length_ == 0 || from >= text.size())
        return kNone;
    if (length_ == 1) {
        const void* at = std::memchr(text.data() + from, bytes_[0], text.size() - from);
        return at ? size_t(static_cast<const char*>(at) - text.data()) : kNone;
    }
    return text.find(Text(), from);
}

CsvReader::CsvReader(QIODevice& device, const CsvFormat& format)
    : source_(device, format.encoding)
    , separator_(format.separator)
    , quote_(format.quote)
    , doubledQuotes_(format.doubledQuotes && format.quote != 0)
    , buffer_(kFirstBufferBytes)
{
    if (format.quote != 0)
        enclosing_.push_back({quote_, false});
    for (const char16_t unit : {u'"', u'\''}) {
        if (unit != format.quote && !doubledQuotes_)
            enclosing_.push_back({Utf8Mark(unit), false});
    }
}

CsvReader::Result CsvReader::Next(int maxTexts)
{
    Q_ASSERT(maxTexts > 0 && maxTexts <= kMaxTexts);
    const bool cut = fault_ == Fault::None && ReadLine() && CutRecord(size_t(maxTexts));
    if (cut)
        return Result::Record;
    return fault_ == Fault::None ? Result::End : Result::Fault;
}

bool CsvReader::Stop(Fault fault)
{
    if (fault_ == Fault::None)
        fault_ = fault;
    return false;
}

bool CsvReader::ReadLine()
{
    StepOverLineEnd();
    recordAt_ = recordEnd_;
    line_ = ++linesRead_;
    faultText_ = 0;
    if (!FindLineEnd())
        return false;
    return (recordEnd_ > recordAt_ || recordEnd_ < filled_) && CheckText(0);
}

bool CsvReader::AppendLine()
{
    StepOverLineEnd();
    const size_t from = recordEnd_ - recordAt_;
    ++linesRead_;
    if (!FindLineEnd())
        return false;
    return (recordEnd_ - recordAt_ > from || recordEnd_ < filled_) && CheckText(from);
}

bool CsvReader::CheckText(size_t from)
{
    if (IsPlainText(Record().substr(from)))
        return true;
    Stop(Fault::NotText);
    if (from == 0 && CutRecord(kMaxTexts))
        faultText_ = int(std::ranges::find_if_not(texts_, IsPlainText) - texts_.begin());
    return false;
}

void CsvReader::StepOverLineEnd()
{
    if (recordEnd_ == filled_)
        return;
    // Whether a CR has an LF behind it may be told by bytes that are still to come.
    if (buffer_[recordEnd_] == '\r' && (recordEnd_ + 1 < filled_ || Fill()) && buffer_[recordEnd_ + 1] == '\n')
        ++recordEnd_;
    ++recordEnd_;
}

// Finds the first LF once for many lines: a file whose lines end with CR alone has none, and looking for it
// again in each line would take the square of the buffer's size.
bool CsvReader::FindLineEnd()
{
    for (size_t searched = recordEnd_ - recordAt_;;) {
        const size_t from = recordAt_ + searched;
        lfAt_ = std::max(lfAt_, from);
        if (lfAt_ < filled_ && buffer_[lfAt_] != '\n') {
            const void* lf = std::memchr(buffer_.data() + lfAt_, '\n', filled_ - lfAt_);
            lfAt_ = lf ? size_t(static_cast<const char*>(lf) - buffer_.data()) : filled_;
        }
        const void* cr = lfAt_ > from ? std::memchr(buffer_.data() + from, '\r', lfAt_ - from) : nullptr;
        recordEnd_ = cr ? size_t(static_cast<const char*>(cr) - buffer_.data()) : lfAt_;
        if (recordEnd_ < filled_)
            return true;
        searched = filled_ - recordAt_;
        if (!Fill())
            return fault_ == Fault::None;
    }
}

bool CsvReader::Fill()
{
    if (sourceEnded_)
        return false;
    if (filled_ - recordAt_ >= kMaxRecordBytes)
        return Stop(Fault::RecordTooLong);
    if (recordAt_ > 0) {
        std::memmove(buffer_.data(), buffer_.data() + recordAt_, filled_ - recordAt_);
        recordEnd_ -= recordAt_;
        filled_ -= recordAt_;
        lfAt_ = std::max(lfAt_, recordAt_) - recordAt_;
        recordAt_ = 0;
    }
    if (filled_ == buffer_.size())
        buffer_.resize(buffer_.size() * 2);
    const qint64 count = source_.Read(buffer_.data() + filled_, qint64(buffer_.size() - filled_));
    if (count < 0)
        return Stop(source_.IsMalformed() ? Fault::NotText : Fault::CannotRead);
    sourceEnded_ = count == 0;
    filled_ += size_t(count);
    return count > 0;
}

bool CsvReader::CutRecord(size_t maxTexts)
{
    texts_.clear();
    for (EnclosingMark& each : enclosing_)
        each.neverClosed = false;
    if (recordAt_ == recordEnd_)
        return true;
    for (size_t from = 0;;) {
        const char* const record = Record().data();
        const size_t end = FindTextEnd(from, texts_.size() + 1 == maxTexts);
        if (end == kNone) {
            faultText_ = int(texts_.size());
            return false;
        }
        // A text over several lines may have moved the buffer.
        const ptrdiff_t moved = Record().data() - record;
        if (moved != 0) {
            for (std::string_view& text : texts_)
                text = {text.data() + moved, text.size()};
        }
        texts_.push_back(WithoutMarks(from, end));
        if (end == Record().size())
            return true;
        from = end + separator_.Length();
    }
}

size_t CsvReader::FindTextEnd(size_t from, bool last)
{
    const auto opening = std::ranges::find_if(
        enclosing_, [text = Record().substr(from)](const EnclosingMark& each) { return each.mark.Begins(text); });
    size_t closing = kNone;
    if (opening != enclosing_.end() && doubledQuotes_) {
        closing = FindDoubledClosing(from + quote_.Length());
        if (closing == kNone)
            return kNone;
    } else if (opening != enclosing_.end() && !last && !opening->neverClosed) {
        closing = FindClosing(opening->mark, from + opening->mark.Length());
        opening->neverClosed = closing == kNone;
    }
    if (last)
        return Record().size();
    if (closing != kNone)
        return closing;
    return std::min(separator_.Find(Record(), from), Record().size());
}

// Behind the mark that closes a text; kNone: there is none.
size_t CsvReader::FindClosing(const Utf8Mark& mark, size_t from) const
{
    const std::string_view record = Record();
    for (size_t at = mark.Find(record, from); at != kNone; at = mark.Find(record, at)) {
        at += mark.Length();
        if (doubledQuotes_ && mark.Begins(record.substr(at)))
            at += mark.Length();
        else if (at == record.size() || separator_.Begins(record.substr(at)))
            return at;
    }
    return kNone;
}

size_t CsvReader::FindDoubledClosing(size_t from)
{
    for (;;) {
        const size_t closing = FindClosing(quote_, from);
        if (closing != kNone)
            return closing;
        from = Record().size(); // every mark up to here is one of a pair, or inside
        if (!AppendLine()) {
            Stop(Fault::QuoteNeverClosed);
            return kNone;
        }
    }
}

std::string_view CsvReader::WithoutMarks(size_t from, size_t end)
{
    std::string_view text = Record().substr(from, end - from);
    if (text.size() < 2 * quote_.Length() || !quote_.Begins(text) || !quote_.Ends(text))
        return text;
    text = text.substr(quote_.Length(), text.size() - 2 * quote_.Length());
    if (!doubledQuotes_)
        return text;
    // The bytes are the reader's own: the pairs shrink where they stand.
    char* const first = buffer_.data() + recordAt_ + from + quote_.Length();
    size_t kept = 0;
    for (size_t at = 0; at < text.size();) {
        const size_t pair = quote_.Find(text, at);
        const size_t next = pair == kNone ? text.size() : pair + quote_.Length();
        std::memmove(first + kept, text.data() + at, next - at);
        kept += next - at;
        at = next;
        if (quote_.Begins(text.substr(at)))
            at += quote_.Length();
    }
    return {first, kept};
}

} // namespace mirel
