// What the install step leaves behind, and how the program starts from it.

#include <QElapsedTimer>
#include <QProcess>
#include <QThread>

#include "tests/desktop/folders.h"

namespace marlowbeck {
namespace {

constexpr int kPatience = 30000;  ///< milliseconds, for a busy machine

class Installed : public testing::Test {
 protected:
  /// The whole install step.
  void Install() const {
    Cmake({"--install", MARLOWBECK_BINARY_DIR, "--prefix", place_.Path()}, {});
  }

  /// The laying of the sample alone, into a prefix, below `staging` where that is told.
  static void LaySample(const QString& prefix, const QString& staging = {}) {
    Cmake({"-DCMAKE_INSTALL_PREFIX=" + prefix, "-Dsamples=" MARLOWBECK_SOURCE_DIR "/samples", "-P",
           MARLOWBECK_SOURCE_DIR "/src/desktop/lay_sample.cmake"},
          staging);
  }

  /// What the driver answers to a script in a folder.
  static QByteArray Drive(const QString& folder, const QByteArray& script) {
    QProcess driver;
    driver.start(MARLOWBECK_DRIVE, {folder});
    driver.write(script);
    driver.closeWriteChannel();
    EXPECT_TRUE(driver.waitForFinished(kPatience));
    return driver.readAllStandardOutput();
  }

  [[nodiscard]] std::string Content(const QString& name) const {
    return ContentOf(place_.Path(name));
  }

  OwnersFolder place_;

 private:
  static void Cmake(const QStringList& arguments, const QString& staging) {
    QProcess cmake;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    if (!staging.isEmpty()) environment.insert("DESTDIR", staging);
    cmake.setProcessEnvironment(environment);
    cmake.start(MARLOWBECK_CMAKE, arguments);
    ASSERT_TRUE(cmake.waitForFinished(kPatience));
    ASSERT_EQ(cmake.exitCode(), 0) << cmake.readAllStandardError().toStdString();
  }
};

TEST_F(Installed, TheProgramFindsTheSampleOpen) {
  Install();
  for (const char* const name : {"marlowbeck", "ok.WAV", "index.md", "topics.txt"}) {
    EXPECT_TRUE(QFile::exists(place_.Path(name))) << name;
  }
  EXPECT_TRUE(Drive(place_.Path(), "screens\n").contains("[Marlowbeck] Filename: WINTER"));
}

TEST_F(Installed, TheFirstSheetIsNotHeldUpByAMissingNight) {
  LaySample(place_.Path());
  const QByteArray answers = Drive(place_.Path(), "click imgSheets\nscreens\n");
  EXPECT_TRUE(answers.contains("\"front\":\"frmResults\"")) << answers.toStdString();
  EXPECT_FALSE(answers.contains("\"box\"")) << answers.toStdString();
}

TEST_F(Installed, ALaterInstallKeepsWhatWasEntered) {
  LaySample(place_.Path());
  const std::string more = Content("Winter.qza") + Content("Winter.qza");
  WriteFile(place_.Path("Winter.qza"), QByteArray::fromStdString(more));
  WriteFile(place_.Path("WkDate.qz3"), "#2004-05-05#\r\n");
  LaySample(place_.Path());
  EXPECT_EQ(Content("Winter.qza"), more);
  EXPECT_EQ(Content("WkDate.qz3"), "#2004-05-05#\r\n");
}

TEST_F(Installed, ALaterInstallLaysNoSampleBesideAnotherSeason) {
  WriteFile(place_.Path("FileName.qz3"), "\"/home/jo/Summer.qza\"\r\n");
  LaySample(place_.Path());
  EXPECT_EQ(place_.Files(), QStringList("FileName.qz3"));
}

TEST_F(Installed, ALaterInstallKeepsNamesThatWereGivenWithoutASeason) {
  WriteFile(place_.Path("Association.qz3"), "\"Ours\"\r\n");
  LaySample(place_.Path());
  EXPECT_EQ(Content("Association.qz3"), "\"Ours\"\r\n");
  EXPECT_TRUE(QFile::exists(place_.Path("Winter.qza")));
}

TEST_F(Installed, APathThatASideFileCannotHoldIsLeftToTheWorkingFolder) {
  const QString prefix = place_.Path(QString::fromUtf8("Zoë"));
  LaySample(prefix);
  EXPECT_EQ(ContentOf(prefix + "/FileName.qz3"), "\"Winter.qza\"\r\n");
  EXPECT_TRUE(Drive(prefix, "screens\n").contains("[Marlowbeck] Filename: WINTER"));
}

TEST_F(Installed, APackageNamesThePlaceThatItIsMadeFor) {
  LaySample("/opt/marlowbeck", place_.Path());
  EXPECT_EQ(Content("opt/marlowbeck/FileName.qz3"), "\"/opt/marlowbeck/Winter.qza\"\r\n");
}

/// The program itself, started by somebody who cannot write to its folder, with a home of theirs.
class StartedByAVisitor {
 public:
  StartedByAVisitor(const QString& program, const QString& home) {
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert("QT_QPA_PLATFORM", "offscreen");
    environment.insert("HOME", home);
    environment.remove("XDG_DATA_HOME");
    process_.setProcessEnvironment(environment);
    process_.setWorkingDirectory(home);
    process_.setChildProcessModifier([] {
      if (geteuid() == 0 && setuid(kNobody) != 0) _exit(1);
    });
    process_.start(program, {});
  }
  StartedByAVisitor(const StartedByAVisitor&) = delete;
  StartedByAVisitor& operator=(const StartedByAVisitor&) = delete;
  ~StartedByAVisitor() {
    process_.kill();
    process_.waitForFinished();
  }

  /// Waits until a file is there.
  bool Leaves(const QString& path) {
    QElapsedTimer timer;
    timer.start();
    while (!QFile::exists(path) && timer.elapsed() < kPatience &&
           process_.state() != QProcess::NotRunning) {
      QThread::msleep(20);
      process_.waitForReadyRead(1);
    }
    return QFile::exists(path);
  }

 private:
  QProcess process_;
};

TEST_F(Installed, AVisitorBeginsWithACopyOfTheSampleInTheirOwnFolder) {
  Install();
  place_.Close();
  OwnersFolder home;
  home.Open();
  const QString data = home.Path(".local/share/Marlowbeck");
  StartedByAVisitor program(place_.Path("marlowbeck"), home.Path());
  ASSERT_TRUE(program.Leaves(data + "/FileName.qz3"));
  EXPECT_EQ(ContentOf(data + "/FileName.qz3"), '"' + data.toStdString() + "/Winter.qza\"\r\n");
  for (const char* const name :
       {"Winter.qza", "Winter_A Grade.qzr", "Winter_A Grade.qzs", "Winter_B Grade.qzr",
        "Winter_B Grade.qzs", "WkDate.qz3", "GameName.qz3", "Association.qz3"}) {
    EXPECT_EQ(ContentOf(data + "/" + name), Content(name)) << name;
  }
}

}  // namespace
}  // namespace marlowbeck
