#include "knockout/draw.h"

#include <utility>

#include "data/table.h"

namespace marlowbeck {
namespace {

constexpr int kLastPlace = 69;
constexpr int kUnusedBits = 64 - 24;  // a number in single precision has 24

/// Draws until somebody comes who has not come yet.
Entrant DrawOne(Table<Entrant>& hat, int count, const std::function<float()>& chance) {
  for (;;) {
    Entrant drawn = std::exchange(hat[DrawnPlace(chance(), count)], {});
    if (!drawn.IsFree()) return drawn;
  }
}

}  // namespace

float Chance::Next() { return static_cast<float>(engine_() >> kUnusedBits) * 0x1p-24F; }

int DrawnPlace(float chance, int count) {
  const float place = static_cast<float>(count) * chance + 1.0F;
  return static_cast<int>(place);
}

std::vector<Entrant> Draw(const std::vector<Entrant>& entrants,
                          const std::function<float()>& chance) {
  const int count = static_cast<int>(entrants.size());
  Table<Entrant> hat(0, kLastPlace);
  for (int i = 1; i <= count; ++i) hat[i] = entrants[static_cast<std::size_t>(i - 1)];
  std::vector<Entrant> drawn;
  for (int i = 1; i <= count; ++i) drawn.push_back(DrawOne(hat, count, chance));
  return drawn;
}

}  // namespace marlowbeck
