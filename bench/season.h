#pragma once

#include <cstdint>
#include <filesystem>
#include <string>

#include "data/session.h"

namespace marlowbeck::bench {

/// How the results of a season lie in their file.
enum class Entry {
  NightByNight,  ///< in date order, as the sort pass leaves them
  Shuffled,      ///< a record of every date in turn, all of them out of order
};

inline constexpr int kPlayers = 999;
inline constexpr int kResults = 32767;
inline constexpr int kMatches = 32767;
inline constexpr int kDates = 40;  ///< weekly, from 7 January 2004
inline constexpr int kTeams = 50;  ///< "Team 01" to "Team 50", player n in team (n - 1) % 50 + 1
inline constexpr const char* kGrade = "A Grade";

/// A competition at the limits of the system, in a temporary folder that goes with it: 999 players
/// of one grade with ids from 1 on, 32767 results on 40 dates, one in a hundred of them a forfeit,
/// 32767 matches on the same dates.
class Season {
 public:
  explicit Season(Entry entry = Entry::NightByNight);
  Season(const Season&) = delete;
  Season& operator=(const Season&) = delete;
  ~Season();

  [[nodiscard]] std::string Folder() const { return folder_.string(); }
  [[nodiscard]] std::string PlayerFile() const { return (folder_ / "Limits.qza").string(); }
  [[nodiscard]] std::string ResultsFile() const {
    return (folder_ / "Limits_A Grade.qzr").string();
  }
  [[nodiscard]] std::string LadderFile() const { return (folder_ / "Limits_A Grade.qzl").string(); }

  /// A session with the competition open and its grade in hand.
  [[nodiscard]] Session OpenSession() const;
  /// `night` from 0 to 39.
  [[nodiscard]] static Date GameDate(int night);

 private:
  std::filesystem::path folder_;
};

/// The plain read that others are measured against: a file from its beginning to its end in blocks
/// of 64 KiB, every byte of it looked at. Answers their sum.
[[nodiscard]] std::uint64_t PlainRead(const std::string& path);

/// A plain copy: the same blocks written to another file, which then reaches the disk.
void PlainCopy(const std::string& from, const std::string& to);

}  // namespace marlowbeck::bench
