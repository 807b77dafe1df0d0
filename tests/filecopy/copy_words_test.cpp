#include "filecopy/copy_words.h"

#include <gtest/gtest.h>

#include "data/text.h"

namespace marlowbeck {
namespace {

TEST(CopyWords, CountOneAndMore) {
  EXPECT_EQ(CountWords(0), "File List = 0");
  EXPECT_EQ(SelectedWords(1), "1  File selected.");
  EXPECT_EQ(SelectedWords(2), "2  Files selected.");
  EXPECT_EQ(CopiedReport(0), "No files copied.");
  EXPECT_EQ(CopiedReport(1), "1 file has been copied.");
  EXPECT_EQ(CopiedReport(12), "12 files have been copied.");
}

TEST(CopyWords, OfTheQuestionNameTheTargetInCapitals) {
  EXPECT_EQ(CopyQuestion(1, "/media/stick", false),
            "You are about to Copy 1 file to\r/MEDIA/STICK\r\rAre you Sure?");
  EXPECT_EQ(CopyQuestion(3, "E:\\Winter", false),
            "You are about to Copy 3 files to\rE:\\WINTER\r\rAre you Sure?");
}

TEST(CopyWords, WarnWhereFilesWillBeOverwritten) {
  EXPECT_EQ(CopyQuestion(2, "/a", true),
            "You are about to Copy 2 files to\r/A\r\rW A R N I N G!\r"
            "Existing files will be Overwritten.\r\rAre you Sure?");
}

TEST(CopyWords, AboutAFileThatIsThereLeaveItsNameAsItIs) {
  EXPECT_EQ(ReplaceQuestion("Winter.qza", "/media/Stick"),
            "Winter.qza already exists in\r/media/Stick\r\rDo you wish to replace it?");
}

TEST(CopyWords, BeforeFilesAreDeletedNameOneAndCountMore) {
  EXPECT_EQ(DeleteQuestion({"Winter.qza"}, "/club"),
            "You are about to delete WINTER.QZA from\r/CLUB\r\rAre you Sure?");
  EXPECT_EQ(DeleteQuestion({"a", "b"}, "/club"),
            "You are about to delete 2 files from\r/CLUB\r\rAre you Sure?");
}

TEST(CopyWords, OfFolders) {
  EXPECT_EQ(DeleteFolderQuestion("/club/Old"),
            "You are about to delete the following folder,\r/club/Old\r\rAre you Sure ?");
  EXPECT_EQ(NewFolderPrompt("/club"),
            "Create a new folder in...\r/CLUB\r\rEnter NEW Name for Folder");
}

TEST(ShortenedPath, KeepsAPathThatHasRoom) {
  EXPECT_EQ(ShortenedPath(""), "");
  EXPECT_EQ(ShortenedPath("C:\\Darts"), "C:\\Darts");
  const std::string fifty = "/" + std::string(49, 'x');
  EXPECT_EQ(ShortenedPath(fifty), fifty);
}

TEST(ShortenedPath, CountsALetterBeyondTheCodePageOnce) {
  std::string letters;
  for (int i = 0; i < 49; ++i) letters += "\u0142";
  EXPECT_EQ(ShortenedPath(TextOfName("/" + letters)), TextOfName("/" + letters));
  EXPECT_EQ(ShortenedPath(TextOfName("/x" + letters)),
            TextOfName("/x\u0142  ...  " + letters.substr(2 * 9)));
}

TEST(ShortenedPath, ShowsTheFirstThreeAndTheLastForty) {
  const std::string tail = "/0123456789/0123456789/0123456789/Winter";
  ASSERT_EQ(tail.size(), 40U);
  EXPECT_EQ(ShortenedPath("/home/recorder" + tail), "/ho  ...  " + tail);
  EXPECT_EQ(ShortenedPath("C:\\xxxxxxxx" + tail), "C:\\  ...  " + tail) << "51 characters";
}

}  // namespace
}  // namespace marlowbeck
