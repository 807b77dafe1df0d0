#include "drive/event_log.h"

#include <utility>

namespace marlowbeck {

void EventLog::Add(const char* name, Json value) {
  events_.push_back(Json::object({{name, std::move(value)}}));
}

void EventLog::AddEnd() {
  if (std::exchange(ended_, true)) return;
  end_is_pending_ = true;
  Add("ended", true);
}

void EventLog::MoveInto(Json& answer) {
  answer["events"] = std::exchange(events_, Json::array());
  if (std::exchange(end_is_pending_, false)) answer["ended"] = true;
}

}  // namespace marlowbeck
