#include "drive/names.h"

#include "drive/refusal.h"

namespace marlowbeck {

Screen& ScreenNamed(const std::string& name, const Screens& screens) {
  if (Screen* const screen = screens.Find(name)) return *screen;
  throw Refusal("there is no screen " + name + " now");
}

Screen& ScreenInFront(const Screens& screens) {
  if (Screen* const front = screens.Front()) return *front;
  throw Refusal("no screen is in front");
}

Control& ControlNamed(const std::string& name, const Screens& screens) {
  const auto dot = name.find('.');
  const bool bare = dot == std::string::npos;
  const Screen* const screen = bare ? screens.Front() : screens.Find(name.substr(0, dot));
  if (screen == nullptr) {
    throw Refusal(name + ": " + (bare ? "no screen is in front" : "its screen is not loaded"));
  }
  const std::string own = bare ? name : name.substr(dot + 1);
  if (Control* const control = screen->Find(own)) return *control;
  throw Refusal(screen->Name() + " has no control " + own);
}

Screen& TakeScreen(Arguments& arguments, const Screens& screens) {
  Screen& screen = ScreenNamed(arguments.Word("a screen"), screens);
  arguments.About(screen.Name());
  return screen;
}

Control& TakeControl(Arguments& arguments, const Screens& screens) {
  Control& control = ControlNamed(arguments.Word("a control"), screens);
  arguments.About(control.Name());
  return control;
}

}  // namespace marlowbeck
