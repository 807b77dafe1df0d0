#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <memory>
#include <span>
#include <string>
#include <type_traits>
#include <vector>

#include "data/file_system.h"
#include "data/integer.h"
#include "data/records.h"
#include "data/side_file.h"

namespace marlowbeck {

/// The channels and what is opened on them, on every screen the same.
enum class Channel {
  Players = 1,
  Results = 2,
  Ladder = 2,
  Side = 3,
  LadderConfig = 4,
  GameNames = 5
};

/// What becomes of a text file when its channel is closed.
enum class Keeping {
  Lasting,  ///< takes the old file's place whole, once it has reached the disk
  Working,  ///< written anew where it lies: a hand-over that is computed afresh at each use
};

/// The numbered channels, 1 to 5, over the file system. Every file is opened on one, worked with,
/// and closed within one event. All procedures throw RunTimeError on failure.
class Channels {
 public:
  explicit Channels(FileSystem& files) : files_(files) {}

  [[nodiscard]] FileSystem& Files() { return files_; }

  /// Opens a file of records of one length, making it, empty, when it is missing.
  void OpenRandom(Channel channel, const std::string& path, std::size_t record_length);
  /// Opens a text file to read its items.
  void OpenInput(Channel channel, const std::string& path);
  /// Opens a text file to be written from its beginning. Nothing is on disk until it is closed.
  void OpenOutput(Channel channel, const std::string& path, Keeping keeping);

  /// The path that a file of records was opened by, and the length of its records.
  [[nodiscard]] std::string Path(Channel channel) { return Random(channel).path; }
  [[nodiscard]] std::size_t RecordLength(Channel channel) { return Random(channel).record_length; }
  /// Whole records in the file. Throws Overflow above 32767.
  [[nodiscard]] Integer RecordCount(Channel channel);
  /// Fills `into`, one record long, from record `number`, the first being 1.
  void Get(Channel channel, int number, std::span<std::byte> into);
  /// Writes one record. One that stood there is put back when the writing fails half-way.
  void Put(Channel channel, int number, std::span<const std::byte> record);
  /// Writes a run of records, from record `first` on, in one go.
  void PutRun(Channel channel, int first, std::span<const std::byte> records);

  /// Calls `visit(Bytes record, int number)` for every record in order, reading in large blocks.
  /// A visit that answers false ends the walk.
  template <typename Visit>
  void ForEachRecord(Channel channel, Visit visit);

  /// All bytes of a file, on no channel.
  [[nodiscard]] std::string ReadWhole(const std::string& path);
  /// Puts these bytes in the place of a file: it holds its old ones until the new ones have reached
  /// the disk. For changes to several records that must not be seen half done.
  void ReplaceWhole(const std::string& path, const std::string& content);

  /// Deletes a work file that is of no more use; that it cannot be is of no matter.
  void DeleteQuietly(const std::string& path);

  [[nodiscard]] SideFileReader& Reader(Channel channel);
  [[nodiscard]] SideFileWriter& Writer(Channel channel);

  /// Closes a channel, open or not. What was written has reached the disk when this returns.
  void Close(Channel channel);
  void CloseAll();
  /// Closes all without finishing anything: texts not yet on disk are dropped, failures passed
  /// over. The way out after an error.
  void AbandonAll();

 private:
  struct Open {
    std::unique_ptr<File> file;
    std::size_t record_length = 0;
    bool written = false;
    std::unique_ptr<SideFileReader> reader;
    std::unique_ptr<SideFileWriter> writer;
    std::string path;
    Keeping keeping = Keeping::Working;
  };

  static constexpr std::size_t kBlockBytes = std::size_t{256} * 1024;

  [[nodiscard]] Open& Slot(Channel channel) {
    return slots_[static_cast<std::size_t>(channel) - 1];
  }
  [[nodiscard]] Open& Random(Channel channel);
  [[nodiscard]] static std::uint64_t Position(const Open& open, int number);
  void WriteOut(const Open& open);
  static void ReadRun(Open& open, int first, std::span<std::byte> into);

  FileSystem& files_;
  std::array<Open, 5> slots_;
};

template <typename Visit>
void Channels::ForEachRecord(Channel channel, Visit visit) {
  Open& open = Random(channel);
  const std::size_t length = open.record_length;
  const int total = RecordCount(channel);
  const int per_block = static_cast<int>(kBlockBytes / length);
  std::vector<std::byte> block(static_cast<std::size_t>(std::min(per_block, total)) * length);
  for (int first = 1; first <= total; first += per_block) {
    const int count = std::min(per_block, total - first + 1);
    ReadRun(open, first, std::span(block).first(static_cast<std::size_t>(count) * length));
    for (int i = 0; i < count; ++i) {
      const Bytes record(block.data() + static_cast<std::size_t>(i) * length, length);
      if constexpr (std::is_same_v<decltype(visit(record, first + i)), bool>) {
        if (!visit(record, first + i)) return;
      } else {
        visit(record, first + i);
      }
    }
  }
}

}  // namespace marlowbeck
