#include "results/find_records.h"

#include "data/competition.h"

namespace marlowbeck {

std::optional<PlayerRecord> FindPlayerByLine(Session& session, Channels& channels,
                                             std::string_view line, std::string_view separator) {
  std::optional<PlayerRecord> found;
  OpenFile(session, channels);
  channels.ForEachRecord(Channel::Players, [&](Bytes bytes, int) {
    const PlayerView player(bytes);
    if (player.FullName(separator) == line && player.Grade() == session.Grade &&
        player.Team() == session.Team) {
      found = DecodePlayer(bytes);
    }
    return !found;
  });
  channels.CloseAll();
  return found;
}

}  // namespace marlowbeck
