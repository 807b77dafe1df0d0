#include <sys/wait.h>
#include <unistd.h>

#include <array>
#include <cstdlib>
#include <fstream>
#include <iterator>
#include <sstream>

#include "support/club.h"

namespace marlowbeck {
namespace {

namespace fs = std::filesystem;

/// How a run of the driver as a process went.
struct DriveRun {
  int status = 0;  ///< as a shell tells it: 128 and more for a signal
  std::vector<Json> answers;
  std::string errors;
};

std::string ContentOf(const fs::path& path) {
  std::ifstream file(path, std::ios::binary);
  return {std::istreambuf_iterator<char>(file), std::istreambuf_iterator<char>()};
}

class DriveProcess : public ::testing::Test {
 protected:
  /// Runs the driver with arguments as a shell takes them, from the scratch folder.
  DriveRun Drive(const std::string& arguments, const std::string& script) {
    std::ofstream(scratch.Path() / "in", std::ios::binary) << script;
    const std::string at = scratch.Path().string();
    const std::string command =
        "cd " + at + " && \"" + MARLOWBECK_DRIVE + "\" " + arguments + " < in > out 2> err";
    const int status = std::system(command.c_str());
    DriveRun run;
    run.status = WIFSIGNALED(status) ? 128 + WTERMSIG(status) : WEXITSTATUS(status);
    std::istringstream out(ContentOf(scratch.Path() / "out"));
    for (std::string line; std::getline(out, line);) run.answers.push_back(Json::parse(line));
    run.errors = ContentOf(scratch.Path() / "err");
    return run;
  }
  [[nodiscard]] std::string Folder() const { return (scratch.Path() / "club").string(); }

