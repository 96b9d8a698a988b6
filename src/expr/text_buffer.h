#pragma once

#include <QString>
#include <QStringView>

#include <algorithm>
#include <cstring>
#include <memory>
#include <string_view>
#include <utility>

namespace mirel {

// The text that a node computes for each record. It keeps its memory, and everything done per record is inline,
// because calls are most of the cost of short texts.
class TextBuffer {
public:
    QStringView View() const { return {units_.get(), size_}; }
    void Swap(TextBuffer& other)
    {
        std::swap(units_, other.units_);
        std::swap(size_, other.size_);
        std::swap(room_, other.room_);
    }

    // Sets the length of the text and lends its units; those within both lengths keep their contents.
    char16_t* Resize(qsizetype size)
    {
        if (size > room_)
            Grow(size);
        size_ = size;
        return units_.get();
    }
    // `text` may not be part of this buffer.
    void Append(QStringView text)
    {
        char16_t* const units = Resize(size_ + text.size());
        Copy(units + (size_ - text.size()), text);
    }
    void Append(QLatin1StringView text)
    {
        char16_t* const units = Resize(size_ + text.size());
        std::copy(text.begin(), text.end(), units + (size_ - text.size()));
    }
    void Assign(QStringView text)
    {
        size_ = 0;
        Append(text);
    }
    void AssignUtf8(std::string_view utf8)
    {
        char16_t* const units = Resize(qsizetype(utf8.size()));
        unsigned char bits = 0;
        for (size_t i = 0; i < utf8.size(); ++i) {
            const auto byte = static_cast<unsigned char>(utf8[i]);
            units[i] = byte;
            bits |= byte;
        }
        if (bits >= 0x80) // not ASCII alone
            Assign(QString::fromUtf8(utf8.data(), qsizetype(utf8.size())));
    }

private:
    // Most texts are short: eight units at a time, then one by one, beat a call.
    static void Copy(char16_t* to, QStringView text)
    {
        const char16_t* from = text.utf16();
        qsizetype left = text.size();
        if (left > 64) {
            std::memcpy(to, from, size_t(left) * sizeof(char16_t));
            return;
        }
        for (; left >= 8; left -= 8, from += 8, to += 8)
            std::memcpy(to, from, 8 * sizeof(char16_t));
        for (; left > 0; --left)
            *to++ = *from++;
    }
    void Grow(qsizetype size)
    {
        const qsizetype room = std::max(size + size / 2, qsizetype(32));
        std::unique_ptr<char16_t[]> grown(new char16_t[size_t(room)]);
        std::copy_n(units_.get(), size_, grown.get());
        units_ = std::move(grown);
        room_ = room;
    }

    std::unique_ptr<char16_t[]> units_;
    qsizetype size_ = 0;
    qsizetype room_ = 0;
};

} // namespace mirel
