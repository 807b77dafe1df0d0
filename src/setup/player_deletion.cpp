#include "setup/player_deletion.h"

#include "data/record_rewriting.h"
#include "data/text.h"

namespace marlowbeck {

int CountResultsOf(Channels& channels, int id) {
  int count = 0;
  channels.ForEachRecord(Channel::Results, [&](Bytes record, int) {
    if (ResultView(record).ID() == id) ++count;
  });
  return count;
}

bool HasResults(Channels& channels, int id) {
  bool found = false;
  channels.ForEachRecord(Channel::Results, [&](Bytes record, int) {
    found = ResultView(record).ID() == id;
    return !found;
  });
  return found;
}

void RemoveResultsOf(Channels& channels, int id) {
  RemoveRecords(channels, Channel::Results,
                [id](Bytes record, int) { return ResultView(record).ID() == id; });
}

void RemovePlayer(Channels& channels, int id) {
  RemoveRecords(channels, Channel::Players,
                [id](Bytes record, int) { return PlayerView(record).ID() == id; });
}

std::string DeletionQuestion(std::string_view name, int results) {
  const std::string found = results == 0
                                ? "   (No results were found for this player)    "
                                : "   (This includes results found for " + std::to_string(results) +
                                      (results == 1 ? " game.)    " : " games.)    ");
  return Lines({"You are about to permanently erase the following player from your file.    ", "",
                Trimmed(name), found, "", "Do you wish to proceed ?    "});
}

}  // namespace marlowbeck
