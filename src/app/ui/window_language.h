#pragma once

#include <QString>

class QWidget;

namespace mirel {

class Settings;
struct ProgramFolder;

// The language of menus, dialogs and messages: from the command line, else from the settings, else the system's. A
// file in the folder "Languages" of the program folder comes before the program's own. Dates and numbers follow
// the system's locale whatever the language.
void UseLanguage(const QString& fromCommandLine, const ProgramFolder& folder, const Settings& settings);

// Lets the user choose one for the next start.
void ChooseLanguage(const ProgramFolder& folder, Settings& settings, QWidget& window);

} // namespace mirel
