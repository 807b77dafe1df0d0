#include <algorithm>
#include <array>
#include <string_view>
#include <utility>

#include "data/text.h"
#include "drive/command_table.h"
#include "drive/names.h"
#include "drive/refusal.h"

namespace marlowbeck {
namespace {

using Verb = Action::Verb;

/// Reads the arguments of a command that acts into what is to be done.
using ActionReader = std::function<Action(World&, Arguments&)>;

Action On(Verb verb, Control& control) {
  Action action;
  action.verb = verb;
  action.control = &control;
  return action;
}

/// A command that takes a control and nothing else.
ActionReader ControlAlone(Verb verb) {
  return [verb](World& world, Arguments& arguments) {
    return On(verb, TakeControl(arguments, world.GetScreens()));
  };
}

Action ReadType(World& world, Arguments& arguments) {
  Action action = On(Verb::Type, TakeControl(arguments, world.GetScreens()));
  action.text = arguments.Typed();
  return action;
}

/// The first line of a list that is equal to a text.
int LineEqualTo(const Control& control, std::string_view text) {
  const auto* const list = dynamic_cast<const LineHolder*>(&control);
  if (list == nullptr) throw Refusal(control.Name() + " has no lines");
  int line = list->Find(text);
  if (line < 0) line = list->Find(WithoutEscapes(text));  // as it stands in a record
  if (line < 0) throw Refusal(control.Name() + " has no line \"" + std::string(text) + "\"");
  return line;
}

/// A line by its number, or by its text behind an equals sign.
ActionReader ControlAndLine(Verb verb) {
  return [verb](World& world, Arguments& arguments) {
    Action action = On(verb, TakeControl(arguments, world.GetScreens()));
    Arguments ahead = arguments;
    if (ahead.Word("a line").starts_with('=')) {
      const std::string text = arguments.RestAsName();
      action.numbers = {LineEqualTo(*action.control, text.substr(text.find('=') + 1))};
    } else {
      action.numbers = {arguments.Number("the line", 0)};
    }
    return action;
  };
}

/// A line that is named twice is marked once: the second click would unmark it.
Action ReadSelect(World& world, Arguments& arguments) {
  Action action = On(Verb::Select, TakeControl(arguments, world.GetScreens()));
  while (!arguments.AtEnd()) {
    const int line = arguments.Number("a line", 0);
    const auto& known = action.numbers;
    if (std::find(known.begin(), known.end(), line) == known.end()) action.numbers.push_back(line);
  }
  return action;
}

ActionReader ControlAndCell(Verb verb) {
  return [verb](World& world, Arguments& arguments) {
    Action action = On(verb, TakeControl(arguments, world.GetScreens()));
    const int row = arguments.Number("the row", 0);
    action.numbers = {row, arguments.Number("the column", 0)};
    return action;
  };
}

Action ReadPickedDate(World& world, Arguments& arguments) {
  Action action = On(Verb::PickDate, TakeControl(arguments, world.GetScreens()));
  action.date = arguments.Day("a date");
  return action;
}

constexpr std::array<std::pair<std::string_view, Key>, 7> kKeys = {{{"Enter", Key::Enter},
                                                                    {"Tab", Key::Tab},
                                                                    {"Shift+Tab", Key::BackTab},
                                                                    {"Esc", Key::Escape},
                                                                    {"Up", Key::Up},
                                                                    {"Down", Key::Down},
                                                                    {"F1", Key::F1}}};
constexpr std::string_view kAlt = "Alt+";

bool IsMnemonic(std::string_view word) {
  return word.size() == kAlt.size() + 1 && EqualsIgnoringCase(word.substr(0, kAlt.size()), kAlt);
}

Action ReadKey(World& /*world*/, Arguments& arguments) {
  const std::string word = arguments.Word("a key");
  Action action;
  if (IsMnemonic(word)) {
    action.verb = Verb::Mnemonic;
    action.letter = word.back();
    return action;
  }
  action.verb = Verb::Press;
  for (const auto& [name, key] : kKeys) {
    if (!EqualsIgnoringCase(name, word)) continue;
    action.key = key;
    return action;
  }
  arguments.Refuse("there is no key " + word);
}

Action ReadHover(World& world, Arguments& arguments) {
  const std::string name = arguments.Word("a control or screen");
  Action action;
  action.screen = world.GetScreens().Find(name);
  action.verb = action.screen != nullptr ? Verb::HoverScreen : Verb::Hover;
  if (action.screen == nullptr) action.control = &ControlNamed(name, world.GetScreens());
  arguments.About(action.screen != nullptr ? action.screen->Name() : action.control->Name());
  return action;
}

Action ReadClose(World& world, Arguments& arguments) {
  Action action;
  action.verb = Verb::CloseScreen;
  action.screen = &TakeScreen(arguments, world.GetScreens());
  return action;
}

void Perform(World& world, const Action& action, Json& answer) {
  Outcome outcome;
  const bool whole = world.Run([&] { outcome = world.GetFace().Perform(action); });
  if (!outcome.Done()) throw Refusal(outcome.refusal);
  if (!whole) answer = NotDone("a box kept coming back with no answer waiting for it");
  if (outcome.lost) answer["lost"] = true;
  world.log.MoveInto(answer);
}

void Add(CommandTable& table, const char* name, const ActionReader& read) {
  table[name] = [read](World& world, Arguments& arguments, Json& answer) {
    const Action action = read(world, arguments);
    arguments.Finish();
    Perform(world, action, answer);
  };
}

}  // namespace

void AddActing(CommandTable& table) {
  Add(table, "click", ControlAlone(Verb::Click));
  Add(table, "dblclick", ControlAlone(Verb::DoubleClick));
  Add(table, "type", ReadType);
  Add(table, "pick", ControlAndLine(Verb::Pick));
  Add(table, "select", ReadSelect);
  Add(table, "dblpick", ControlAndLine(Verb::PickTwice));
  Add(table, "cell", ControlAndCell(Verb::Cell));
  Add(table, "dblcell", ControlAndCell(Verb::DoubleCell));
  Add(table, "date", ReadPickedDate);
  Add(table, "key", ReadKey);
  Add(table, "focus", ControlAlone(Verb::Focus));
  Add(table, "hover", ReadHover);
  Add(table, "close", ReadClose);
}

}  // namespace marlowbeck
