#include "data/gap_sort_by_value.h"

#include <algorithm>
#include <numeric>

namespace marlowbeck {
namespace {

using Numbers = std::vector<int>;

int& At(Numbers& numbers, int index) { return numbers[static_cast<std::size_t>(index)]; }

/// How many different values there are below each.
Numbers RanksOf(const std::vector<double>& values) {
  std::vector<double> steps = values;
  std::sort(steps.begin(), steps.end());
  steps.erase(std::unique(steps.begin(), steps.end()), steps.end());
  Numbers ranks;
  ranks.reserve(values.size());
  for (const double value : values) {
    ranks.push_back(
        static_cast<int>(std::lower_bound(steps.begin(), steps.end(), value) - steps.begin()));
  }
  return ranks;
}

/// The rounds of the pass over ranks from 0 on.
class Rounds {
 public:
  explicit Rounds(Numbers ranks)
      : ranks_(std::move(ranks)),
        count_(static_cast<int>(ranks_.size())),
        order_(ranks_.size()),
        by_rank_(ranks_.size()),
        chain_(ranks_.size()) {
    std::iota(order_.begin(), order_.end(), 0);
    below_.resize(ranks_.empty() ? 1
                                 : static_cast<std::size_t>(*std::ranges::max_element(ranks_)) + 2);
    for (const int rank : ranks_) ++At(below_, rank + 1);
    std::partial_sum(below_.begin(), below_.end(), below_.begin());
  }

  /// A round puts the entries of each chain, that is every gap-th of all, in order one by one: an
  /// entry goes down past all that are not below it. So the chain ends up ascending, and equal
  /// entries turned round.
  void Run(int gap) {
    SortPlacesByRank();
    FillChains(gap);
    Numbers next(static_cast<std::size_t>(gap));
    std::iota(next.begin(), next.end(), 0);
    Numbers sorted(order_.size());
    for (const int place : by_rank_) {
      int& to = At(next, At(chain_, place));
      At(sorted, to) = At(order_, place);
      to += gap;
    }
    order_ = std::move(sorted);
  }

  [[nodiscard]] Numbers Order() && { return std::move(order_); }

 private:
  /// Ascending, the places of one rank from the last to the first.
  void SortPlacesByRank() {
    Numbers next = below_;
    for (int place = count_ - 1; place >= 0; --place) {
      At(by_rank_, At(next, At(ranks_, At(order_, place)))++) = place;
    }
  }

  void FillChains(int gap) {
    int chain = 0;
    for (int& of_place : chain_) {
      of_place = chain;
      chain = chain + 1 == gap ? 0 : chain + 1;
    }
  }

  Numbers ranks_;
  int count_;
  Numbers order_;    ///< the entry at each place
  Numbers by_rank_;  ///< places
  Numbers chain_;    ///< of each place
  Numbers below_;    ///< entries of lower ranks, by rank
};

}  // namespace

std::vector<int> GapSortByValue(const std::vector<double>& values) {
  Rounds rounds(RanksOf(values));
  for (int gap = static_cast<int>(values.size()) / 2; gap >= 1; gap /= 2) rounds.Run(gap);
  return std::move(rounds).Order();
}

}  // namespace marlowbeck
