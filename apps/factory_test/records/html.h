/// Pages that need nothing but a browser.
#pragma once

#include <initializer_list>
#include <string>
#include <string_view>

namespace factory_test {

/// A whole page in the look that all of the program's pages have: light, dark, and for printers. It
/// loads nothing, and nothing in it runs. `body` is HTML.
std::string htmlPage(std::string_view title, std::string_view body);

/// The text of an element or an attribute.
std::string htmlText(std::string_view text);

/// A row of a table's body or head; the cells are HTML.
std::string htmlRow(std::initializer_list<std::string> cells);
std::string htmlHead(std::initializer_list<const char*> names);

/// "PASS", "FAIL" or "none" in its colour.
std::string htmlVerdict(std::string_view word);

}  // namespace factory_test
