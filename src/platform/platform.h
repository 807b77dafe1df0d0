#pragma once

#include <cstdint>
#include <optional>
#include <string>

#include "data/date.h"
#include "platform/printer.h"

namespace marlowbeck {

// What the program needs of the world, as interfaces that a face answers. Texts are of code page
// 1252 with "\r" for a line break.

/// Message boxes by style number, answered by button number.
enum class BoxStyle {
  StopOk = 16,
  StopOkCancel = 17,
  StopYesNo = 20,
  WarningOk = 48,
  InformationOk = 64,
  InformationYesNoCancel = 67,
  InformationYesNo = 68,
};

inline constexpr int kAnswerOk = 1;
inline constexpr int kAnswerCancel = 2;
inline constexpr int kAnswerYes = 6;
inline constexpr int kAnswerNo = 7;

struct MessageBoxRequest {
  std::string text;
  std::string title;
  BoxStyle style = BoxStyle::WarningOk;
};

struct InputBoxRequest {
  std::string prompt;
  std::string title;
  std::string default_text;
  std::optional<int> help_topic;
  bool is_name = false;  ///< a file's name is asked for, whose characters may all be escapes
};

/// Modal boxes. They count themselves, since a click that calls one up on its way is lost.
class Boxes {
 public:
  virtual ~Boxes() = default;

  /// Answers the number of the button.
  int Message(const MessageBoxRequest& request) {
    ++shown_;
    return ShowMessage(request);
  }
  /// Answers the text; empty when cancelled.
  std::string Input(const InputBoxRequest& request) {
    ++shown_;
    return ShowInput(request);
  }
  [[nodiscard]] long Shown() const { return shown_; }

 protected:
  virtual int ShowMessage(const MessageBoxRequest& request) = 0;
  virtual std::string ShowInput(const InputBoxRequest& request) = 0;

 private:
  long shown_ = 0;
};

struct FileDialogRequest {
  enum class Mode { Open, Save };
  Mode mode = Mode::Open;
  std::string title;
  std::string filter;  ///< "*.qza"
  std::string folder;
  std::string name;  ///< what stands in the name box to begin with
  std::string extension;
  bool asks_before_overwriting = false;  ///< a file that is there already
};

struct FontChoice {
  std::string name;
  int size = 0;  ///< points
  bool bold = false;
  bool italic = false;
};

class Dialogs {
 public:
  virtual ~Dialogs() = default;
  /// The full path chosen; the name asked with when it was left as it stood; nothing if cancelled.
  /// Throws BadFileName for a path that no text of the program can hold.
  virtual std::optional<std::string> File(const FileDialogRequest& request) = 0;
  virtual std::optional<FontChoice> Font(const FontChoice& present) = 0;
  virtual std::optional<Orientation> PrinterSetup(Orientation present) = 0;
};

class Clipboard {
 public:
  virtual ~Clipboard() = default;
  virtual void Clear() = 0;
  virtual void SetText(const std::string& text) = 0;
};

class Sound {
 public:
  virtual ~Sound() = default;
  virtual void Beep() = 0;
  /// Makes a wave file of the working folder ready.
  virtual void Prepare(const std::string& wave_file) = 0;
  /// Plays it and returns when it has ended; silent when it cannot be played. Never fails.
  virtual void Play() = 0;
};

class Help {
 public:
  virtual ~Help() = default;
  /// Topic 0 is the table of contents.
  virtual void Open(const std::string& file, int topic) = 0;
};

class Clock {
 public:
  virtual ~Clock() = default;
  virtual Date Today() = 0;
};

/// Where chance comes from: a number of the system timer, another one at each asking.
class Timer {
 public:
  virtual ~Timer() = default;
  virtual std::uint64_t Seed() = 0;
};

class Display {
 public:
  virtual ~Display() = default;
  virtual int WidthInTwips() = 0;
  /// Brings what is seen up to date in the middle of long work.
  virtual void Refresh() = 0;
};

/// Told of what the program does that is no call for an answer.
class Observer {
 public:
  virtual ~Observer() = default;
  virtual void ErrorRaised(int number) = 0;
  virtual void Ended() = 0;
};

/// All of it, as handed to the program. Owned by the face.
struct Platform {
  Boxes& boxes;
  Dialogs& dialogs;
  Printer& printer;
  Clipboard& clipboard;
  Sound& sound;
  Help& help;
  Clock& clock;
  Timer& timer;
  Display& display;
  Observer& observer;
};

}  // namespace marlowbeck
