#pragma once

#include "app/settings.h"

#include <optional>

namespace mirel {

// What of a view is drawn in a colour of its own. The numbers are the slots of the colour records.
enum class ColorPart : size_t { Line = 0, Lists = 1, Buttons = 4 };
enum class ColorKind { Background, Text };

enum class DisplayView { Main, Table };

// The font and the colours of one view as the user chose them; what was never chosen is the desktop's, so that a
// dark desktop stays dark. Each call goes to the settings, which must outlive this.
//
// Of a record of five colours some may be chosen and some not: a slot that is not holds a number which is no
// colour.
class DisplayChoice {
public:
    DisplayChoice(Settings& settings, DisplayView view)
        : settings_(settings)
        , view_(view)
    {
    }

    // The colour in the description goes its own way: it is the lists' text colour.
    FontDesc Font() const;
    bool HasFont() const; // the description that nobody chose stands for the desktop's own font
    bool SetFont(const FontDesc& font);

    std::optional<quint32> Color(ColorPart part, ColorKind kind) const; // 0x00BBGGRR; none: the desktop's
    bool SetColor(ColorPart part, ColorKind kind, std::optional<quint32> color);

    bool Reset(); // to the desktop's

private:
    Setting SettingOf(ColorKind kind) const;
    Setting FontSetting() const;

    Settings& settings_;
    DisplayView view_;
};

} // namespace mirel
