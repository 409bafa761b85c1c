#include "language/language.h"

#include <libintl.h>

#include <algorithm>
#include <array>
#include <clocale>
#include <cstdlib>
#include <filesystem>
#include <string_view>
#include <system_error>

namespace factory_test {

namespace {

constexpr const char* kDomain = "factory_test";
constexpr auto kLanguages =
    std::to_array<std::string_view>({"en", "de", "ko", "ar", kMadeUpLanguage});

bool isKnown(std::string_view code) { return std::ranges::count(kLanguages, code) > 0; }

// Of "de_AT.UTF-8" the language, if there is a catalogue for it.
std::string environmentsLanguage() {
  for (const char* const name : {"LC_ALL", "LC_MESSAGES", "LANG"}) {
    const char* const value = std::getenv(name);
    if (value == nullptr || *value == '\0') continue;
    const std::string_view locale = value;
    const std::string_view code = locale.substr(0, locale.find_first_of("_.@"));
    return isKnown(code) ? std::string(code) : "en";
  }
  return "en";
}

// Beside the program where it was built, and where it is installed.
std::filesystem::path catalogues() {
  std::error_code failed;
  const auto folder = std::filesystem::read_symlink("/proc/self/exe", failed).parent_path();
  const auto built = folder / "locale";
  return std::filesystem::exists(built, failed) ? built : folder.parent_path() / "share" / "locale";
}

}  // namespace

std::span<const std::string_view> languages() { return kLanguages; }

void chooseLanguage(const std::string& code) {
  // Catalogues are read under any locale but "C", and this one is always there. LANGUAGE says
  // whose, and is read again when the locale changes.
  std::setlocale(LC_MESSAGES, "C");
  std::setlocale(LC_MESSAGES, "C.UTF-8");
  setenv("LANGUAGE", (code.empty() ? environmentsLanguage() : code).c_str(), 1);
  bindtextdomain(kDomain, catalogues().c_str());
  bind_textdomain_codeset(kDomain, "UTF-8");
}

bool hasCatalogue(const std::string& code) {
  std::error_code failed;
  const auto file = catalogues() / code / "LC_MESSAGES" / (std::string(kDomain) + ".mo");
  return code == "en" || std::filesystem::exists(file, failed);
}

// The empty text is that of a catalogue's head.
const char* tr(const char* english) {
  return *english == '\0' ? english : dgettext(kDomain, english);
}

std::string filled(std::string_view format, std::initializer_list<std::string_view> words) {
  std::string text;
  for (std::size_t i = 0; i < format.size(); ++i) {
    const bool isPlace = format[i] == '%' && i + 1 < format.size();
    const auto number = isPlace ? static_cast<std::size_t>(format[i + 1] - '1') : words.size();
    if (number < words.size()) {
      text += std::data(words)[number];
      ++i;
    } else {
      text += format[i];
    }
  }
  return text;
}

// The catalogues of languages that are written so translate the word.
bool isRightToLeft() { return std::string_view(tr("left-to-right")) == "right-to-left"; }

std::string trError(std::string_view error) {
  constexpr std::string_view kBetween = ": ";
  const auto end = [&] { return std::min(error.find(kBetween), error.size()); };
  if (end() == error.size()) return tr(std::string(error).c_str());
  std::string shown(error.substr(0, end()));
  error.remove_prefix(end());
  while (!error.empty()) {
    error.remove_prefix(kBetween.size());
    shown.append(kBetween).append(tr(std::string(error.substr(0, end())).c_str()));
    error.remove_prefix(end());
  }
  return shown;
}

const char* trn(const char* one, const char* many, unsigned long count) {
  return dngettext(kDomain, one, many, count);
}

}  // namespace factory_test
