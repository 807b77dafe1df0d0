#include "desktop/sound/wave_player.h"

#include <QAudioDevice>
#include <QCoreApplication>
#include <QEventLoop>
#include <QMediaDevices>
#include <QSoundEffect>
#include <QTimer>
#include <QUrl>

namespace {

constexpr int kLongestSound = 1000;  ///< milliseconds

/// The one effect, which knows the last file that it has loaded. Gone with the application.
QSoundEffect& EffectOf(const QUrl& wave) {
  static auto* const effect = new QSoundEffect(QCoreApplication::instance());
  if (effect->source() != wave) effect->setSource(wave);
  return *effect;
}

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

bool MarlowbeckPlayWave(const QString& path) {
  if (QMediaDevices::defaultAudioOutput().isNull()) return false;
  QSoundEffect& effect = EffectOf(QUrl::fromLocalFile(path));
  PlayToTheEnd(effect);
  return effect.status() != QSoundEffect::Error;
}
