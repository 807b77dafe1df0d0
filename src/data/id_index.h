#pragma once

#include <cstddef>
#include <cstdint>
#include <vector>

namespace marlowbeck {

/// Finds the place of an id among those that were added, counted from 0 in the order of adding. It
/// is asked once for every record of a file, of which most are of ids that it does not have.
class IdIndex {
 public:
  static constexpr int kNone = -1;

  [[nodiscard]] int Count() const { return count_; }

  /// The place of an id, kNone where it was not added.
  [[nodiscard]] int Find(std::int32_t id) const {
    for (std::size_t slot = FirstSlot(id); slots_[slot].place != kNone; slot = Next(slot)) {
      if (slots_[slot].id == id) return slots_[slot].place;
    }
    return kNone;
  }

  /// Adds an id, unless it is there, and answers its place.
  int Add(std::int32_t id) {
    const int place = Find(id);
    if (place != kNone) return place;
    if (static_cast<std::size_t>(count_ + 1) * 2 > slots_.size()) Grow();
    Put({id, count_});
    return count_++;
  }

 private:
  struct Slot {
    std::int32_t id = 0;
    int place = kNone;
  };

  /// The upper half of a product with a large odd number, which ids in a row spread over evenly.
  [[nodiscard]] std::size_t FirstSlot(std::int32_t id) const {
    const std::uint64_t spread = static_cast<std::uint32_t>(id) * std::uint64_t{0x9E3779B97F4A7C15};
    return static_cast<std::size_t>(spread >> 32) & (slots_.size() - 1);
  }
  [[nodiscard]] std::size_t Next(std::size_t slot) const {
    return (slot + 1) & (slots_.size() - 1);
  }

  void Put(Slot entry) {
    std::size_t slot = FirstSlot(entry.id);
    while (slots_[slot].place != kNone) slot = Next(slot);
    slots_[slot] = entry;
  }

  void Grow() {
    std::vector<Slot> old(slots_.size() * 2);
    old.swap(slots_);
    for (const Slot& entry : old) {
      if (entry.place != kNone) Put(entry);
    }
  }

  std::vector<Slot> slots_ = std::vector<Slot>(64);  // always a power of two
  int count_ = 0;
};

}  // namespace marlowbeck
