#include <utility>

#include "drive/command_table.h"
#include "drive/names.h"
#include "drive/refusal.h"
#include "drive/state_json.h"

namespace marlowbeck {
namespace {

Json NameOrNull(const std::string& name) { return name.empty() ? Json() : TextAsJson(name); }

void LookAtScreens(World& world, Arguments& arguments, Json& answer) {
  arguments.Finish();
  Json& list = answer["screens"] = Json::array();
  for (const auto& screen : world.GetScreens().Loaded()) {
    list.push_back(AsJson(world.GetFace().Read(*screen)));
  }
  answer["front"] = NameOrNull(world.GetFace().FrontScreen());
  answer["focus"] = NameOrNull(world.GetFace().FocusedControl());
}

void LookAtControl(World& world, Arguments& arguments, Json& answer) {
  const Control& control = TakeControl(arguments, world.GetScreens());
  arguments.Finish();
  answer["control"] = AsJson(world.GetFace().Read(control));
}

void LookAtState(World& world, Arguments& arguments, Json& answer) {
  const Screen& screen = arguments.AtEnd() ? ScreenInFront(world.GetScreens())
                                           : TakeScreen(arguments, world.GetScreens());
  arguments.Finish();
  Json& controls = answer["controls"] = Json::object();
  for (const Control* control : screen.Controls()) {
    controls[control->Name()] = AsJson(world.GetFace().Read(*control));
  }
}

void LookAtSession(World& world, Arguments& arguments, Json& answer) {
  arguments.Finish();
  answer["session"] = AsJson(world.GetProgram().GetSession());
}

void LookAtClipboard(World& world, Arguments& arguments, Json& answer) {
  arguments.Finish();
  answer["text"] = TextAsJson(world.clipboard.Text());
}

void LookAtEvents(World& world, Arguments& arguments, Json& answer) {
  arguments.Finish();
  world.log.MoveInto(answer);
}

/// Each way. A window far larger than any display cannot be painted.
constexpr int kMostPixels = 8192;

struct Picture {
  std::string file;
  std::optional<std::pair<int, int>> size;
};

/// Takes the word behind the last blank off a text.
std::string TakeLastWord(std::string& text) {
  const auto blank = text.find_last_of(' ');
  if (blank == std::string::npos) return {};
  std::string word = text.substr(blank + 1);
  text.erase(blank);
  return word;
}

/// A file, whose name may hold blanks, with or without two numbers behind it.
Picture ReadPicture(Arguments& arguments) {
  if (arguments.AtEnd()) arguments.Refuse("needs a file");
  const std::string whole = arguments.Rest();
  std::string file = whole;
  const auto height = WholeNumber(TakeLastWord(file));
  const auto width = WholeNumber(TakeLastWord(file));
  if (!height || !width) return {whole, std::nullopt};
  if (*width < 1 || *height < 1) arguments.Refuse("the size must be at least 1 by 1");
  if (*width > kMostPixels || *height > kMostPixels) {
    arguments.Refuse("the size must be at most 8192 by 8192");
  }
  return {file, std::pair(*width, *height)};
}

void TakeShot(World& world, Arguments& arguments, Json& answer) {
  const Picture picture = ReadPicture(arguments);
  const auto size = world.GetFace().Shot(Utf8FromCp1252(picture.file), picture.size);
  if (!size) arguments.Refuse("no picture of a window can be taken here");
  answer["size"] = {size->first, size->second};
}

}  // namespace

void AddLooking(CommandTable& table) {
  table["screens"] = LookAtScreens;
  table["get"] = LookAtControl;
  table["state"] = LookAtState;
  table["session"] = LookAtSession;
  table["clipboard"] = LookAtClipboard;
  table["events"] = LookAtEvents;
  table["shot"] = TakeShot;
}

}  // namespace marlowbeck
