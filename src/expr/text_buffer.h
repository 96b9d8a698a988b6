#pragma once

#include <QString>
#include <QStringView>

#include <algorithm>
#include <cstring>
#include <memory>
#include <utility>

namespace mirel {

// The text that a node computes, made anew on every record: it keeps its room, and everything that happens on
// every record is inline, which is most of what short texts cost.
class TextBuffer {
public:
    QStringView View() const { return {units_.get(), size_}; }
    void Swap(TextBuffer& other)
    {
        std::swap(units_, other.units_);
        std::swap(size_, other.size_);
        std::swap(room_, other.room_);
    }

    // Makes the text so long and lends its units; what they hold is kept up to the shorter of both lengths.
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
