#include "season/name_search.h"

#include <random>

#include <gtest/gtest.h>

#include "support/record_files.h"

namespace marlowbeck {
namespace {

using Row = std::vector<std::string>;

std::vector<Row> Found(const std::vector<PlayerRecord>& players, std::string_view text) {
  NameSearch search(text);
  for (const PlayerRecord& player : players) search.Add(Encode(player));
  std::vector<Row> rows;
  for (int place = 0; place < search.Count(); ++place) {
    const auto row = search.Row(place);
    rows.emplace_back(row.begin(), row.end());
  }
  return rows;
}

std::string Padded(std::string text, std::size_t width) {
  text.resize(width, ' ');
  return text;
}

/// Small letters become capitals; the names here have no others.
char Capital(char letter) {
  return letter >= 'a' && letter <= 'z' ? static_cast<char>(letter - 'a' + 'A') : letter;
}

/// Whether the text stands in the surname, place by place and letter by letter.
bool Stands(const std::string& text, const std::string& surname) {
  for (std::size_t start = 0; start + text.size() <= surname.size(); ++start) {
    std::size_t same = 0;
    while (same < text.size() && Capital(surname[start + same]) == text[same]) ++same;
    if (same == text.size()) return true;
  }
  return false;
}

TEST(NameSearch, EqualsThePlainLoopsForAnyFile) {
  std::mt19937 chance(20040331);
  const auto word = [&](std::string_view letters, std::size_t most) {
    std::string text;
    const auto length = std::uniform_int_distribution<std::size_t>(1, most)(chance);
    std::uniform_int_distribution<std::size_t> letter(0, letters.size() - 1);
    while (text.size() < length) text += letters[letter(chance)];
    return text;
  };
  for (int round = 0; round < 500; ++round) {
    std::vector<PlayerRecord> players;
    for (int id = 1; id <= 30; ++id) {
      players.push_back(Player(id, word("aAbBcC-'", 6), word("ab", 3), word("xy", 2), "A Grade"));
    }
    const std::string text = word("ABC-'", 3);
    std::vector<Row> expected;
    for (const PlayerRecord& player : players) {
      if (!Stands(text, player.Surname)) continue;
      expected.push_back({Padded(player.Surname, 30), Padded(player.FirstName, 30),
                          Padded(player.Team, 30), Padded(player.Grade, 20)});
    }
    EXPECT_EQ(Found(players, text), expected) << "round " << round << ", " << text;
  }
}

TEST(NameSearch, ABlankInTheMiddleOfASurnameIsSearchedToo) {
  EXPECT_EQ(Found({Player(1, "Van Dam", "Al", "Hawks", "A Grade")}, "N D").size(), 1U);
}

}  // namespace
}  // namespace marlowbeck
