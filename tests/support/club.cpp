#include "support/club.h"

#include <algorithm>
#include <fstream>
#include <iterator>
#include <random>
#include <utility>

#include "data/real_file_system.h"
#include "support/record_files.h"

namespace marlowbeck {
namespace {

namespace fs = std::filesystem;

constexpr std::string_view kFolderMark = "{folder}";

std::string Replaced(std::string text, std::string_view from, std::string_view to) {
  for (auto at = text.find(from); at != std::string::npos; at = text.find(from, at + to.size())) {
    text.replace(at, from.size(), to);
  }
  return text;
}

std::string BytesOf(const fs::path& path) {
  std::ifstream file(path, std::ios::binary);
  return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
}

void Fault(Here here, const std::string& words) {
  ADD_FAILURE_AT(here.file_name(), static_cast<int>(here.line())) << words;
}

std::vector<std::string> NamesIn(const fs::path& folder) {
  std::vector<std::string> names;
  for (const auto& entry : fs::recursive_directory_iterator(folder)) {
    names.push_back(fs::relative(entry.path(), folder).generic_string());
  }
  std::sort(names.begin(), names.end());
  return names;
}

}  // namespace

TemporaryFolder::TemporaryFolder() {
  std::random_device chance;
  do {
    path_ = fs::temp_directory_path() / ("club-" + std::to_string(chance()));
  } while (!fs::create_directory(path_));
  path_ = fs::canonical(path_);
}

TemporaryFolder::~TemporaryFolder() {
  std::error_code ignored;
  fs::remove_all(path_, ignored);
}

/// A face with its folder and its program.
struct Club::House {
  explicit House(TestFace with) : face(std::move(with)) {}

  /// With this folder's name in the place of the mark.
  [[nodiscard]] std::string Named(std::string_view text) const {
    return Replaced(std::string(text), kFolderMark, TextOfPath(folder.Path()));
  }
  /// With the mark in the place of this folder's name, in any capitals that a box may have.
  [[nodiscard]] std::string Neutral(const std::string& text) const {
    const std::string name = TextOfPath(folder.Path());
    return Replaced(Replaced(text, name, kFolderMark), UpperCase(name), kFolderMark);
  }

