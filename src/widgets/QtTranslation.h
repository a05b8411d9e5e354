#pragma once

class QTranslator;

namespace pelmar {

// Loads Qt's own texts in Hebrew (the buttons of message boxes, the file dialogs) from Qt's
// translations (Debian's qt6-translations-l10n) into the translator and installs it; false when
// they are not installed, and the texts then stay in English. The translator must outlive its use.
bool installQtHebrew(QTranslator& translator);

}  // namespace pelmar
