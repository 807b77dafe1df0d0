#include "ui/dispatcher.h"

#include <new>
#include <stdexcept>

#include "data/runtime_error.h"

namespace marlowbeck {
namespace {

/// Counts how deep in events we are, also when one is left by an exception.
class Level {
 public:
  explicit Level(int& depth) : depth_(depth) { ++depth_; }
  Level(const Level&) = delete;
  Level& operator=(const Level&) = delete;
  ~Level() { --depth_; }

 private:
  int& depth_;
};

}  // namespace

bool Dispatcher::Run(const Handler& handler) {
  const Level level(depth_);
  try {
    handler();
    return true;
  } catch (const RunTimeError& error) {
    report_(error.Number());
  } catch (const std::bad_alloc&) {
    report_(static_cast<int>(ErrorNumber::OutOfMemory));
  } catch (const std::logic_error&) {
    report_(static_cast<int>(ErrorNumber::InternalError));  // a fault of our own: the user goes on
  }
  return false;
}

void Dispatcher::Nested(const Handler& handler) {
  if (Idle()) {
    Run(handler);
  } else {
    handler();
  }
}

}  // namespace marlowbeck
