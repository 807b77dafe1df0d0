#pragma once

#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

#include "platform/platform.h"
#include "program/program.h"
#include "ui/control_state.h"
#include "ui/hand.h"

namespace marlowbeck {

/// One thing that a script asks a person to do.
struct Action {
  enum class Verb {
    Click,
    DoubleClick,
    Type,
    Pick,
    PickTwice,
    Select,
    Cell,
    DoubleCell,
    PickDate,
    Press,
    Mnemonic,
    Focus,
    Hover,
    HoverScreen,
    CloseScreen,
  };

  Verb verb = Verb::Click;
  Control* control = nullptr;  ///< what is acted on; null where a key or a screen is
  Screen* screen = nullptr;
  std::string text;          ///< what is typed, code page 1252
  std::vector<int> numbers;  ///< lines; row and column
  Date date;
  Key key = Key::Enter;
  char letter = 0;  ///< of a mnemonic
};

struct ScreenState {
  std::string name;
  std::string title;
  bool visible = false;
  bool enabled = false;
};

/// Thrown out of a box that keeps coming back with nothing waiting for it: the event is given up.
/// No failure of the program, so that nothing in the program catches it. A face lets it through to
/// whoever called Perform, or Start.
struct BrokenOff {};

/// Where the answers of boxes come from and where what was asked is told. Throws BrokenOff when a
/// box keeps coming back with nothing waiting for it.
class BoxAnswers {
 public:
  virtual ~BoxAnswers() = default;
  /// The button number for a box as it was seen.
  virtual int ToMessage(const MessageBoxRequest& seen) = 0;
  /// The text for an input box as it was seen; nothing when it is to be cancelled.
  virtual std::optional<std::string> ToInput(const InputBoxRequest& seen) = 0;
};

/// The script's eyes and hands: works the screens of a program and reads what they show. One face
/// works the models, another real windows. It is made before its program and goes before it.
class Face {
 public:
  virtual ~Face() = default;

  /// The boxes that the program is to show itself through.
  virtual Boxes& GetBoxes() = 0;
  /// Called once, before the program starts.
  virtual void Attach(Program& program) = 0;
  /// Brings what is seen up to date: after the start, and where the program asks for it.
  virtual void Refresh() = 0;

  /// Does what a person would. Refuses it, in words that name the control, where a person could
  /// not; everything that it set off is over when this returns.
  virtual Outcome Perform(const Action& action) = 0;
  virtual ControlState Read(const Control& control) = 0;
  virtual ScreenState Read(const Screen& screen) = 0;
  /// The screen in front and the control with the focus, as seen; empty for none.
  virtual std::string FrontScreen() = 0;
  virtual std::string FocusedControl() = 0;  ///< "frmResults.txtAgg"
  /// Takes a picture of the screen in front into a PNG file, brought to a size first when one is
  /// given. Answers the picture's width and height; nothing where there are no windows, or the
  /// file cannot be written. `file` is UTF-8.
  virtual std::optional<std::pair<int, int>> Shot(const std::string& file,
                                                  std::optional<std::pair<int, int>> size) = 0;
  /// The desktop's own printer, which makes a PDF file of each document in a folder, named for the
  /// screen that prints it; null where there are no windows. `folder` is UTF-8.
  virtual std::unique_ptr<Printer> MakePdfPrinter(const std::string& folder) = 0;
};

/// The face on models alone.
std::unique_ptr<Face> MakeModelFace(BoxAnswers& answers);

/// The face on real windows; null where the driver was built without them. May be called again in
/// the same process once the face made before has gone.
std::unique_ptr<Face> MakeWindowFace(BoxAnswers& answers, int& argc, char** argv);

}  // namespace marlowbeck
