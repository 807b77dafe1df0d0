#include <array>

#include "drive/workbench.h"
#include "support/record_files.h"

namespace marlowbeck {
namespace {

/// A click on cmdDo works with the disk.
class Faults : public WorkbenchTest {
 protected:
  void Work(const std::function<void(FileSystem&)>& work) {
    OnDo([work](Workbench& bench) { work(bench.context.channels.Files()); });
  }
  /// The number of the error that a click on cmdDo ends in; 0 for none.
  int ErrorOfClick() {
    Do("click cmdDo");
    const auto errors = EventsNamed("error");
    return errors.empty() ? 0 : errors[0]["number"].get<int>();
  }
};

void WriteThreeTimes(FileSystem& files) {
  const auto file = files.Open("three", OpenMode::Truncate);
  for (int i = 0; i < 3; ++i) {
    const std::array<std::byte, 4> bytes{};
    file->WriteAt(static_cast<std::uint64_t>(i) * 4, bytes);
  }
  file->Sync();
  file->Close();
}

TEST_F(Faults, ReachEveryKindOfOperation) {
  struct Kind {
    const char* word;
    std::function<void(FileSystem&)> work;
  };
  const std::vector<Kind> kinds = {
      {"open", [](FileSystem& files) { (void)files.Open("new", OpenMode::Truncate); }},
      {"read",
       [](FileSystem& files) {
         std::array<std::byte, 1> byte{};
         files.Open("old", OpenMode::Read)->ReadAt(0, byte);
       }},
      {"write", WriteThreeTimes},
      {"sync", WriteThreeTimes},
      {"close", WriteThreeTimes},
      {"delete", [](FileSystem& files) { files.Delete("old"); }},
      {"rename", [](FileSystem& files) { files.Rename("old", "new"); }},
      {"rename", [](FileSystem& files) { files.Replace("old", "new"); }},
      {"copy", [](FileSystem& files) { files.Copy("old", "new"); }},
      {"mkdir", [](FileSystem& files) { files.MakeFolder("folder"); }},
      {"rmdir",
       [](FileSystem& files) {
         files.MakeFolder("gone");
         files.RemoveFolder("gone");
       }},
  };
  for (const Kind& kind : kinds) {
    WriteFile("old", "o");
    Work(kind.work);
    Do("fault " + std::string(kind.word) + " 1 70");
    EXPECT_EQ(ErrorOfClick(), 70) << kind.word;
    for (const char* name : {"old", "new", "three", "folder", "gone"}) DeleteFile(name);
  }
}

TEST_F(Faults, DoNothingOfWhatFails) {
  WriteFile("old", "o");
  Work([](FileSystem& files) { files.Delete("old"); });
  Do("fault delete 1 75");
  EXPECT_EQ(ErrorOfClick(), 75);
  EXPECT_TRUE(HasFile("old"));
  EXPECT_EQ(ErrorOfClick(), 0);
  EXPECT_FALSE(HasFile("old"));
}

TEST_F(Faults, CountFromTheMomentTheyAreSet) {
  Work(WriteThreeTimes);
  EXPECT_EQ(ErrorOfClick(), 0);
  Do("fault write 2 61");
  EXPECT_EQ(ErrorOfClick(), 61);
  EXPECT_EQ(File("three").size(), 4U);
  EXPECT_EQ(ErrorOfClick(), 0);
  EXPECT_EQ(File("three").size(), 12U);
}

TEST_F(Faults, WithAPlusGoOnUntilTheyAreTakenBack) {
  Work(WriteThreeTimes);
  Do("fault write 2+ 61");
  for (int i = 0; i < 3; ++i) EXPECT_EQ(ErrorOfClick(), 61);
  EXPECT_EQ(File("three").size(), 0U);
  Do("fault off");
  EXPECT_EQ(ErrorOfClick(), 0);
}

TEST_F(Faults, OfAnyKindCountAllOperations) {
  Work(WriteThreeTimes);
  for (int nth = 1; nth <= 6; ++nth) {  // open, three writes, sync, close
    Do("fault any " + std::to_string(nth) + " 57");
    EXPECT_EQ(ErrorOfClick(), 57) << nth;
  }
  Do("fault any 7 57");
  EXPECT_EQ(ErrorOfClick(), 0);
}

TEST_F(Faults, ThatWaitAreTakenBack) {
  Work(WriteThreeTimes);
  DoAll({"fault write 1 61", "fault cut 1 2 61", "fault crash any 1", "fault off"});
  EXPECT_EQ(ErrorOfClick(), 0);
}

TEST_F(Faults, CutAWriteAfterItsFirstBytes) {
  Work(WriteThreeTimes);
  Do("fault cut 3 2 61");
  EXPECT_EQ(ErrorOfClick(), 61);
  EXPECT_EQ(File("three").size(), 10U);
}

TEST_F(Faults, CutACopyToo) {
  WriteFile("old", "0123456789");
  Work([](FileSystem& files) { files.Copy("old", "new"); });
  Do("fault cut 1 3 61");
  EXPECT_EQ(ErrorOfClick(), 61);
  EXPECT_EQ(File("new"), "012");
}

TEST_F(Faults, CountTheOperationsSinceTheStart) {
  const Json before = Do("fault count")["operations"];
  EXPECT_EQ(before, Json::parse(R"({"open": 0, "read": 0, "write": 0, "sync": 0, "close": 0,
                                    "delete": 0, "rename": 0, "copy": 0, "mkdir": 0,
                                    "rmdir": 0})"));
  Work(WriteThreeTimes);
  Do("click cmdDo");
  const Json after = Do("fault count")["operations"];
  EXPECT_EQ(after["open"], 1);
  EXPECT_EQ(after["write"], 3);
  EXPECT_EQ(after["sync"], 1);
  EXPECT_EQ(after["close"], 1);
}

TEST_F(Faults, AreRefusedInWordsThatNameWhatIsWrong) {
  EXPECT_EQ(Refused("fault"), "fault: needs an operation, cut, crash, count or off");
  EXPECT_EQ(Refused("fault format 1 61"), "fault: there is no operation format");
  EXPECT_EQ(Refused("fault write 0 61"), "fault: needs a number for N, not \"0\"");
  EXPECT_EQ(Refused("fault write + 61"), "fault: needs a number for N, not \"\"");
  EXPECT_EQ(Refused("fault write 1"), "fault: needs NUMBER");
  EXPECT_EQ(Refused("fault write 1 full"), "fault: needs a number for NUMBER, not \"full\"");
  EXPECT_EQ(Refused("fault write 1 0"), "fault: NUMBER must be at least 1");
  EXPECT_EQ(Refused("fault cut 1 -1 61"), "fault: BYTES must be at least 0");
  EXPECT_EQ(Refused("fault crash format 1"), "fault: there is no operation format");
  EXPECT_EQ(Refused("fault crash write 1+"), "fault: needs a number for N, not \"1+\"");
  EXPECT_EQ(Refused("fault off now"), "fault: has \"now\" more than it takes");
}

TEST_F(Faults, OfTheProgramThatNoRunTimeErrorTellsAreAnswered) {
  OnDo([](Workbench&) { throw std::runtime_error("a slip"); });
  const Json answer = Try("click cmdDo");
  EXPECT_EQ(answer["ok"], false);
  EXPECT_EQ(answer["error"], "fault in the program: a slip");
  Do("get txtName");
}

}  // namespace
}  // namespace marlowbeck
