#include "stats/quoted_texts.h"

#include <algorithm>
#include <string_view>

namespace marlowbeck {

std::vector<std::string> ReadTextsSideBySide(SideFileReader& reader, std::size_t count) {
  constexpr std::string_view kBetween = "\",\"";
  std::string whole = reader.TextToLastQuote();
  std::vector<std::string> texts;
  while (texts.size() + 1 < count) {
    const auto between = whole.rfind(kBetween);
    if (between == std::string::npos) throw RunTimeError(ErrorNumber::TypeMismatch);
    texts.push_back(whole.substr(between + kBetween.size()));
    whole.resize(between);
  }
  texts.push_back(std::move(whole));
  std::reverse(texts.begin(), texts.end());
  return texts;
}

}  // namespace marlowbeck
