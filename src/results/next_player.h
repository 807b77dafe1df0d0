#pragma once

#include "data/integer.h"
#include "data/records.h"

namespace marlowbeck {

/// What a player added from the score sheets takes over from the records before it. Fed with those
/// of the player file, each once and in order.
class NextPlayer {
 public:
  /// Throws Overflow for an id beyond 16 bits.
  void AddPlayer(Bytes record);

  /// The highest id and one more. Throws Overflow when 16 bits do not hold it.
  [[nodiscard]] Integer ID() const { return highest_ + 1; }
  /// The reserved date of the last record.
  [[nodiscard]] Date Reserved1() const { return reserved1_; }

 private:
  // KEPT: the highest id is held in 16 bits, so that no player can be added from the score sheets
  // behind number 32766; a repair would hold it in 32.
  Integer highest_;
  Date reserved1_;
};

}  // namespace marlowbeck
