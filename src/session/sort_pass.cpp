#include "session/sort_pass.h"

#include <algorithm>
#include <span>
#include <unordered_set>
#include <vector>

#include "data/gap_sort.h"
#include "data/runtime_error.h"

namespace marlowbeck {
namespace {

/// Small enough to stay in the processor's cache between reading and writing.
constexpr std::size_t kBlockRecords = 1024;

/// The records as they lie on disk, and the date of each.
struct Season {
  std::size_t record_length = 0;
  std::vector<std::byte> records;
  std::vector<double> dates;
};

Season ReadSeason(Channels& channels, std::size_t date_offset,
                  const std::function<void(int)>& moved) {
  const auto count = static_cast<std::size_t>(int{channels.RecordCount(Channel::Results)});
  Season season;
  season.record_length = channels.RecordLength(Channel::Results);
  season.records.reserve(count * season.record_length);
  season.dates.reserve(count);
  channels.ForEachRecord(Channel::Results, [&](Bytes record, int number) {
    season.records.insert(season.records.end(), record.begin(), record.end());
    season.dates.push_back(ReadDate(record, date_offset).days);
    moved(number);
  });
  return season;
}

/// The distinct dates in the order that the gap sort puts them in.
std::vector<double> DistinctDates(const std::vector<double>& dates) {
  const std::unordered_set<double> seen(dates.begin(), dates.end());
  std::vector<double> distinct(seen.begin(), seen.end());
  const auto at = [&](int place) -> double& {
    return distinct[static_cast<std::size_t>(place - 1)];
  };
  GapSort(
      static_cast<int>(distinct.size()), [&](int j, int k) { return !(at(j) > at(k)); },
      [&](int j, int k) { std::swap(at(j), at(k)); });
  return distinct;
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

/// The number from 0 of the record that is to stand at each place.
std::vector<std::size_t> DateOrder(const std::vector<double>& dates) {
  const std::vector<double> distinct = DistinctDates(dates);
  Places places(distinct, dates);
  std::vector<std::size_t> order(dates.size());
  for (std::size_t record = 0; record < dates.size(); ++record) {
    order[places.Take(dates[record])] = record;
  }
  return order;
}

/// Writes the records in that order, a block at a time.
void WriteInOrder(Channels& channels, const Season& season, std::span<const std::size_t> order) {
  const std::size_t length = season.record_length;
  std::vector<std::byte> block;
  block.reserve(std::min(order.size(), kBlockRecords) * length);
  for (std::size_t first = 0; first < order.size(); first += kBlockRecords) {
    block.clear();
    for (const std::size_t record :
         order.subspan(first).first(std::min(kBlockRecords, order.size() - first))) {
      const auto from = season.records.begin() + static_cast<std::ptrdiff_t>(record * length);
      block.insert(block.end(), from, from + static_cast<std::ptrdiff_t>(length));
    }
    channels.PutRun(Channel::Side, static_cast<int>(first) + 1, block);
  }
}

}  // namespace

void SortByDate(Channels& channels, const DatedFile& file, const std::string& work_file,
                const std::function<void(int record)>& moved) {
  channels.OpenRandom(Channel::Results, file.path, file.record_length);
  const Season season = ReadSeason(channels, file.date_offset, moved);
  channels.CloseAll();
  const std::vector<std::size_t> order = DateOrder(season.dates);
  channels.OpenRandom(Channel::Side, work_file, file.record_length);
  WriteInOrder(channels, season, order);
  channels.CloseAll();
  channels.Files().Replace(work_file, file.path);
}

void SortResults(Channels& channels, const std::string& results_file, const std::string& work_file,
                 const std::function<void(int record)>& moved) {
  constexpr Field kGameDate = FieldNamed(kResultFields, "GameDate");
  SortByDate(channels, {results_file, kResultLength, kGameDate.offset}, work_file, moved);
}

}  // namespace marlowbeck
