#include "data/record_rewriting.h"

#include <vector>

#include "data/runtime_error.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

std::string WorkFileBeside(const std::string& path) {
  return WithoutLast(path, FileNameOf(path).size()) + "TEMP.RES";
}

std::vector<std::byte> RecordsThatStay(Channels& channels, Channel channel, const Doomed& doomed) {
  std::vector<std::byte> staying;
  staying.reserve(static_cast<std::size_t>(int{channels.RecordCount(channel)}) *
                  channels.RecordLength(channel));
  channels.ForEachRecord(channel, [&](Bytes record, int number) {
    if (!doomed(record, number)) staying.insert(staying.end(), record.begin(), record.end());
  });
  return staying;
}

/// A copy that is cut short goes again: it would leave its records behind those of the next one.
void WriteCopy(Channels& channels, const std::string& work_file, std::size_t record_length,
               std::span<const std::byte> records) {
  try {
    channels.OpenRandom(Channel::Side, work_file, record_length);
    channels.PutRun(Channel::Side, 1, records);
    channels.CloseAll();
  } catch (const RunTimeError&) {
    channels.AbandonAll();
    channels.DeleteQuietly(work_file);
    throw;
  }
}

bool ChangeWholeRecords(std::span<std::byte> bytes, std::size_t record_length,
                        const Change& change) {
  bool any = false;
  for (; bytes.size() >= record_length; bytes = bytes.subspan(record_length)) {
    any = change(bytes.first(record_length)) || any;
  }
  return any;
}

}  // namespace

void ChangeRecords(Channels& channels, Channel channel, const Change& change) {
  const std::string path = channels.Path(channel);
  const std::size_t record_length = channels.RecordLength(channel);
  channels.CloseAll();
  std::string content = channels.ReadWhole(path);
  const auto bytes = std::as_writable_bytes(std::span(content));
  if (ChangeWholeRecords(bytes, record_length, change)) channels.ReplaceWhole(path, content);
}

void CopyRecordsWithout(Channels& channels, Channel channel, const Doomed& doomed,
                        const std::string& work_file) {
  const std::size_t record_length = channels.RecordLength(channel);
  const std::vector<std::byte> staying = RecordsThatStay(channels, channel, doomed);
  channels.CloseAll();
  WriteCopy(channels, work_file, record_length, staying);
}

void RemoveRecords(Channels& channels, Channel channel, const Doomed& doomed) {
  const std::string path = channels.Path(channel);
  const std::string work_file = WorkFileBeside(path);
  CopyRecordsWithout(channels, channel, doomed, work_file);
  channels.Files().Replace(work_file, path);
}

}  // namespace marlowbeck
