#pragma once

#include "drive/json.h"

namespace marlowbeck {

/// What the program does to the outside, in order, until it is told in an answer.
class EventLog {
 public:
  /// Adds an event of one name: {"name": value}.
  void Add(const char* name, Json value);
  /// The end of the program; told once.
  void AddEnd();
  /// Moves all events into an answer, which says so when the end is among them.
  void MoveInto(Json& answer);

 private:
  Json events_ = Json::array();
  bool ended_ = false;
  bool end_is_pending_ = false;
};

}  // namespace marlowbeck
