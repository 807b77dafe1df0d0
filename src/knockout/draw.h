#pragma once

#include <cstdint>
#include <functional>
#include <random>
#include <vector>

#include "knockout/entrants.h"

namespace marlowbeck {

/// Numbers by chance, uniform from 0 to just below 1, each in single precision.
class Chance {
 public:
  /// Begins another sequence for another seed.
  explicit Chance(std::uint64_t seed) : engine_(seed) {}

  [[nodiscard]] float Next();

 private:
  std::mt19937_64 engine_;
};

/// The place that a number by chance draws out of `count`: from 1 to `count`, and with the very
/// greatest numbers, since it is reckoned in single precision, one above.
[[nodiscard]] int DrawnPlace(float chance, int count);

/// Entrants in an order by chance, every order being as likely as any other. At most 69, all with a
/// name.
[[nodiscard]] std::vector<Entrant> Draw(const std::vector<Entrant>& entrants,
                                        const std::function<float()>& chance);

}  // namespace marlowbeck
