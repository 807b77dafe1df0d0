#include "session/sort_pass.h"

#include <algorithm>
#include <vector>

#include "data/gap_sort.h"
#include "data/runtime_error.h"

namespace marlowbeck {
namespace {

/// The results as they lie on disk, and the date of each.
struct Season {
  std::vector<std::byte> records;
  std::vector<double> dates;
};

Season ReadSeason(Channels& channels, const std::function<void(int)>& moved) {
  const auto count = static_cast<std::size_t>(int{channels.RecordCount(Channel::Results)});
  Season season;
  season.records.reserve(count * kResultLength);
  season.dates.reserve(count);
  channels.ForEachRecord(Channel::Results, [&](Bytes record, int number) {
    season.records.insert(season.records.end(), record.begin(), record.end());
    season.dates.push_back(ResultView(record).GameDate().days);
    moved(number);
  });
  return season;
}

/// The distinct dates in the order that the gap sort puts them in.
std::vector<double> DistinctDates(std::vector<double> dates) {
  const auto at = [&](int place) -> double& { return dates[static_cast<std::size_t>(place - 1)]; };
  GapSort(
      static_cast<int>(dates.size()), [&](int j, int k) { return !(at(j) > at(k)); },
      [&](int j, int k) { std::swap(at(j), at(k)); });
  dates.erase(std::unique(dates.begin(), dates.end()), dates.end());
  return dates;
}

/// Where each record's run of equal dates is to begin, then where its next record goes.
class Places {
 public:
  Places(const std::vector<double>& distinct, const std::vector<double>& dates)
      : distinct_(distinct), next_(distinct.size() + 1) {
    for (const double date : dates) ++next_[Run(date) + 1];
    for (std::size_t run = 1; run < next_.size(); ++run) next_[run] += next_[run - 1];
  }

  [[nodiscard]] std::size_t Take(double date) { return next_[Run(date)]++; }

 private:
  /// A record whose date is no number belongs to no run, and one would be lost with it.
  [[nodiscard]] std::size_t Run(double date) const {
    const auto run = std::lower_bound(distinct_.begin(), distinct_.end(), date);
    if (run == distinct_.end() || *run != date) {
      throw RunTimeError(ErrorNumber::InvalidProcedureCall);
    }
    return static_cast<std::size_t>(run - distinct_.begin());
  }

  const std::vector<double>& distinct_;
  std::vector<std::size_t> next_;
};

std::vector<std::byte> InDateOrder(const Season& season) {
  const std::vector<double> distinct = DistinctDates(season.dates);
  Places places(distinct, season.dates);
  std::vector<std::byte> sorted(season.records.size());
  for (std::size_t record = 0; record < season.dates.size(); ++record) {
    const auto from = season.records.begin() + static_cast<std::ptrdiff_t>(record * kResultLength);
    const std::size_t place = places.Take(season.dates[record]);
    std::copy_n(from, kResultLength,
                sorted.begin() + static_cast<std::ptrdiff_t>(place * kResultLength));
  }
  return sorted;
}

}  // namespace

void SortResults(Channels& channels, const std::string& results_file, const std::string& work_file,
                 const std::function<void(int record)>& moved) {
  channels.OpenRandom(Channel::Results, results_file, kResultLength);
  const Season season = ReadSeason(channels, moved);
  channels.CloseAll();
  const std::vector<std::byte> sorted = InDateOrder(season);
  channels.OpenRandom(Channel::Side, work_file, kResultLength);
  channels.PutRun(Channel::Side, 1, sorted);
  channels.CloseAll();
  channels.Files().Replace(work_file, results_file);
}

}  // namespace marlowbeck
