#pragma once

#include "resources/string_id.h"

#include <QString>
#include <QStringList>
#include <QStringView>

#include <optional>
#include <span>
#include <string_view>

namespace mirel {

// Which page of the help (Mirel.htm#topic) belongs to a view or a dialog, by the name of its class without its
// namespace.
struct HelpTopic {
    std::u16string_view viewClass;
    std::u16string_view topic;
};
std::span<const HelpTopic> HelpTopics();
QString HelpTopicOfClass(QStringView className); // empty: it has none of its own

// What is said of a single control, known by its dialog and by the text that is its own or its label's.
struct ControlHelp {
    std::u16string_view viewClass;
    Str label;
    Str text;
};
std::span<const ControlHelp> ControlHelps();
// `label` as it is shown, with or without its mnemonic and colon. None: it explains itself.
std::optional<Str> HelpOfControl(QStringView className, const QString& label);

} // namespace mirel
