#include "data/channels.h"

#include <array>
#include <string>
#include <vector>

#include <gtest/gtest.h>

#include "data/fault_file_system.h"
#include "data/real_file_system.h"
#include "tests/data/expect_error.h"
#include "tests/data/killed.h"
#include "tests/data/temporary_folder.h"

namespace marlowbeck {
namespace {

constexpr std::size_t kLength = 4;

class ChannelsTest : public testing::Test {
 protected:
  ChannelsTest() {
    real.ChangeFolder(folder.Path());
    files.Plan().kill = [] { throw Killed{}; };
  }

  static Bytes Record(const std::string& text) { return std::as_bytes(std::span(text)); }
  std::string Get(int number) {
    std::string text(kLength, '?');
    channels.Get(Channel::Results, number, std::as_writable_bytes(std::span(text)));
    return text;
  }
  void OpenRecords(const std::string& content) {
    folder.Write("r", content);
    channels.OpenRandom(Channel::Results, "r", kLength);
  }
  void WriteText(Keeping keeping) {
    channels.OpenOutput(Channel::Side, "side.qz3", keeping);
    channels.Writer(Channel::Side).Text("new").EndLine();
    channels.CloseAll();
  }

  TemporaryFolder folder;
  RealFileSystem real;
  FaultFileSystem files{real};
  Channels channels{files};
};

TEST_F(ChannelsTest, OpeningRecordsMakesAMissingFileEmpty) {
  channels.OpenRandom(Channel::Results, "r", kLength);
  EXPECT_EQ(channels.RecordCount(Channel::Results), 0);
  EXPECT_EQ(folder.Read("r"), "");
}

TEST_F(ChannelsTest, APartialLastRecordIsNotCounted) {
  OpenRecords("aaaabbbbcc");
  EXPECT_EQ(channels.RecordCount(Channel::Results), 2);
  EXPECT_EQ(Get(2), "bbbb");
  EXPECT_ERROR(62, Get(3));
  EXPECT_ERROR(63, Get(0));
  EXPECT_ERROR(63, Get(-1));
}

TEST_F(ChannelsTest, MoreThan32767RecordsOverflow) {
  OpenRecords(std::string(kLength * 32767 + 3, 'x'));
  EXPECT_EQ(channels.RecordCount(Channel::Results), 32767);
  OpenRecords(std::string(kLength * 32768, 'x'));
  EXPECT_ERROR(6, (void)channels.RecordCount(Channel::Results));
  EXPECT_ERROR(6, channels.ForEachRecord(Channel::Results, [](Bytes, int) {}));
}

TEST_F(ChannelsTest, PutsRecordsInPlaceAndAtTheEnd) {
  OpenRecords("aaaabbbb");
  channels.Put(Channel::Results, 1, Record("AAAA"));
  channels.Put(Channel::Results, 3, Record("CCCC"));
  channels.CloseAll();
  EXPECT_EQ(folder.Read("r"), "AAAAbbbbCCCC");
}

TEST_F(ChannelsTest, ARecordAppendedTakesThePlaceOfAPartialOne) {
  OpenRecords("aaaabb");
  channels.Put(Channel::Results, channels.RecordCount(Channel::Results) + 1, Record("CCCC"));
  EXPECT_EQ(folder.Read("r"), "aaaaCCCC");
}

TEST_F(ChannelsTest, ARecordOfAnotherLengthIsRefused) {
  OpenRecords("aaaa");
  EXPECT_ERROR(59, channels.Put(Channel::Results, 1, Record("AAA")));
  EXPECT_ERROR(59, channels.PutRun(Channel::Results, 1, Record("AAAAB")));
  std::array<std::byte, 3> small{};
  EXPECT_ERROR(59, channels.Get(Channel::Results, 1, small));
  EXPECT_EQ(folder.Read("r"), "aaaa");
}

TEST_F(ChannelsTest, ACutWriteOfARecordPutsTheOldOneBack) {
  for (std::size_t bytes = 0; bytes <= kLength; ++bytes) {
    OpenRecords("aaaabbbbcccc");
    files.Plan().CutAt(1, bytes, 61);
    EXPECT_ERROR(61, channels.Put(Channel::Results, 2, Record("NNNN")));
    channels.AbandonAll();
    EXPECT_EQ(folder.Read("r"), "aaaabbbbcccc") << bytes;
  }
}

TEST_F(ChannelsTest, ACutAppendLeavesThePartialRecordUncounted) {
  OpenRecords("aaaa");
  files.Plan().CutAt(1, 3, 61);
  EXPECT_ERROR(61, channels.Put(Channel::Results, 2, Record("NNNN")));
  channels.AbandonAll();
  channels.OpenRandom(Channel::Results, "r", kLength);
  EXPECT_EQ(channels.RecordCount(Channel::Results), 1);
  EXPECT_EQ(Get(1), "aaaa");
}

TEST_F(ChannelsTest, TheFirstFailureIsToldWhenPuttingBackFailsToo) {
  OpenRecords("aaaa");
  files.Plan().FailAt(FileOperation::Write, 1, 61, false);
  files.Plan().FailAt(FileOperation::Write, 2, 57, true);
  EXPECT_ERROR(61, channels.Put(Channel::Results, 1, Record("NNNN")));
}

TEST_F(ChannelsTest, WhatWasWrittenIsSyncedOnClosingAndWhatWasReadIsNot) {
  OpenRecords("aaaa");
  (void)Get(1);
  channels.CloseAll();
  EXPECT_EQ(files.Plan().Done(FileOperation::Sync), 0);
  OpenRecords("aaaa");
  channels.Put(Channel::Results, 1, Record("NNNN"));
  channels.CloseAll();
  EXPECT_EQ(files.Plan().Done(FileOperation::Sync), 1);
}

TEST_F(ChannelsTest, WalksAllRecordsInOrderAcrossBlocks) {
  constexpr int kCount = 20000;  // of 32 bytes: more than two blocks
  std::string content;
  for (int number = 1; number <= kCount; ++number) {
    std::string record = std::to_string(number);
    record.resize(32, ' ');
    content += record;
  }
  folder.Write("r", content + "partial");
  channels.OpenRandom(Channel::Results, "r", 32);
  int expected = 0;
  channels.ForEachRecord(Channel::Results, [&](Bytes record, int number) {
    ASSERT_EQ(number, ++expected);
    std::string text(reinterpret_cast<const char*>(record.data()), record.size());
    ASSERT_EQ(std::stoi(text), number);
  });
  EXPECT_EQ(expected, kCount);
  EXPECT_LE(files.Plan().Done(FileOperation::Read), 3) << "read in large blocks";
}

TEST_F(ChannelsTest, AWalkEndsWhenTheVisitSaysSo) {
  OpenRecords("aaaabbbbcccc");
  int seen = 0;
  channels.ForEachRecord(Channel::Results, [&](Bytes, int number) {
    seen = number;
    return number < 2;
  });
  EXPECT_EQ(seen, 2);
}

TEST_F(ChannelsTest, AClosedChannelIsABadFile) {
  EXPECT_ERROR(52, (void)channels.RecordCount(Channel::Players));
  EXPECT_ERROR(52, Get(1));
  EXPECT_ERROR(52, channels.Put(Channel::Results, 1, Record("aaaa")));
  EXPECT_ERROR(52, (void)channels.Reader(Channel::Side));
  EXPECT_ERROR(52, (void)channels.Writer(Channel::Side));
  channels.Close(Channel::Side);
  channels.CloseAll();
}

TEST_F(ChannelsTest, ReadsATextAndLeavesTheChannelOpenUntilItIsClosed) {
  folder.Write("side.qz3", "\"one\",2\r\n");
  channels.OpenInput(Channel::Side, "SIDE.QZ3");
  EXPECT_EQ(channels.Reader(Channel::Side).Text(), "one");
  EXPECT_EQ(channels.Reader(Channel::Side).Number(), 2);
  channels.Close(Channel::Side);
  EXPECT_ERROR(52, (void)channels.Reader(Channel::Side));
  EXPECT_ERROR(53, channels.OpenInput(Channel::Side, "none.qz3"));
}

TEST_F(ChannelsTest, AFailedOpeningLeavesTheChannelClosed) {
  OpenRecords("aaaa");
  EXPECT_ERROR(76, channels.OpenRandom(Channel::Results, "nowhere/r", kLength));
  EXPECT_ERROR(52, (void)channels.RecordCount(Channel::Results));
}

TEST_F(ChannelsTest, NothingOfATextIsOnDiskUntilItsChannelIsClosed) {
  channels.OpenOutput(Channel::Side, "side.qz3", Keeping::Lasting);
  channels.Writer(Channel::Side).Text("new").EndLine();
  EXPECT_FALSE(folder.Has("side.qz3"));
  channels.Close(Channel::Side);
  EXPECT_EQ(folder.Read("side.qz3"), "\"new\"\r\n");
}

TEST_F(ChannelsTest, ALastingTextHasReachedTheDiskWhenItsChannelIsClosed) {
  WriteText(Keeping::Lasting);
  EXPECT_EQ(files.Plan().Done(FileOperation::Sync), 1);
  EXPECT_EQ(files.Plan().Done(FileOperation::Rename), 1);
}

TEST_F(ChannelsTest, ALastingTextIsTheOldOrTheNewUnderEveryFailure) {
  for (int nth = 1;; ++nth) {
    folder.Write("side.qz3", "\"old\"\r\n");
    const long before = files.Plan().DoneInAll();
    files.Plan().FailAt(std::nullopt, nth, 61, false);
    const int error = ErrorOf([&] { WriteText(Keeping::Lasting); });
    files.Plan().Off();
    channels.AbandonAll();
    if (error == 0) {
      EXPECT_EQ(folder.Read("side.qz3"), "\"new\"\r\n");
      EXPECT_EQ(nth, 6) << "open, write, sync, close, rename";
      EXPECT_EQ(files.Plan().DoneInAll() - before, 5);
      break;
    }
    EXPECT_EQ(error, 61);
    EXPECT_EQ(folder.Read("side.qz3"), "\"old\"\r\n") << nth;
    EXPECT_FALSE(folder.Has("side.qz3.new")) << nth;
    WriteText(Keeping::Lasting);
    EXPECT_EQ(folder.Read("side.qz3"), "\"new\"\r\n") << "the next one works";
  }
}

TEST_F(ChannelsTest, ALastingTextIsTheOldOrTheNewUnderEveryCutAndEveryKill) {
  for (std::size_t bytes = 0; bytes <= 7; ++bytes) {
    folder.Write("side.qz3", "\"old\"\r\n");
    files.Plan().CutAt(1, bytes, 61);
    EXPECT_ERROR(61, WriteText(Keeping::Lasting));
    channels.AbandonAll();
    EXPECT_EQ(folder.Read("side.qz3"), "\"old\"\r\n");
  }
  for (int nth = 1; nth <= 5; ++nth) {
    folder.Write("side.qz3", "\"old\"\r\n");
    files.Plan().CrashAt(std::nullopt, nth);
    EXPECT_THROW(WriteText(Keeping::Lasting), Killed);
    channels.AbandonAll();
    EXPECT_EQ(folder.Read("side.qz3"), "\"old\"\r\n") << nth;
    WriteText(Keeping::Lasting);
    EXPECT_EQ(folder.Read("side.qz3"), "\"new\"\r\n") << "what the kill left is no hindrance";
  }
}

TEST_F(ChannelsTest, ReplacingAWholeFileIsTheOldOrTheNewUnderEveryFailure) {
  for (int nth = 1; nth <= 5; ++nth) {
    folder.Write("r", "old");
    files.Plan().FailAt(std::nullopt, nth, 57, false);
    EXPECT_ERROR(57, channels.ReplaceWhole("r", "new"));
    EXPECT_EQ(folder.Read("r"), "old") << nth;
    EXPECT_FALSE(folder.Has("r.new"));
  }
  channels.ReplaceWhole("r", "new");
  EXPECT_EQ(channels.ReadWhole("r"), "new");
}

TEST_F(ChannelsTest, AWorkingTextIsWrittenInPlaceWithoutWaitingForTheDisk) {
  WriteText(Keeping::Working);
  EXPECT_EQ(folder.Read("side.qz3"), "\"new\"\r\n");
  EXPECT_EQ(files.Plan().Done(FileOperation::Sync), 0);
  EXPECT_EQ(files.Plan().Done(FileOperation::Rename), 0);
}

TEST_F(ChannelsTest, AbandoningDropsTextsAndFinishesNothing) {
  folder.Write("side.qz3", "\"old\"\r\n");
  OpenRecords("aaaa");
  channels.Put(Channel::Results, 1, Record("NNNN"));
  channels.OpenOutput(Channel::Side, "side.qz3", Keeping::Lasting);
  channels.Writer(Channel::Side).Text("new").EndLine();
  files.Plan().FailAt(std::nullopt, 1, 57, true);
  channels.AbandonAll();
  files.Plan().Off();
  EXPECT_EQ(folder.Read("side.qz3"), "\"old\"\r\n");
  EXPECT_ERROR(52, (void)channels.RecordCount(Channel::Results));
  EXPECT_ERROR(52, (void)channels.Writer(Channel::Side));
}

TEST_F(ChannelsTest, ResultsAndLadderShareAChannel) {
  folder.Write("l", "llll");
  OpenRecords("aaaabbbb");
  channels.OpenRandom(Channel::Ladder, "l", kLength);
  EXPECT_EQ(Get(1), "llll");
}

}  // namespace
}  // namespace marlowbeck
