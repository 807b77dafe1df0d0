#include "season/name_search.h"

#include <algorithm>

#include "data/text.h"

namespace marlowbeck {
namespace {

constexpr std::size_t kFirstText = 1;  // the fields of a row stand in a line behind the id
static_assert(kPlayerFields.at(kFirstText).name == "Surname");

}  // namespace

void NameSearch::Add(Bytes player) {
  if (UpperCase(PlayerView(player).Surname()).find(text_) == std::string::npos) return;
  std::copy(player.begin(), player.end(), found_.emplace_back().begin());
}

std::array<std::string_view, 4> NameSearch::Row(int place) const {
  std::array<std::string_view, 4> row;
  const Bytes player = found_.at(static_cast<std::size_t>(place));
  auto field = kPlayerFields.begin() + kFirstText;
  for (std::string_view& cell : row) {
    cell = ReadText(player, field->offset, field->width);
    ++field;
  }
  return row;
}

}  // namespace marlowbeck
