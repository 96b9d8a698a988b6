#include "csvimport/csv_reader.h"

#include "platform/utf8_bytes.h"

#include <QByteArrayView>

#include <algorithm>
#include <cstring>

namespace mirel {
namespace {

constexpr qint64 kMostFirstBufferBytes = 256 * 1024;
constexpr size_t kNone = std::string_view::npos;

// Detect makes a reader for every mark that a file might have: filling 256 KB for a file of some bytes would be
// most of its work.
size_t FirstBufferBytes(const QIODevice& device)
{
    constexpr qint64 kLeastBytes = 1024;
    const qint64 size = device.isSequential() ? 0 : device.size();
    return size > 0 ? size_t(std::clamp(size + 1, kLeastBytes, kMostFirstBufferBytes)) : kMostFirstBufferBytes;
}

bool HasNul(std::string_view bytes)
{
    return !bytes.empty() && std::memchr(bytes.data(), 0, bytes.size()) != nullptr;
}

// Each writes what is left of a text to `room`, which it moves behind it.
std::string_view UndoPairs(std::string_view text, const Utf8Mark& mark, char*& room)
{
    char* const begin = room;
    for (size_t at = 0; at < text.size();) {
        const size_t pair = mark.Find(text, at);
        const size_t next = pair == kNone ? text.size() : pair + mark.Length();
        room = std::copy(text.begin() + ptrdiff_t(at), text.begin() + ptrdiff_t(next), room);
        at = next;
        if (mark.Begins(text.substr(at)))
            at += mark.Length();
    }
    return {begin, size_t(room - begin)};
}

std::string_view WithoutNuls(std::string_view text, char*& room)
{
    char* const begin = room;
    room = std::remove_copy(text.begin(), text.end(), room, '\0');
    return {begin, size_t(room - begin)};
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
    , spansLines_(doubledQuotes_)
    , dropNuls_(format.dropNuls)
    , buffer_(FirstBufferBytes(device))
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
    if (cut && (isText_ || NameNotText()))
        return Result::Record;
    return fault_ == Fault::None ? Result::End : Result::Fault;
}

bool CsvReader::StepOverFault()
{
    if (fault_ == Fault::None || fault_ == Fault::CannotRead || source_.IsMalformed())
        return false;
    if (fault_ != Fault::NotText) {
        // What was taken for one long text: its first line is at fault, the others are read by themselves. There
        // is no closing mark behind it, so looking for one again from each line would be of no use.
        const std::string_view record = Record();
        const size_t lineEnd = std::min(record.find_first_of("\r\n"), record.size());
        if (fault_ == Fault::RecordTooLong && lineEnd == record.size())
            return false;
        recordEnd_ = recordAt_ + lineEnd;
        lfAt_ = recordEnd_;
        linesRead_ = line_;
        spansLines_ = false;
    }
    fault_ = Fault::None;
    return true;
}

std::string_view CsvReader::RawRecord()
{
    texts_.clear();
    size_t end = recordEnd_;
    if (end < filled_) {
        const size_t length = end - recordAt_; // looking ahead may move the record
        const bool isCr = buffer_[end] == '\r';
        const bool hasMore = end + 1 < filled_ || (isCr && Fill());
        end = recordAt_ + length + 1;
        end += size_t(isCr && hasMore && buffer_[end] == '\n');
    }
    return {buffer_.data() + recordAt_, end - recordAt_};
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
    isText_ = true;
    hasNuls_ = false;
    if (!FindLineEnd())
        return false;
    CheckText(0);
    return recordEnd_ > recordAt_ || recordEnd_ < filled_;
}

bool CsvReader::AppendLine()
{
    StepOverLineEnd();
    const size_t from = recordEnd_ - recordAt_;
    ++linesRead_;
    if (!FindLineEnd())
        return false;
    CheckText(from);
    return recordEnd_ - recordAt_ > from || recordEnd_ < filled_;
}

// Told once the record is cut: only then is it known how far it goes.
void CsvReader::CheckText(size_t from)
{
    const std::string_view bytes = Record().substr(from);
    hasNuls_ = hasNuls_ || HasNul(bytes);
    isText_ = isText_ && (dropNuls_ || !hasNuls_) && IsUtf8(bytes);
}

bool CsvReader::NameNotText()
{
    const auto isText = [this](std::string_view text) { return IsUtf8(text) && (dropNuls_ || !HasNul(text)); };
    faultText_ = int(std::ranges::find_if_not(texts_, isText) - texts_.begin());
    return Stop(Fault::NotText);
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
        texts_.push_back({Record().data() + from, end - from});
        if (end == Record().size())
            break;
        from = end + separator_.Length();
    }
    CleanTexts();
    return true;
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
        if (!spansLines_ || !AppendLine()) {
            Stop(Fault::QuoteNeverClosed);
            return kNone;
        }
    }
}

std::string_view CsvReader::WithoutMarks(std::string_view text) const
{
    if (text.size() < 2 * quote_.Length() || !quote_.Begins(text) || !quote_.Ends(text))
        return text;
    return text.substr(quote_.Length(), text.size() - 2 * quote_.Length());
}

// Takes the marks off. A text that then differs from the bytes of the record is written beside them: the record
// itself stays as it is in the file.
void CsvReader::CleanTexts()
{
    if (!doubledQuotes_ && !hasNuls_) {
        for (std::string_view& text : texts_)
            text = WithoutMarks(text);
        return;
    }
    char* room = nullptr;
    for (std::string_view& text : texts_) {
        const std::string_view bare = WithoutMarks(text);
        const bool hasPairs = doubledQuotes_ && bare.size() < text.size() && quote_.Find(bare, 0) != kNone;
        text = bare;
        if (!hasPairs && !hasNuls_)
            continue;
        if (!room) {
            const size_t passes = hasNuls_ ? 2 : 1;
            cleaned_.resize(std::max(cleaned_.size(), passes * Record().size()));
            room = cleaned_.data();
        }
        if (hasPairs)
            text = UndoPairs(text, quote_, room);
        if (hasNuls_ && dropNuls_ && HasNul(text))
            text = WithoutNuls(text, room);
    }
}

} // namespace mirel
