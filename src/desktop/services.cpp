#include "desktop/services.h"

#include <chrono>

#include <QApplication>
#include <QClipboard>
#include <QDate>
#include <QDir>
#include <QFileInfo>
#include <QLibrary>
#include <QScreen>

#include "data/text.h"
#include "desktop/encoding.h"
#include "desktop/sound/wave_player.h"
#include "desktop/working_folder.h"

namespace marlowbeck {
namespace {

constexpr int kTwipsPerPixel = 15;

using PlayWave = decltype(&MarlowbeckPlayWave);

/// Answers null where the program was built without sound, or is handed out without it.
PlayWave FindPlayer() {
#ifdef MARLOWBECK_SOUND_LINKED
  return &MarlowbeckPlayWave;
#else
  const QString library = QApplication::applicationDirPath() + "/marlowbeck-sound";
  return reinterpret_cast<PlayWave>(QLibrary::resolve(library, "MarlowbeckPlayWave"));
#endif
}

}  // namespace

void DesktopClipboard::Clear() { QApplication::clipboard()->clear(); }

/// Lines end in carriage return and line feed already, as spreadsheets expect.
void DesktopClipboard::SetText(const std::string& text) {
  QApplication::clipboard()->setText(QString::fromStdString(Utf8FromCp1252(text)));
}

void DesktopSound::Beep() { QApplication::beep(); }

void DesktopSound::Prepare(const std::string& wave_file) { wave_file_ = wave_file; }

QString DesktopSound::WavePath() const {
  if (wave_file_.empty()) return {};
  const QString name = ToQt(wave_file_);
  const QString path = QDir(FolderWith(name, folders_)).filePath(name);
  return QFileInfo::exists(path) ? path : QString();
}

/// A machine without a voice must not hold up a save.
void DesktopSound::Play() {
  const QString path = WavePath();
  if (mute_ || path.isEmpty()) return;
  static const PlayWave play = FindPlayer();
  mute_ = play == nullptr || !play(path);
}

Date DesktopClock::Today() { return FromQt(QDate::currentDate()); }

std::uint64_t DesktopTimer::Seed() {
  return static_cast<std::uint64_t>(std::chrono::steady_clock::now().time_since_epoch().count());
}

/// In true pixels, so that a scaled display is not taken for a small one.
int DesktopDisplay::WidthInTwips() {
  const QScreen& screen = *QApplication::primaryScreen();
  return qRound(screen.geometry().width() * screen.devicePixelRatio()) * kTwipsPerPixel;
}

}  // namespace marlowbeck
