#include "ui/disk_lists.h"

#include <algorithm>
#include <utility>

#include "data/runtime_error.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

constexpr const char* kFolderAbove = "..";

bool IsSeparator(char letter) { return letter == '/' || letter == '\\'; }

bool LiesOn(std::string_view path, std::string_view drive) {
  if (path.size() < drive.size() || !EqualsIgnoringCase(path.substr(0, drive.size()), drive)) {
    return false;
  }
  return path.size() == drive.size() || IsSeparator(drive.back()) ||
         IsSeparator(path[drive.size()]);
}

/// Both in one case. Behind a star that fits too little it begins again, one character on.
bool Fits(std::string_view name, std::string_view pattern) {
  std::size_t at = 0;
  std::size_t wanted = 0;
  std::size_t star = std::string_view::npos;
  std::size_t taken = 0;  // how far the star reaches
  while (at < name.size()) {
    if (wanted < pattern.size() && pattern[wanted] == '*') {
      star = wanted++;
      taken = at;
    } else if (wanted < pattern.size() && (pattern[wanted] == '?' || pattern[wanted] == name[at])) {
      ++wanted;
      ++at;
    } else if (star != std::string_view::npos) {
      wanted = star + 1;
      at = ++taken;
    } else {
      return false;
    }
  }
  return pattern.find_first_not_of('*', wanted) == std::string_view::npos;
}

}  // namespace

void DiskList::SetLines(const std::vector<std::string>& lines) {
  Clear();
  for (const std::string& line : lines) AddLine(line);
}

int DriveList::LineOf(std::string_view path) const {
  int innermost = -1;
  for (int line = 0; line < Count(); ++line) {
    if (!LiesOn(path, Line(line))) continue;
    if (innermost < 0 || Line(line).size() > Line(innermost).size()) innermost = line;
  }
  return innermost;
}

void DriveList::SetDrive(std::string_view path) {
  const int line = LineOf(path);
  if (line < 0) throw RunTimeError(ErrorNumber::DeviceUnavailable);
  SetIndex(line);
}

void DriveList::ShowDriveOf(std::string_view path) {
  SetIndexSilently(LineOf(path));
  drive_ = Index() < 0 ? std::string() : Line(Index());
}

void DriveList::Refresh() {
  SetLines(Files().Drives());
  SetIndexSilently(Find(drive_));
  if (Index() < 0) drive_.clear();
}

void DriveList::TakeNew() {
  for (const std::string& drive : Files().Drives()) {
    if (Find(drive) < 0) AddLine(drive);
  }
}

void DriveList::IndexAssigned() {
  DiskList::IndexAssigned();
  const std::string drive = Index() < 0 ? std::string() : Line(Index());
  const bool is_another = drive != std::exchange(drive_, drive);
  if (is_another && Index() >= 0) Fire(Change);
}

void PathList::SetPath(const std::string& folder) {
  const std::string path = Files().WholePath(folder);
  const auto lines = LinesFor(path, Files().List(path));
  const bool is_another = path != path_;
  path_ = path;
  SetLines(lines);
  if (is_another) PathChanged();
}

void PathList::Refresh() {
  if (!path_.empty()) SetPath(path_);
}

void FolderList::Open(int line) { SetPath(PathIn(Path(), Line(line))); }

std::vector<std::string> FolderList::LinesFor(const std::string& folder,
                                              const std::vector<FolderEntry>& entries) const {
  std::vector<std::string> lines;
  if (Files().WholePath(PathIn(folder, kFolderAbove)) != folder) lines.emplace_back(kFolderAbove);
  for (const FolderEntry& entry : entries) {
    if (entry.is_folder) lines.push_back(entry.name);
  }
  return lines;
}

void FileList::SetPattern(std::string_view pattern) {
  std::string before = std::exchange(pattern_, pattern);
  try {
    Refresh();
  } catch (const RunTimeError&) {
    pattern_ = std::move(before);
    throw;
  }
}

void FileList::Include(const std::string& name) {
  std::vector<std::string> lines = Lines();
  const auto place = std::lower_bound(lines.begin(), lines.end(), name, ComesBefore);
  const bool is_listed = place != lines.end() && *place == name;
  if (!is_listed && MatchesPattern(name, pattern_)) lines.insert(place, name);
  SetLines(lines);
}

std::vector<std::string> FileList::LinesFor(const std::string& /*folder*/,
                                            const std::vector<FolderEntry>& entries) const {
  std::vector<std::string> lines;
  for (const FolderEntry& entry : entries) {
    if (!entry.is_folder && MatchesPattern(entry.name, pattern_)) lines.push_back(entry.name);
  }
  return lines;
}

bool MatchesPattern(std::string_view name, std::string_view patterns) {
  const std::string folded = UpperCase(name);
  while (!patterns.empty()) {
    const auto end = patterns.find(';');
    const std::string pattern = UpperCase(Trimmed(patterns.substr(0, end)));
    if (pattern == "*.*" || Fits(folded, pattern)) return true;
    patterns = end == std::string_view::npos ? std::string_view() : patterns.substr(end + 1);
  }
  return false;
}

}  // namespace marlowbeck