  TemporaryFolder scratch;
};

TEST_F(DriveProcess, AnswersEachLineOfTheScriptAndEndsWithZero) {
  const DriveRun run = Drive(Folder(), "# a comment\n\nscreens\r\nnonsense\nevents");
  EXPECT_EQ(run.status, 0);
  ASSERT_EQ(run.answers.size(), 3U);
  EXPECT_EQ(run.answers[0]["front"], "frmDB");
  EXPECT_EQ(run.answers[1]["ok"], false);
  EXPECT_EQ(run.answers[2]["ok"], true);
  EXPECT_EQ(run.errors, "");
}

TEST_F(DriveProcess, MakesTheWorkingFolderWithAllAboveIt) {
  const DriveRun run = Drive(Folder() + "/a/b", "");
  EXPECT_EQ(run.status, 0);
  EXPECT_TRUE(fs::is_directory(Folder() + "/a/b"));
  EXPECT_TRUE(fs::exists(Folder() + "/a/b/GameName.qz3"));
}

TEST_F(DriveProcess, TakesAFolderFromWhereItIsStarted) {
  const DriveRun run = Drive("club/", "");
  EXPECT_EQ(run.status, 0);
  EXPECT_TRUE(fs::exists(Folder() + "/GameName.qz3"));
}

TEST_F(DriveProcess, EndsWithTwoWhenTheArgumentsMakeNoSense) {
  std::ofstream(Folder()) << "a file";
  const std::vector<std::string> senseless = {
      "",
      "--today 2004-02-30 x",
      "--today today x",
      "--seed x x",
      "--seed -1 x",
      "--screen-width wide x",
      "--screen-width 0 x",
      "--mouse x",
      "x y",
      Folder(),
      Folder() + "/below",
      "'" + scratch.Path().string() + "/\xD0\x9A\xD0\xBB\xD1\x83\xD0\xB1'",
  };
  for (const std::string& arguments : senseless) {
    const DriveRun run = Drive(arguments, "screens\n");
    EXPECT_EQ(run.status, 2) << arguments;
    EXPECT_NE(run.errors, "") << arguments;
    EXPECT_TRUE(run.answers.empty()) << arguments;
  }
}

TEST_F(DriveProcess, EndsTheProgramOnANarrowScreen) {
  const DriveRun run =
      Drive("--screen-width 10999 " + Folder(), "events\nclick imgExit\nscreens\n");
  EXPECT_EQ(run.status, 0);
  ASSERT_EQ(run.answers.size(), 3U);
  EXPECT_EQ(run.answers[0]["ended"], true);
  EXPECT_EQ(run.answers[0]["events"].back(), Json::object({{"ended", true}}));
  EXPECT_EQ(run.answers[1]["ok"], false);
  EXPECT_EQ(run.answers[2]["ok"], true);
}

TEST_F(DriveProcess, IsKilledInThePlaceOfTheOperationThatIsToCrash) {
  const DriveRun run =
      Drive(Folder(), "events\nfault crash any 1\nfile x.qza\nclick mnuNew\nscreens\n");
  EXPECT_EQ(run.status, 128 + SIGKILL);
  EXPECT_EQ(run.answers.size(), 3U);
}

TEST_F(DriveProcess, RunsNoClosingStepsAtTheEndOfTheScript) {
  // A step that touched a file would kill it.
  const DriveRun run = Drive(Folder(), "click imgExit\nfault crash any 1\n");
  EXPECT_EQ(run.answers.at(1)["ok"], true);
  EXPECT_EQ(run.status, 0);
}

#ifdef MARLOWBECK_WINDOWS

TEST_F(DriveProcess, WorksRealWindowsWithoutADisplay) {
  unsetenv("QT_QPA_PLATFORM");
  const DriveRun run =
      Drive("--window " + Folder(), "screens\nshot the menu.png 900 700\nclick imgExit\nscreens\n");
  EXPECT_EQ(run.status, 0) << run.errors;
  ASSERT_EQ(run.answers.size(), 4U);
  EXPECT_EQ(run.answers[0]["front"], "frmDB");
  EXPECT_EQ(run.answers[1]["size"], Json::parse("[900, 700]"));
  EXPECT_TRUE(fs::exists(scratch.Path() / "the menu.png"));
  EXPECT_EQ(run.answers[3]["front"], "frmBuend");
}

#else

TEST_F(DriveProcess, SaysSoWhereItWasBuiltWithoutWindows) {
  const DriveRun run = Drive("--window " + Folder(), "screens\n");
  EXPECT_EQ(run.status, 2);
  EXPECT_NE(run.errors.find("without windows"), std::string::npos);
}

#endif

/// A driver that runs while the test talks to it.
class TalkingDriver {
 public:
  explicit TalkingDriver(const std::string& folder) {
    EXPECT_EQ(pipe(to_.data()), 0);
    EXPECT_EQ(pipe(from_.data()), 0);
    process_ = fork();
    if (process_ != 0) return;
    dup2(to_[0], STDIN_FILENO);
    dup2(from_[1], STDOUT_FILENO);
    for (const int end : {to_[0], to_[1], from_[0], from_[1]}) close(end);
    execl(MARLOWBECK_DRIVE, MARLOWBECK_DRIVE, folder.c_str(), nullptr);
    _exit(127);
  }
  TalkingDriver(const TalkingDriver&) = delete;
  TalkingDriver& operator=(const TalkingDriver&) = delete;
  ~TalkingDriver() {
    for (const int end : {to_[0], to_[1], from_[0], from_[1]}) close(end);
    int status = 0;
    waitpid(process_, &status, 0);
    EXPECT_EQ(status, 0);
  }

  std::string Ask(const std::string& line) {
    EXPECT_EQ(write(to_[1], line.data(), line.size()), static_cast<ssize_t>(line.size()));
    std::string answer;
    char letter = 0;
    while (read(from_[0], &letter, 1) == 1 && letter != '\n') answer += letter;
    return answer;
  }

 private:
  std::array<int, 2> to_{};
  std::array<int, 2> from_{};
  pid_t process_ = 0;
};

TEST_F(DriveProcess, FlushesEachAnswerBeforeTheNextLine) {
  TalkingDriver driver(Folder());
  EXPECT_EQ(Json::parse(driver.Ask("screens\n"))["front"], "frmDB");
  EXPECT_EQ(Json::parse(driver.Ask("events\n"))["ok"], true);
}

}  // namespace
}  // namespace marlowbeck
