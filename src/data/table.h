#pragma once

#include <cstddef>
#include <utility>
#include <vector>

#include "data/runtime_error.h"

namespace marlowbeck {

/// A table with fixed bounds, both included. An index outside them throws SubscriptOutOfRange:
/// the bounds are the system's limits, and running past one is a failure that the user is told.
template <typename T>
class Table {
 public:
  Table() = default;
  Table(int first, int last)
      : first_(first), entries_(last < first ? 0 : static_cast<std::size_t>(last - first) + 1) {}

  [[nodiscard]] T& operator[](int index) { return entries_[Place(index)]; }
  [[nodiscard]] const T& operator[](int index) const { return entries_[Place(index)]; }

  [[nodiscard]] int First() const { return first_; }
  [[nodiscard]] int Last() const { return first_ + static_cast<int>(entries_.size()) - 1; }

  void Swap(int a, int b) { std::swap((*this)[a], (*this)[b]); }

 private:
  [[nodiscard]] std::size_t Place(int index) const {
    if (index < first_ || index > Last()) throw RunTimeError(ErrorNumber::SubscriptOutOfRange);
    return static_cast<std::size_t>(index - first_);
  }

  int first_ = 1;
  std::vector<T> entries_;
};

}  // namespace marlowbeck
