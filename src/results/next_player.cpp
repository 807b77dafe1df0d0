#include "results/next_player.h"

namespace marlowbeck {

void NextPlayer::AddPlayer(Bytes record) {
  const PlayerRecord player = DecodePlayer(record);
  if (player.ID > highest_) highest_ = player.ID;
  reserved1_ = player.Reserved1;
}

}  // namespace marlowbeck
