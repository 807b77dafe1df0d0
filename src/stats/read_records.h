#pragma once

#include "data/channels.h"
#include "data/competition.h"
#include "data/records.h"
#include "data/session.h"

namespace marlowbeck {

/// Hands every record of the player file in hand to `take`, in file order.
template <typename Take>
void ReadPlayers(Session& session, Channels& channels, Take take) {
  OpenFile(session, channels);
  channels.ForEachRecord(Channel::Players, [&](Bytes bytes, int) { take(PlayerView(bytes)); });
  channels.Close(Channel::Players);
}

/// The same with the results file in hand.
template <typename Take>
void ReadResults(Session& session, Channels& channels, Take take) {
  OpenResultSFile(session, channels);
  channels.ForEachRecord(Channel::Results, [&](Bytes bytes, int) { take(ResultView(bytes)); });
  channels.Close(Channel::Results);
}

}  // namespace marlowbeck
