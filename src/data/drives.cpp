#include "data/drives.h"

#include <algorithm>
#include <array>
#include <filesystem>
#include <fstream>
#include <sstream>
#include <string_view>
#include <utility>

#include "data/text.h"

#ifdef _WIN32
extern "C" __declspec(dllimport) unsigned long __stdcall GetLogicalDrives();
#endif

namespace marlowbeck {
namespace {

constexpr const char* kRoot = "/";

bool LiesIn(std::string_view path, std::string_view folder) {
  return path.starts_with(folder) && (path.size() == folder.size() || path[folder.size()] == '/');
}

bool IsTheSystems(std::string_view path) {
  constexpr std::array<std::string_view, 5> kSystemFolders = {"/proc", "/sys", "/dev", "/run",
                                                              "/snap"};
  if (LiesIn(path, "/run/media")) return false;  // where disks that are plugged in may come up
  return std::any_of(kSystemFolders.begin(), kSystemFolders.end(),
                     [&](std::string_view folder) { return LiesIn(path, folder); });
}

/// A blank in the table stands as \040, and other characters that would part its columns likewise.
std::string Plain(std::string_view column) {
  std::string plain;
  for (std::size_t i = 0; i < column.size(); ++i) {
    const bool escaped = column[i] == '\\' && i + 3 < column.size();
    plain += escaped ? static_cast<char>((column[i + 1] - '0') * 64 + (column[i + 2] - '0') * 8 +
                                         (column[i + 3] - '0'))
                     : column[i];
    if (escaped) i += 3;
  }
  return plain;
}

}  // namespace

std::vector<std::string> MountPointsIn(std::istream& mounts) {
  std::vector<std::string> points;
  for (std::string line; std::getline(mounts, line);) {
    std::string device;
    std::string column;
    std::istringstream(line) >> device >> column;
    std::string point = TextOfName(Plain(column));
    if (!point.empty() && point != kRoot && !IsTheSystems(point)) {
      points.push_back(std::move(point));
    }
  }
  std::sort(points.begin(), points.end(), ComesBefore);
  points.erase(std::unique(points.begin(), points.end()), points.end());
  points.insert(points.begin(), kRoot);
  return points;
}

#ifdef _WIN32

std::vector<std::string> DrivesOfMachine() {
  std::vector<std::string> drives;
  for (unsigned long mask = GetLogicalDrives(), letter = 'A'; mask != 0; mask >>= 1, ++letter) {
    if ((mask & 1) != 0) drives.push_back(std::string(1, static_cast<char>(letter)) + ':');
  }
  return drives;
}

#else

std::vector<std::string> DrivesOfMachine() {
  std::ifstream mounts("/proc/self/mounts");
  std::vector<std::string> drives = MountPointsIn(mounts);
  std::erase_if(drives, [](const std::string& point) {
    std::error_code error;
    return !std::filesystem::is_directory(NameOfText(point), error);
  });
  return drives;
}

#endif

}  // namespace marlowbeck
