#include "text_pattern.h"

#include <utility>
#include <vector>

namespace brimol::test {

pc::TextPattern patternOf(const std::string& text) {
  std::vector<std::string> pieces(1);
  for (auto at = text.begin(); at != text.end(); ++at) {
    const bool isEscape = *at == '\\' && at + 1 != text.end() && at[1] == '*';
    if (isEscape) {
      pieces.back() += *++at;
    } else if (*at == '*') {
      pieces.emplace_back();
    } else {
      pieces.back() += *at;
    }
  }
  return pc::TextPattern(std::move(pieces));
}

}  // namespace brimol::test
