#include "desktop/working_folder.h"

#include "tests/desktop/folders.h"

namespace marlowbeck {
namespace {

/// A program's folder as the install step leaves it, and a user's data folder, not made yet.
class TheWorkingFolder : public testing::Test {
 protected:
  TheWorkingFolder() {
    WriteFile(program_.Path("Winter.qza"), "players");
    WriteFile(program_.Path("Winter_A Grade.qzr"), "results");
    WriteFile(program_.Path("Winter_A Grade.qzs"), "season");
    WriteFile(program_.Path("Association.qz3"), "association");
    WriteFile(program_.Path("GameName.qz3"), "games");
    WriteFile(program_.Path("WkDate.qz3"), "night");
    WriteFile(program_.Path("FileName.qz3"), "\"/the/program/Winter.qza\"\r\n");
    WriteFile(program_.Path("ok.WAV"), "sound");
    WriteFile(program_.Path("index.md"), "manual");
    home_.Open();
  }

  /// A start of the program by somebody who cannot write to its folder.
  QString StartAsVisitor() {
    program_.Close();
    const AsVisitor visitor;
    return WorkingFolder(program_.Path(), data_);
  }
  void LayAsVisitor(const QString& name, const QByteArray& content) const {
    const AsVisitor visitor;
    QDir().mkpath(data_);
    WriteFile(QDir(data_).filePath(name), content);
  }
  [[nodiscard]] std::string Laid(const QString& name) const {
    return ContentOf(QDir(data_).filePath(name));
  }
  [[nodiscard]] std::string NamingTheCopy() const {
    return '"' + QDir(data_).filePath("Winter.qza").toStdString() + "\"\r\n";
  }

  OwnersFolder program_;
  OwnersFolder home_;
  QString data_ = home_.Path("share/Marlowbeck");
};

TEST_F(TheWorkingFolder, IsTheProgramsOwnWhereThatCanBeWritten) {
  EXPECT_EQ(WorkingFolder(program_.Path(), data_), program_.Path());
  EXPECT_FALSE(QDir(data_).exists());
  EXPECT_EQ(program_.Files().size(), 9);  // nothing of the trial stays
}

TEST_F(TheWorkingFolder, IsTheUsersWhereTheProgramsIsReadOnly) {
  EXPECT_EQ(StartAsVisitor(), data_);
}

TEST_F(TheWorkingFolder, BeginsWithACopyOfTheSampleThatIsOpen) {
  StartAsVisitor();
  EXPECT_EQ(Laid("Winter.qza"), "players");
  EXPECT_EQ(Laid("Winter_A Grade.qzr"), "results");
  EXPECT_EQ(Laid("Winter_A Grade.qzs"), "season");
  EXPECT_EQ(Laid("Association.qz3"), "association");
  EXPECT_EQ(Laid("GameName.qz3"), "games");
  EXPECT_EQ(Laid("WkDate.qz3"), "night");
  EXPECT_EQ(Laid("FileName.qz3"), NamingTheCopy());
  EXPECT_EQ(QDir(data_).entryList(QDir::Files).size(), 7);
}

TEST_F(TheWorkingFolder, HoldsACopyThatCanBeWrittenThoughItsSourceCannot) {
  for (const QString& name : program_.Files()) {
    QFile::setPermissions(program_.Path(name),
                          QFile::ReadOwner | QFile::ReadGroup | QFile::ReadOther);
  }
  StartAsVisitor();
  EXPECT_TRUE(QFileInfo(QDir(data_).filePath("Winter.qza")).permissions() & QFile::WriteOwner);
}

TEST_F(TheWorkingFolder, KeepsWhatWasDoneInItAtTheNextStart) {
  StartAsVisitor();
  WriteFile(QDir(data_).filePath("Winter.qza"), "more players");
  WriteFile(QDir(data_).filePath("FileName.qz3"), "\"\"\r\n");
  QFile::remove(QDir(data_).filePath("WkDate.qz3"));
  EXPECT_EQ(StartAsVisitor(), data_);
  EXPECT_EQ(Laid("Winter.qza"), "more players");
  EXPECT_EQ(Laid("FileName.qz3"), "\"\"\r\n");
  EXPECT_EQ(Laid("WkDate.qz3"), "(no such file)");
}

TEST_F(TheWorkingFolder, KeepsASeasonThatIsCalledAsTheSampleIs) {
  LayAsVisitor("Winter.qza", "my players");
  StartAsVisitor();
  EXPECT_EQ(Laid("Winter.qza"), "my players");
  EXPECT_EQ(QDir(data_).entryList(QDir::Files).size(), 1);
}

TEST_F(TheWorkingFolder, KeepsNamesThatWereGivenBeforeTheSampleCame) {
  LayAsVisitor("Association.qz3", "my association");
  StartAsVisitor();
  EXPECT_EQ(Laid("Association.qz3"), "my association");
  EXPECT_EQ(Laid("FileName.qz3"), NamingTheCopy());
}

TEST_F(TheWorkingFolder, GetsTheRestOfACopyThatWasBrokenOff) {
  LayAsVisitor("WkDate.qz3", "night");
  StartAsVisitor();
  EXPECT_EQ(Laid("Winter.qza"), "players");
  EXPECT_EQ(Laid("FileName.qz3"), NamingTheCopy());
}

TEST_F(TheWorkingFolder, StaysEmptyWhereNoSampleWasLaid) {
  QFile::remove(program_.Path("Winter.qza"));
  EXPECT_EQ(StartAsVisitor(), data_);
  EXPECT_TRUE(QDir(data_).exists());
  EXPECT_TRUE(QDir(data_).isEmpty());
}

TEST_F(TheWorkingFolder, IsNamedByItselfWhereASideFileCannotHoldItsPath) {
  data_ = home_.Path(QString::fromUtf8("Дартс"));
  StartAsVisitor();
  EXPECT_EQ(Laid("FileName.qz3"), "\"Winter.qza\"\r\n");
}

TEST_F(TheWorkingFolder, NamesItsCopyInTheProgramsLetters) {
  data_ = home_.Path(QString::fromUtf8("Zoë"));
  StartAsVisitor();
  EXPECT_EQ(Laid("FileName.qz3"), '"' + home_.Path().toStdString() + "/Zo\xEB/Winter.qza\"\r\n");
}

TEST(CanBeWritten, IsTrueOfAFolderOfOnesOwn) {
  const QTemporaryDir folder;
  EXPECT_TRUE(CanBeWritten(folder.path()));
  EXPECT_TRUE(QDir(folder.path()).isEmpty());
}

TEST(CanBeWritten, IsFalseOfAFolderOfAnothersAndOfNone) {
  OwnersFolder folder;
  WriteFile(folder.Path("file"), "");
  EXPECT_FALSE(CanBeWritten(folder.Path("missing")));
  EXPECT_FALSE(CanBeWritten(folder.Path("file")));
  folder.Close();
  const AsVisitor visitor;
  EXPECT_FALSE(CanBeWritten(folder.Path()));
}

TEST(FolderWith, IsTheFirstThatHasTheFile) {
  const OwnersFolder working;
  const OwnersFolder program;
  WriteFile(program.Path("ok.WAV"), "");
  const QStringList folders = {working.Path(), program.Path()};
  EXPECT_EQ(FolderWith("ok.WAV", folders), program.Path());
  WriteFile(working.Path("ok.WAV"), "");
  EXPECT_EQ(FolderWith("ok.WAV", folders), working.Path());
  EXPECT_EQ(FolderWith("missing", folders), program.Path());
}

}  // namespace
}  // namespace marlowbeck
