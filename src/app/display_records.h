#pragma once

#include <QString>

#include <array>
#include <optional>

namespace mirel {

// Five colours of a view, each 0x00BBGGRR: the line of the current database, the lists, two that are not in
// use, the buttons.
struct ColorRecord {
    static constexpr size_t kDatabaseLine = 0;
    static constexpr size_t kLists = 1;
    static constexpr size_t kButtons = 4;

    std::array<quint32, 5> colors{};

    friend bool operator==(const ColorRecord&, const ColorRecord&) = default;
};

// A font as the user chose it. Flags are 0 or 1.
struct FontDesc {
    QString faceName = QStringLiteral("Tahoma"); // at most 31 characters
    int italic = 0;
    int bold = 0;
    int strikeout = 0;
    int underline = 0;
    int size = 9;      // points
    quint32 color = 0; // of the text, 0x00BBGGRR; travels in the colour record, not in the font's

    friend bool operator==(const FontDesc&, const FontDesc&) = default;
};

// Their forms in the profile: "(0),(255),(0),(0),(12632256)" and "(0,1,0,0,9,"Tahoma")". Empty when a text does
// not read as such.
QString ColorRecordText(const ColorRecord& record);
std::optional<ColorRecord> ReadColorRecord(const QString& text);
QString FontRecordText(const FontDesc& font);
std::optional<FontDesc> ReadFontRecord(const QString& text);

} // namespace mirel
