#pragma once

#include <cstdio>
#include <cstdlib>
#include <functional>
#include <vector>

#include "data/runtime_error.h"

namespace marlowbeck::fuzz {

/// Ends the process when what must hold does not.
inline void Must(bool holds, const char* what) {
  if (holds) return;
  std::fprintf(stderr, "does not hold: %s\n", what);
  std::abort();
}

/// Answers whether it went through without a run-time error.
inline bool Try(const std::function<void()>& action) {
  try {
    action();
    return true;
  } catch (const RunTimeError&) {
    return false;
  }
}

/// The whole records of a file's bytes.
inline std::vector<std::vector<std::byte>> RecordsOf(const std::vector<std::byte>& bytes,
                                                     std::size_t length) {
  std::vector<std::vector<std::byte>> records;
  for (std::size_t place = 0; place + length <= bytes.size(); place += length) {
    const auto begin = bytes.begin() + static_cast<std::ptrdiff_t>(place);
    records.emplace_back(begin, begin + static_cast<std::ptrdiff_t>(length));
  }
  return records;
}

}  // namespace marlowbeck::fuzz
