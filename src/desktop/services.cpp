#include "desktop/services.h"

#include <chrono>

#include <QApplication>
#include <QClipboard>
#include <QDate>
#include <QDir>
#include <QEventLoop>
#include <QFileInfo>
#include <QScreen>
#include <QTimer>
#ifdef MARLOWBECK_MULTIMEDIA
#include <QAudioDevice>
#include <QMediaDevices>
#include <QSoundEffect>
#endif

#include "data/text.h"
#include "desktop/encoding.h"
#include "desktop/working_folder.h"

namespace marlowbeck {
namespace {

constexpr int kTwipsPerPixel = 15;
#ifdef MARLOWBECK_MULTIMEDIA
constexpr int kLongestSound = 1000;  ///< milliseconds
#endif

}  // namespace

void DesktopClipboard::Clear() { QApplication::clipboard()->clear(); }

/// Lines end in carriage return and line feed already, as spreadsheets expect.
void DesktopClipboard::SetText(const std::string& text) {
  QApplication::clipboard()->setText(QString::fromStdString(Utf8FromCp1252(text)));
}

DesktopSound::~DesktopSound() = default;

void DesktopSound::Beep() { QApplication::beep(); }

void DesktopSound::Prepare(const std::string& wave_file) { wave_file_ = wave_file; }

QString DesktopSound::WavePath() const {
  if (wave_file_.empty()) return {};
  const QString name = ToQt(wave_file_);
  const QString path = QDir(FolderWith(name, folders_)).filePath(name);
  return QFileInfo::exists(path) ? path : QString();
}

#ifdef MARLOWBECK_MULTIMEDIA
namespace {

/// Plays a sound and waits for its end, but never for long.
void PlayToTheEnd(QSoundEffect& effect) {
  QEventLoop loop;
  const auto leave = [&] {
    if (!effect.isPlaying() || effect.status() == QSoundEffect::Error) loop.quit();
  };
  QObject::connect(&effect, &QSoundEffect::playingChanged, &loop, leave);
  QObject::connect(&effect, &QSoundEffect::statusChanged, &loop, leave);
  QTimer::singleShot(kLongestSound, &loop, &QEventLoop::quit);
  effect.play();
  if (effect.isPlaying()) loop.exec(QEventLoop::ExcludeUserInputEvents);
}

}  // namespace

/// A machine without a voice must not hold up a save.
void DesktopSound::Play() {
  const QString path = WavePath();
  if (mute_ || path.isEmpty()) return;
  if (player_ == nullptr) {
    mute_ = QMediaDevices::defaultAudioOutput().isNull();
    if (mute_) return;
    auto effect = std::make_unique<QSoundEffect>();
    effect->setSource(QUrl::fromLocalFile(path));
    player_ = std::move(effect);
  }
  auto& effect = static_cast<QSoundEffect&>(*player_);
  PlayToTheEnd(effect);
  mute_ = effect.status() == QSoundEffect::Error;
}
#else
void DesktopSound::Play() {}
#endif

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
