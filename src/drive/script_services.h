#pragma once

#include <cstdint>
#include <string>

#include "drive/event_log.h"
#include "drive/face.h"

namespace marlowbeck {

// The small services of the platform, told to the log or set by the script.

class ScriptClipboard : public Clipboard {
 public:
  explicit ScriptClipboard(EventLog& log) : log_(log) {}
  void Clear() override { SetText({}); }
  void SetText(const std::string& text) override {
    text_ = text;
    log_.Add("clipboard", TextAsJson(text));
  }
  [[nodiscard]] const std::string& Text() const { return text_; }

 private:
  EventLog& log_;
  std::string text_;
};

class ScriptSound : public Sound {
 public:
  explicit ScriptSound(EventLog& log) : log_(log) {}
  void Beep() override { log_.Add("beep", true); }
  void Prepare(const std::string& wave_file) override { wave_file_ = wave_file; }
  void Play() override { log_.Add("sound", TextAsJson(wave_file_)); }

 private:
  EventLog& log_;
  std::string wave_file_;
};

class ScriptHelp : public Help {
 public:
  explicit ScriptHelp(EventLog& log) : log_(log) {}
  void Open(const std::string& file, int topic) override {
    log_.Add("help", {{"file", TextAsJson(file)}, {"topic", topic}});
  }

 private:
  EventLog& log_;
};

class ScriptClock : public Clock {
 public:
  explicit ScriptClock(Date today) : today_(today) {}
  Date Today() override { return today_; }
  void Set(Date today) { today_ = today; }

 private:
  Date today_;
};

/// One number higher at each asking.
class ScriptTimer : public Timer {
 public:
  explicit ScriptTimer(std::uint64_t seed) : next_(seed) {}
  std::uint64_t Seed() override { return next_++; }

 private:
  std::uint64_t next_;
};

class ScriptDisplay : public Display {
 public:
  ScriptDisplay(int width, Face& face) : width_(width), face_(face) {}
  int WidthInTwips() override { return width_; }
  void Refresh() override { face_.Refresh(); }

 private:
  int width_;
  Face& face_;
};

class ScriptObserver : public Observer {
 public:
  explicit ScriptObserver(EventLog& log) : log_(log) {}
  void ErrorRaised(int number) override { log_.Add("error", Json::object({{"number", number}})); }
  void Ended() override { log_.AddEnd(); }

 private:
  EventLog& log_;
};

}  // namespace marlowbeck
