#pragma once

#include <functional>
#include <string>

#include <QStringList>

#include "platform/platform.h"

namespace marlowbeck {

// The small services of the machine.

class DesktopClipboard : public Clipboard {
 public:
  void Clear() override;
  void SetText(const std::string& text) override;
};

/// The confirming sound, where the machine can play one.
class DesktopSound : public Sound {
 public:
  /// The wave file lies in one of these folders; the first that has it counts.
  explicit DesktopSound(QStringList folders) : folders_(std::move(folders)) {}
  void Beep() override;
  void Prepare(const std::string& wave_file) override;
  void Play() override;

  /// Where the prepared file lies; empty when it lies nowhere.
  [[nodiscard]] QString WavePath() const;
  /// Whether it has turned out that nothing can be heard.
  [[nodiscard]] bool Mute() const { return mute_; }

 private:
  QStringList folders_;
  std::string wave_file_;
  bool mute_ = false;  ///< found out at the first sound: no other is tried
};

class DesktopClock : public Clock {
 public:
  Date Today() override;
};

class DesktopTimer : public Timer {
 public:
  std::uint64_t Seed() override;
};

class DesktopDisplay : public Display {
 public:
  explicit DesktopDisplay(std::function<void()> refresh) : refresh_(std::move(refresh)) {}
  int WidthInTwips() override;
  void Refresh() override { refresh_(); }

 private:
  std::function<void()> refresh_;
};

}  // namespace marlowbeck
