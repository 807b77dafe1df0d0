#include "results/result_removal.h"

#include <vector>

namespace marlowbeck {

void CopyResultsWithout(Channels& channels, int number, const std::string& work_file) {
  std::vector<std::byte> others;
  others.reserve(static_cast<std::size_t>(int{channels.RecordCount(Channel::Results)}) *
                 kResultLength);
  channels.ForEachRecord(Channel::Results, [&](Bytes record, int at) {
    if (at != number) others.insert(others.end(), record.begin(), record.end());
  });
  channels.OpenRandom(Channel::Side, work_file, kResultLength);
  channels.PutRun(Channel::Side, 1, others);
  channels.CloseAll();
}

}  // namespace marlowbeck
