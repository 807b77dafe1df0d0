#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "fuzz/targets.h"

namespace marlowbeck::fuzz {
namespace {

/// Runs every file of a corpus, and every beginning of it, through the function that its fuzz
/// target calls. What must hold is checked there, and ends the process.
void Replay(const std::string& corpus, void (*target)(Input)) {
  const auto folder = std::filesystem::path(MARLOWBECK_SOURCE_DIR) / "fuzz/corpus" / corpus;
  int replayed = 0;
  for (const auto& entry : std::filesystem::directory_iterator(folder)) {
    SCOPED_TRACE(entry.path().string());
    std::ifstream file(entry.path(), std::ios::binary);
    const std::string content{std::istreambuf_iterator<char>(file), {}};
    const auto bytes = std::as_bytes(std::span(content));
    const std::size_t step = content.size() / 64 + 1;
    for (std::size_t length = 0; length < content.size(); length += step) {
      target(bytes.first(length));
    }
    target(bytes);
    ++replayed;
  }
  EXPECT_GT(replayed, 0) << "an empty corpus in " << folder;
}

TEST(FuzzReplay, SideFiles) { Replay("side_file", SideFile); }
TEST(FuzzReplay, PlayersAndResults) { Replay("records", Records); }
TEST(FuzzReplay, TheLadderAndItsRules) { Replay("ladder", Ladder); }
TEST(FuzzReplay, ListsOfAKnockOut) { Replay("knockout", KnockOut); }
TEST(FuzzReplay, TheListsAndTheirSideFiles) { Replay("lists", Lists); }
TEST(FuzzReplay, Words) { Replay("words", Words); }

}  // namespace
}  // namespace marlowbeck::fuzz
