/// The language of the program's texts. Catalogues are gettext's, one file a language in this
/// folder.
#pragma once

#include <initializer_list>
#include <span>
#include <string>
#include <string_view>

namespace factory_test {

/// Long words with accents, by which one sees what a translation would break. It is not installed.
inline constexpr std::string_view kMadeUpLanguage = "xx";

/// Their codes: "en", "de", "ko", "ar" and the made-up one.
std::span<const std::string_view> languages();

/// Chooses one of languages(). Empty: that of the environment (LC_ALL, LC_MESSAGES, LANG), or
/// English. Call it before tr(), on the main thread, while there is no other.
void chooseLanguage(const std::string& code);

/// Whether the program finds the texts of one of languages(); those of "en" are its own.
bool hasCatalogue(const std::string& code);

/// The text in the chosen language, in UTF-8; English where the catalogue lacks it. It stays valid.
/// Any thread.
const char* tr(const char* english);
/// The text of a number of things, in the form that the language has for so many.
const char* trn(const char* one, const char* many, unsigned long count);

/// An error's line in the chosen language: a text, or a file's name and texts, with ": " between
/// them.
std::string trError(std::string_view error);

/// `format` with words in the places of %1 to %9, in whichever order the language has them.
std::string filled(std::string_view format, std::initializer_list<std::string_view> words);

/// Whether the language is written from right to left, as its catalogue says.
bool isRightToLeft();

/// Marks a text that stands in a table and goes through tr() where it is shown.
constexpr const char* msg(const char* english) { return english; }

}  // namespace factory_test
