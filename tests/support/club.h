#pragma once

#include <filesystem>
#include <functional>
#include <memory>
#include <source_location>
#include <string>
#include <string_view>
#include <vector>

#include <gtest/gtest.h>

#include "data/records.h"
#include "drive/driver.h"

namespace marlowbeck {

/// A message box as the script saw it.
struct SeenBox {
  std::string text;  ///< UTF-8, lines parted by "\r"
  std::string title;
  int style = 0;
  int answer = 0;
  bool unexpected = false;
};

/// A folder of a test, gone with it.
class TemporaryFolder {
 public:
  TemporaryFolder();
  TemporaryFolder(const TemporaryFolder&) = delete;
  TemporaryFolder& operator=(const TemporaryFolder&) = delete;
  ~TemporaryFolder();
  [[nodiscard]] const std::filesystem::path& Path() const { return path_; }

 private:
  std::filesystem::path path_;
};

/// One face that tests are run in.
struct TestFace {
  std::string name;
  FaceMaker make;
};

/// The faces of this executable; the first gives the answers that a test looks at. Answered by the
/// one source that differs between the executables.
[[nodiscard]] std::vector<TestFace> FacesUnderTest();
[[nodiscard]] std::vector<TestFace> ModelFaceAlone();

using Here = std::source_location;

/// A club's evening: the program in a folder of its own, worked by a script's lines.
///
/// Files may be laid before the first command, which starts the program. Where several faces are
/// tested every command goes to all of them, each in a folder of its own with the same content;
/// their answers, and after each command that acts all that can be seen of every screen, must be
/// equal. In a command {folder} stands for the working folder.
class Club {
 public:
  explicit Club(std::vector<TestFace> faces = FacesUnderTest());
  ~Club();

  // How the program is started; to be set before the first command.
  Date today = *DateFromIso("2004-03-31");
  std::uint64_t seed = 1;
  int screen_width = 15360;
  Program::Registration registration = RegisterScreens;

  /// Starts the program, unless it runs.
  void Start();
  /// Starts it anew in the same folder, as after a power cut.
  void Restart();
  [[nodiscard]] bool InModelsAlone() const { return houses_.size() == 1; }

  /// Carries out a line of a script and answers its JSON. The test fails when it is refused.
  Json Do(std::string_view line, Here here = Here::current());
  /// Carries out line after line; answers the JSON of the last.
  Json DoAll(const std::vector<std::string>& lines, Here here = Here::current());
  /// Expects a line to be refused and answers the words why.
  std::string Refused(std::string_view line, Here here = Here::current());
  /// Carries out a line, however it goes.
  Json Try(std::string_view line, Here here = Here::current());

  // What can be seen. A control is named as in a command.
  [[nodiscard]] Json Get(const std::string& control, Here here = Here::current());
  [[nodiscard]] std::string Caption(const std::string& control, Here here = Here::current());
  [[nodiscard]] std::string Text(const std::string& control, Here here = Here::current());
  [[nodiscard]] bool Ticked(const std::string& control, Here here = Here::current());
  [[nodiscard]] bool Enabled(const std::string& control, Here here = Here::current());
  [[nodiscard]] bool Shown(const std::string& control, Here here = Here::current());
  [[nodiscard]] int Index(const std::string& control, Here here = Here::current());
  [[nodiscard]] std::string DateOf(const std::string& control, Here here = Here::current());
  using TextList = std::vector<std::string>;
  [[nodiscard]] TextList Lines(const std::string& control, Here here = Here::current());
  /// The texts of one row of a grid, or of all.
  [[nodiscard]] TextList Row(const std::string& grid, int row, Here here = Here::current());
  [[nodiscard]] std::vector<TextList> Cells(const std::string& grid, Here here = Here::current());
  [[nodiscard]] std::string Front(Here here = Here::current());
  [[nodiscard]] std::string Focus(Here here = Here::current());  ///< "frmResults.txtAgg"
  [[nodiscard]] std::string Title(const std::string& screen, Here here = Here::current());
  [[nodiscard]] bool Loaded(const std::string& screen, Here here = Here::current());
  /// A field of the session record.
  [[nodiscard]] Json InSession(const std::string& field, Here here = Here::current());

  // What the last command that acted, or `events`, told.
  [[nodiscard]] const Json& Events() const { return events_; }
  [[nodiscard]] std::vector<SeenBox> Boxes() const;
  [[nodiscard]] std::vector<std::string> BoxTexts() const;
  /// The values of the events of one name, in order.
  [[nodiscard]] std::vector<Json> EventsNamed(const std::string& name) const;
  [[nodiscard]] int Count(const std::string& name) const;

  // Files of the working folder; what is written goes into the folder of every face.
  [[nodiscard]] std::filesystem::path Folder() const;
  [[nodiscard]] std::filesystem::path FilePath(const std::string& name) const;
  [[nodiscard]] bool HasFile(const std::string& name) const;
  [[nodiscard]] std::string File(const std::string& name, Here here = Here::current()) const;
  /// {folder} in the bytes stands for the working folder.
  void WriteFile(const std::string& name, std::string_view bytes);
  void DeleteFile(const std::string& name);
  [[nodiscard]] std::vector<PlayerRecord> Players(const std::string& name) const;
  [[nodiscard]] std::vector<ResultRecord> Results(const std::string& name) const;
  void WritePlayers(const std::string& name, const std::vector<PlayerRecord>& players);
  void WriteResults(const std::string& name, const std::vector<ResultRecord>& results);
  /// Names a player file of the working folder as the one that is open at the start.
  void NameOpenFile(const std::string& name);

  /// The disk's faults, of the face that answers.
  [[nodiscard]] FaultPlan& Faults();
  /// The screens of the face that answers, for what no answer tells of them.
  [[nodiscard]] Screens& ScreensOf();

  /// Expects the folders of all faces to hold the same files with the same bytes.
  void ExpectEqualFolders(Here here = Here::current()) const;

 private:
  struct House;

  Json Carry(std::string_view line, Here here);
  void ExpectEqualSight(std::string_view line, Here here);
  [[nodiscard]] Json Look(const std::string& line, const char* field, Here here);

  std::vector<std::unique_ptr<House>> houses_;
  Json events_ = Json::array();
  bool parted_ = false;  ///< the faces have been seen to differ: what follows from it is not told
};

/// A test of screens, run in every face of the executable.
class ClubTest : public ::testing::Test, protected Club {
 protected:
  void TearDown() override { ExpectEqualFolders(); }
};

/// Skips a test where more than models are tested, and says why it can hold for them alone.
#define HOLDS_FOR_MODELS_ALONE(why) \
  if (!InModelsAlone()) GTEST_SKIP() << (why)

}  // namespace marlowbeck
