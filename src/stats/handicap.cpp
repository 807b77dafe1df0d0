#include "stats/handicap.h"

namespace marlowbeck {
namespace {

constexpr double kGame = 501;

}  // namespace

Integer HandicapOf(double mean, double average) {
  const double factor = kGame / mean;
  return Integer::Narrow(kGame - factor * average);
}

}  // namespace marlowbeck
