#pragma once

#include <thread>

namespace marlowbeck {

/// Reads the list of the machine's fonts on a thread of its own while the toolkit starts: a good
/// part of the time to the first window where fontconfig keeps that list. Elsewhere does nothing.
class FontsAhead {
 public:
  FontsAhead();
  /// Returns when the list is read: before the first text is measured, or it would be read twice.
  void Wait();

 private:
  std::jthread reader_;
};

}  // namespace marlowbeck
