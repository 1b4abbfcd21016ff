#pragma once

#include <QLocale>

class QTranslator;

namespace zandor::designer {

/// Loads the designer's texts in the first of a locale's languages that it speaks. False when it
/// speaks none of them: its texts stay English then.
bool loadCatalogue(QTranslator& translator, const QLocale& locale);

/// Lets the program speak the language of a locale from now on, Qt's own buttons and dialogs
/// included. Call it before the first window is made, and not more than once.
void speak(const QLocale& locale = QLocale::system());

} // namespace zandor::designer
