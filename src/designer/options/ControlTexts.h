#pragma once

#include <QString>

#include <span>

/// The texts that the control shows, for its LNG properties. English is what the control has of its
/// own, but spelt right and with letters to choose the menu's entries by; the other languages are
/// translations of it.
namespace zandor::designer::controlTexts {

struct Text {
    const char* property;
    const char* english;
    const char* use; ///< where the control shows it, in English; translated by useOf()
};

std::span<const Text> all();
/// Where the text of a property is shown, in the designer's language; the property's own name when
/// it is not one of all().
QString useOf(const QString& property);

/// In the designer's language.
QString own(const Text& text);

/// A language that the designer can speak.
struct Language {
    const char* code;     ///< "de"
    const char16_t* name; ///< in the language itself
};

std::span<const Language> languages();
/// A text in any of them, whatever the designer speaks.
QString inLanguage(const Text& text, const char* code);

} // namespace zandor::designer::controlTexts