  TestFace face;
  TemporaryFolder folder;
  std::unique_ptr<Driver> driver;
};

std::vector<TestFace> ModelFaceAlone() { return {{"models", MakeModelFace}}; }

Club::Club(std::vector<TestFace> faces) {
  for (TestFace& face : faces) houses_.push_back(std::make_unique<House>(std::move(face)));
}

Club::~Club() = default;

void Club::Start() {
  for (const auto& house : houses_) {
    if (house->driver) continue;
    const WorldSettings settings{TextOfPath(house->folder.Path()), today, seed, screen_width};
    house->driver = std::make_unique<Driver>(settings, house->face.make, registration);
  }
}

void Club::Restart() {
  for (const auto& house : houses_) house->driver.reset();
  Start();
}

Json Club::Carry(std::string_view line, Here here) {
  Start();
  Json first;
  std::string first_neutral;
  for (const auto& house : houses_) {
    const auto answer = house->driver->Answer(house->Named(line));
    if (!answer) {
      Fault(here, "\"" + std::string(line) + "\" has no answer");
      return Json::object();
    }
    // The words of a refusal are each face's own.
    Json comparable = *answer;
    comparable.erase("error");
    const std::string neutral = house->Neutral(comparable.dump());
    if (house == houses_.front()) {
      first = *answer;
      first_neutral = neutral;
    } else if (neutral != first_neutral && !std::exchange(parted_, true)) {
      Fault(here, "\"" + std::string(line) + "\" is answered differently:\n" +
                      houses_.front()->face.name + ": " + first_neutral + "\n" + house->face.name +
                      ": " + neutral);
    }
  }
  if (first.contains("events")) {
    events_ = first["events"];
    ExpectEqualSight(line, here);
  }
  return first;
}

Json Club::Try(std::string_view line, Here here) { return Carry(line, here); }

Json Club::Do(std::string_view line, Here here) {
  Json answer = Carry(line, here);
  if (!answer.value("ok", false)) {
    Fault(here, "\"" + std::string(line) + "\" was not done: " + answer.dump());
  }
  return answer;
}

Json Club::DoAll(const std::vector<std::string>& lines, Here here) {
  Json last;
  for (const std::string& line : lines) last = Do(line, here);
  return last;
}

std::string Club::Refused(std::string_view line, Here here) {
  const Json answer = Carry(line, here);
  if (answer.value("ok", true)) {
    Fault(here, "\"" + std::string(line) + "\" was not refused: " + answer.dump());
  }
  return answer.value("error", std::string());
}

/// Compares what can be seen of every loaded screen, control by control.
void Club::ExpectEqualSight(std::string_view line, Here here) {
  if (InModelsAlone() || parted_) return;
  House& first = *houses_.front();
  const Json screens = *first.driver->Answer("screens");
  for (std::size_t i = 1; i < houses_.size(); ++i) {
    House& other = *houses_[i];
    const auto compare = [&](const std::string& what, const Json& a, const Json& b) {
      const std::string mine = first.Neutral(a.dump());
      const std::string its = other.Neutral(b.dump());
      if (mine == its) return;
      parted_ = true;
      Fault(here, "after \"" + std::string(line) + "\" " + what + " differs:\n" + first.face.name +
                      ": " + mine + "\n" + other.face.name + ": " + its);
    };
    compare("screens", screens, *other.driver->Answer("screens"));
    if (!screens.contains("screens")) continue;
    for (const Json& screen : screens["screens"]) {
      const std::string name = screen["name"];
      const Json mine = first.driver->Answer("state " + name)->value("controls", Json::object());
      const Json its = other.driver->Answer("state " + name)->value("controls", Json::object());
      for (const auto& [control, state] : mine.items()) {
        compare(name + "." + control, state, its.value(control, Json()));
      }
    }
  }
}

Json Club::Look(const std::string& line, const char* field, Here here) {
  const Json answer = Do(line, here);
  return answer.value(field, Json());
}

Json Club::Get(const std::string& control, Here here) {
  return Look("get " + control, "control", here);
}

std::string Club::Caption(const std::string& control, Here here) {
  return Get(control, here).value("caption", std::string("(no caption)"));
}

std::string Club::Text(const std::string& control, Here here) {
  return Get(control, here).value("text", std::string("(no text)"));
}

bool Club::Ticked(const std::string& control, Here here) {
  return Get(control, here).at("value").get<bool>();
}

bool Club::Enabled(const std::string& control, Here here) {
  return Get(control, here).at("enabled").get<bool>();
}

bool Club::Shown(const std::string& control, Here here) {
  return Get(control, here).at("shown").get<bool>();
}

int Club::Index(const std::string& control, Here here) {
  return Get(control, here).at("index").get<int>();
}

std::string Club::DateOf(const std::string& control, Here here) {
  return Get(control, here).value("value", std::string("(no date)"));
}

Club::TextList Club::Lines(const std::string& control, Here here) {
  return Get(control, here).value("lines", TextList{"(no lines)"});
}

std::vector<Club::TextList> Club::Cells(const std::string& grid, Here here) {
  return Get(grid, here).value("cells", std::vector<TextList>());
}

Club::TextList Club::Row(const std::string& grid, int row, Here here) {
  const std::vector<TextList> cells = Cells(grid, here);
  const auto place = static_cast<std::size_t>(row);
  return place < cells.size() ? cells[place] : TextList{"(no such row)"};
}

std::string Club::Front(Here here) {
  const Json front = Look("screens", "front", here);
  return front.is_string() ? front.get<std::string>() : std::string();
}

std::string Club::Focus(Here here) {
  const Json focus = Look("screens", "focus", here);
  return focus.is_string() ? focus.get<std::string>() : std::string();
}

std::string Club::Title(const std::string& screen, Here here) {
  for (const Json& entry : Look("screens", "screens", here)) {
    if (entry["name"] == screen) return entry["title"];
  }
  return "(no such screen)";
}

bool Club::Loaded(const std::string& screen, Here here) {
  return Title(screen, here) != "(no such screen)";
}

Json Club::InSession(const std::string& field, Here here) {
  return Look("session", "session", here).value(field, Json());
}

std::vector<Json> Club::EventsNamed(const std::string& name) const {
  std::vector<Json> found;
  for (const Json& event : events_) {
    if (event.contains(name)) found.push_back(event[name]);
  }
  return found;
}

int Club::Count(const std::string& name) const {
  return static_cast<int>(EventsNamed(name).size());
}

std::vector<SeenBox> Club::Boxes() const {
  std::vector<SeenBox> boxes;
  for (const Json& box : EventsNamed("box")) {
    boxes.push_back(
        {box["text"], box["title"], box["style"], box["answer"], box.value("unexpected", false)});
  }
  return boxes;
}

std::vector<std::string> Club::BoxTexts() const {
  std::vector<std::string> texts;
  for (const SeenBox& box : Boxes()) texts.push_back(box.text);
  return texts;
}

fs::path Club::Folder() const { return houses_.front()->folder.Path(); }

fs::path Club::FilePath(const std::string& name) const { return Folder() / name; }

bool Club::HasFile(const std::string& name) const { return fs::exists(FilePath(name)); }

std::string Club::File(const std::string& name, Here here) const {
  if (!HasFile(name)) Fault(here, "there is no file " + name);
  return BytesOf(FilePath(name));
}

void Club::WriteFile(const std::string& name, std::string_view bytes) {
  for (const auto& house : houses_) {
    const fs::path path = house->folder.Path() / name;
    fs::create_directories(path.parent_path());
    std::ofstream file(path, std::ios::binary);
    file << house->Named(bytes);
  }
}

void Club::DeleteFile(const std::string& name) {
  for (const auto& house : houses_) fs::remove_all(house->folder.Path() / name);
}

std::vector<PlayerRecord> Club::Players(const std::string& name) const {
  return PlayersIn(File(name));
}

std::vector<ResultRecord> Club::Results(const std::string& name) const {
  return ResultsIn(File(name));
}

void Club::WritePlayers(const std::string& name, const std::vector<PlayerRecord>& players) {
  WriteFile(name, FileOf(players));
}

void Club::WriteResults(const std::string& name, const std::vector<ResultRecord>& results) {
  WriteFile(name, FileOf(results));
}

void Club::NameOpenFile(const std::string& name) {
  WriteFile("FileName.qz3", "\"{folder}/" + name + "\"\r\n");
}

FaultPlan& Club::Faults() {
  Start();
  return houses_.front()->driver->GetWorld().Faults();
}

Screens& Club::ScreensOf() {
  Start();
  return houses_.front()->driver->GetWorld().GetScreens();
}

void Club::ExpectEqualFolders(Here here) const {
  const House& first = *houses_.front();
  const auto names = NamesIn(first.folder.Path());
  for (const auto& house : houses_) {
    if (NamesIn(house->folder.Path()) != names) {
      Fault(here, "the folders of " + first.face.name + " and " + house->face.name +
                      " hold different files");
      continue;
    }
    for (const std::string& name : names) {
      if (fs::is_directory(first.folder.Path() / name)) continue;
      if (house->Neutral(BytesOf(house->folder.Path() / name)) !=
          first.Neutral(BytesOf(first.folder.Path() / name))) {
        Fault(here, name + " differs between " + first.face.name + " and " + house->face.name);
      }
    }
  }
}

}  // namespace marlowbeck
