// The small services of the machine.

#include "desktop/services.h"

#include <QApplication>
#include <QClipboard>
#include <QDate>
#include <QElapsedTimer>
#include <QProcess>
#include <QScreen>

#include "desktop/encoding.h"
#include "tests/desktop/folders.h"

namespace marlowbeck {
namespace {

TEST(DesktopClipboard, HoldsTextInTheLettersOfTheDesktop) {
  DesktopClipboard().SetText("Zo\xEB\t121\r\nNo\t\x80\r\n");
  EXPECT_EQ(QApplication::clipboard()->text(), QString::fromUtf8("Zoë\t121\r\nNo\t€\r\n"));
}

TEST(DesktopClipboard, IsEmptyOnceItIsCleared) {
  DesktopClipboard().SetText("Rovers");
  DesktopClipboard().Clear();
  EXPECT_EQ(QApplication::clipboard()->text(), QString());
}

class ConfirmingSound : public testing::Test {
 protected:
  OwnersFolder working_;
  OwnersFolder program_;
  DesktopSound sound_{{working_.Path(""), program_.Path("")}};
};

TEST_F(ConfirmingSound, LiesInTheProgramsFolderWhereTheWorkingFolderHasNone) {
  sound_.Prepare("ok.WAV");
  EXPECT_EQ(sound_.WavePath(), QString());
  WriteFile(program_.Path("ok.WAV"), "");
  EXPECT_EQ(sound_.WavePath(), program_.Path("ok.WAV"));
  WriteFile(working_.Path("ok.WAV"), "");
  EXPECT_EQ(sound_.WavePath(), working_.Path("ok.WAV"));
}

TEST_F(ConfirmingSound, IsNowhereBeforeItIsPrepared) { EXPECT_EQ(sound_.WavePath(), QString()); }

TEST_F(ConfirmingSound, HoldsNothingUpWhereItIsMissing) {
  sound_.Prepare("ok.WAV");
  QElapsedTimer timer;
  timer.start();
  sound_.Play();
  EXPECT_LT(timer.elapsed(), 500);
}

/// How long two saves are held up, in milliseconds.
qint64 TimeOfTwo(DesktopSound& sound) {
  QElapsedTimer timer;
  timer.start();
  sound.Play();
  sound.Play();
  return timer.elapsed();
}

TEST_F(ConfirmingSound, HoldsNothingUpForLong) {
  WriteFile(working_.Path("ok.WAV"), QByteArray::fromStdString(ContentOf(MARLOWBECK_SOUND)));
  sound_.Prepare("ok.WAV");
  const qint64 time = TimeOfTwo(sound_);
  EXPECT_LT(time, sound_.Mute() ? 1000 : 3000) << "mute: " << sound_.Mute();
}

TEST_F(ConfirmingSound, IsSilentWhereTheFileHoldsNoSound) {
  WriteFile(working_.Path("ok.WAV"), "no sound at all");
  sound_.Prepare("ok.WAV");
  EXPECT_LT(TimeOfTwo(sound_), 5000);
}

TEST(DesktopClock, IsTodays) {
  const QDate before = QDate::currentDate();
  const QDate today = ToQt(DesktopClock().Today());
  EXPECT_TRUE(today == before || today == QDate::currentDate());
}

TEST(DesktopTimer, NeverTellsTheSameTwice) {
  DesktopTimer timer;
  const auto first = timer.Seed();
  EXPECT_NE(timer.Seed(), first);
}

TEST(DesktopDisplay, RefreshesWhatIsSeen) {
  int refreshed = 0;
  DesktopDisplay([&] { ++refreshed; }).Refresh();
  EXPECT_EQ(refreshed, 1);
}

TEST(DesktopDisplay, IsFifteenTwipsWideForEachPixel) {
  const int pixels = QApplication::primaryScreen()->geometry().width();
  ASSERT_EQ(QApplication::primaryScreen()->devicePixelRatio(), 1);
  EXPECT_EQ(DesktopDisplay([] {}).WidthInTwips(), pixels * 15);
}

/// The width that this program tells on a display of another scale, which is read when it starts.
int WidthAtScale(const char* scale) {
  QProcess process;
  QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
  environment.insert("QT_SCALE_FACTOR", scale);
  process.setProcessEnvironment(environment);
  process.start(QApplication::applicationFilePath(), {"--tell-width"});
  EXPECT_TRUE(process.waitForFinished());
  return process.readAllStandardOutput().trimmed().toInt();
}

TEST(DesktopDisplay, IsNoNarrowerWhereEverythingIsDrawnLarger) {
  EXPECT_EQ(WidthAtScale("1"), DesktopDisplay([] {}).WidthInTwips());
  EXPECT_EQ(WidthAtScale("2"), DesktopDisplay([] {}).WidthInTwips());
}

}  // namespace
}  // namespace marlowbeck
