#pragma once

#include <QString>

#include <algorithm>
#include <array>
#include <string>
#include <string_view>

namespace mirel {

// The two ways in which the records of a store hold text. Both keep every unit that a file gave them, also
// those behind the text's end, so that a store is written back as it was read.

// A text in a field of N UTF-16 units: at most N - 1 of them are text, the first NUL ends it.
template <size_t N>
class FixedText {
public:
    using Units = std::array<char16_t, N>;

    FixedText() = default;
    explicit FixedText(const Units& units)
        : units_(units)
    {
    }

    QString Text() const
    {
        const auto end = std::find(units_.begin(), units_.end() - 1, u'\0');
        return QStringView(units_.data(), end - units_.begin()).toString();
    }
    // Cuts silently what does not fit, and never through the middle of a character.
    void Set(QStringView text, qsizetype maxUnits = qsizetype(N) - 1)
    {
        text = text.first(std::min({text.size(), maxUnits, qsizetype(N) - 1}));
        if (!text.isEmpty() && text.back().isHighSurrogate())
            text.chop(1);
        units_.fill(u'\0');
        std::copy(text.utf16(), text.utf16() + text.size(), units_.begin());
    }
    bool IsEmpty() const { return units_[0] == u'\0'; }
    const Units& AllUnits() const { return units_; }

    friend bool operator==(const FixedText&, const FixedText&) = default;
    friend bool operator==(const FixedText& a, QStringView b) { return a.Text() == b; }

private:
    Units units_{};
};

// A text of any length that follows its record, or none; the empty text is not the same as none.
class VariableText {
public:
    VariableText() = default;
    // All units of the field, the closing NUL among them; empty: no text.
    explicit VariableText(std::u16string units)
        : units_(std::move(units))
    {
    }

    bool IsSet() const { return !units_.empty(); }
    QString Text() const // up to the first NUL; empty also when there is none
    {
        return QStringView(units_).first(qsizetype(std::min(units_.find(u'\0'), units_.size()))).toString();
    }
    void Set(QStringView text)
    {
        const qsizetype end = text.indexOf(u'\0');
        units_.assign(text.utf16(), size_t(end < 0 ? text.size() : end));
        units_ += u'\0';
    }
    void Clear() { units_.clear(); }
    const std::u16string& AllUnits() const { return units_; }

    friend bool operator==(const VariableText&, const VariableText&) = default;

private:
    std::u16string units_;
};

} // namespace mirel
