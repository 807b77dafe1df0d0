#pragma once

#include <functional>

#include "ui/control.h"

namespace marlowbeck {

/// The one place that catches run-time errors. An error gives up the whole event, up to what set
/// it off: something that a person did, or a screen's load, activation or unload; the program then
/// goes on.
class Dispatcher {
 public:
  /// `report` closes all channels and tells the error to the user.
  explicit Dispatcher(std::function<void(int number)> report) : report_(std::move(report)) {}

  /// Runs a whole event. Answers false when an error gave it up.
  bool Run(const Handler& handler);

  /// Runs a handler that an event's own work fires: an error in it gives up that event. Outside of
  /// any event it is one itself.
  void Nested(const Handler& handler);

  [[nodiscard]] bool Idle() const { return depth_ == 0; }

 private:
  std::function<void(int)> report_;
  int depth_ = 0;
};

}  // namespace marlowbeck
