#pragma once

#include <functional>

#include <gtest/gtest.h>

#include "data/runtime_error.h"

namespace marlowbeck {

/// The number of the run-time error that an action raises; 0 for none.
inline int ErrorOf(const std::function<void()>& action) {
  try {
    action();
  } catch (const RunTimeError& error) {
    return error.Number();
  }
  return 0;
}

}  // namespace marlowbeck

/// The statement raises the run-time error of that number.
#define EXPECT_ERROR(number, ...) EXPECT_EQ(::marlowbeck::ErrorOf([&] { __VA_ARGS__; }), number)
