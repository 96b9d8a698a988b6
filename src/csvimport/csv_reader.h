#pragma once

#include "csvimport/csv_format.h"
#include "csvimport/utf8_source.h"

#include <QIODevice>

#include <array>
#include <span>
#include <string_view>
#include <vector>

namespace mirel {

// One character of a format as UTF-8, to be looked for in UTF-8.
class Utf8Mark {
public:
    explicit Utf8Mark(char16_t unit); // 0, and half a surrogate pair: none

    bool IsNone() const { return length_ == 0; }
    size_t Length() const { return length_; }
    // A single byte, as marks nearly always are, is compared without a call.
    bool Begins(std::string_view text) const
    {
        return length_ == 1 ? text.starts_with(bytes_[0]) : length_ > 0 && text.starts_with(Text());
    }
    bool Ends(std::string_view text) const
    {
        return length_ == 1 ? text.ends_with(bytes_[0]) : length_ > 0 && text.ends_with(Text());
    }
    size_t Find(std::string_view text, size_t from) const; // npos: not there

private:
    std::string_view Text() const { return {bytes_.data(), length_}; }

    std::array<char, 3> bytes_{};
    size_t length_ = 0;
};

// Reads a delimited text file record by record and cuts each into its column texts. A record is a line (ended by
// LF, CR or CR LF); with doubled quotation marks a quoted text may go on over line ends.
//
// A text that begins with ' or ", or with the format's own mark, is enclosed when that mark comes again right
// before a separator or the line's end: separators inside do not cut then. A mark that is never closed, or
// stands inside a text, is an ordinary character (O'Brien, 5"). With doubled quotation marks only the format's
// mark encloses, and one that is never closed is a fault.
//
// Memory does not grow with the file, only with its longest record, which may have kMaxRecordBytes. The device is
// open for reading and outlives the reader.
class CsvReader {
public:
    enum class Result { Record, End, Fault };
    enum class Fault { None, CannotRead, NotText, RecordTooLong, QuoteNeverClosed };

    static constexpr size_t kMaxRecordBytes = 64 * 1024 * 1024;
    static constexpr int kMaxTexts = 4096;

    CsvReader(QIODevice& device, const CsvFormat& format);

    // Reads the next record and cuts it into at most `maxTexts`, of which the last takes the rest of the record.
    // Nothing more is to be read after End, nor after Fault unless StepOverFault succeeds.
    [[nodiscard]] Result Next(int maxTexts = kMaxTexts);

    // Gives the failing record up, so that Next reads the one behind it. Of a text that is never closed that is
    // the next line, and from there on no text goes on over line ends. False where nothing more can be read.
    [[nodiscard]] bool StepOverFault();

    // The record as it is in the file (in UTF-8), with its line end. Ends the texts' life.
    std::string_view RawRecord();

    // The texts of the record, without the format's quotation marks around them; good until the next call.
    // An empty line has none.
    std::span<const std::string_view> Texts() const { return texts_; }
    qint64 Line() const { return line_; } // on which the record begins, from 1
    Fault LastFault() const { return fault_; }
    int FaultText() const { return faultText_; } // which text of the record was at fault, from 0
    qint64 BytesConsumed() const { return source_.BytesConsumed(); }
    const QString& Encoding() const { return source_.Encoding(); }
    bool HasByteOrderMark() const { return source_.HasByteOrderMark(); }

private:
    // Each is false at the end and at a fault; fault_ tells which.
    [[nodiscard]] bool ReadLine();   // the next line becomes the record
    [[nodiscard]] bool AppendLine(); // the record takes in its line end and the next line
    [[nodiscard]] bool FindLineEnd();
    [[nodiscard]] bool Fill();
    void StepOverLineEnd();
    void CheckText(size_t from); // the bytes from there to the record's end
    bool NameNotText();          // the fault of a record whose bytes are no text
    bool Stop(Fault fault);

    [[nodiscard]] bool CutRecord(size_t maxTexts);
    // The end of the text that begins at `from`, both counted from the record's beginning. npos at a fault.
    [[nodiscard]] size_t FindTextEnd(size_t from, bool last);
    [[nodiscard]] size_t FindDoubledClosing(size_t from);
    size_t FindClosing(const Utf8Mark& mark, size_t from) const;
    std::string_view WithoutMarks(std::string_view text) const;
    void CleanTexts();
    std::string_view Record() const { return {buffer_.data() + recordAt_, recordEnd_ - recordAt_}; }

    struct EnclosingMark {
        Utf8Mark mark;
        bool neverClosed; // no closing mark stands in the rest of this record
    };

    Utf8Source source_;
    Utf8Mark separator_;
    Utf8Mark quote_;
    std::vector<EnclosingMark> enclosing_;
    bool doubledQuotes_;
    bool spansLines_;
    bool dropNuls_;

    std::vector<char> buffer_;
    size_t recordAt_ = 0;  // the record's first byte
    size_t recordEnd_ = 0; // behind its last one: at the line end, or at the end of the file
    size_t filled_ = 0;    // behind the last byte that was read
    size_t lfAt_ = 0;      // no LF stands between the record's end and here
    bool sourceEnded_ = false;
    std::vector<std::string_view> texts_;
    std::vector<char> cleaned_; // the texts that are not in the buffer as they are meant
    bool isText_ = true;        // of the record's bytes
    bool hasNuls_ = false;
    qint64 line_ = 0;
    qint64 linesRead_ = 0;
    Fault fault_ = Fault::None;
    int faultText_ = 0;
};

} // namespace mirel
