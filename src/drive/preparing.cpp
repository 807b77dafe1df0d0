#include <array>
#include <string_view>
#include <utility>

#include "drive/command_table.h"

namespace marlowbeck {
namespace {

constexpr std::array<std::pair<std::string_view, int>, 4> kButtons = {
    {{"ok", kAnswerOk}, {"cancel", kAnswerCancel}, {"yes", kAnswerYes}, {"no", kAnswerNo}}};

void PrepareMessage(World& world, Arguments& arguments, Json& /*answer*/) {
  const std::string word = arguments.Word("a button: ok, cancel, yes or no");
  arguments.Finish();
  for (const auto& [name, number] : kButtons) {
    if (name == word) return world.answers.messages.Add(number);
  }
  arguments.Refuse("there is no button " + word);
}

void PrepareInput(World& world, Arguments& arguments, Json& /*answer*/) {
  world.answers.inputs.Add(arguments.TypedName());
}

void PrepareFile(World& world, Arguments& arguments, Json& /*answer*/) {
  if (arguments.AtEnd()) arguments.Refuse("needs a path");
  world.answers.files.Add(arguments.Rest());
}

bool TakeTruth(Arguments& arguments, std::string_view what) {
  const int number = arguments.Number(what, 0);
  if (number > 1) arguments.Refuse(std::string(what) + " is 0 or 1");
  return number == 1;
}

void PrepareFont(World& world, Arguments& arguments, Json& /*answer*/) {
  FontChoice font;
  font.size = arguments.Number("the size", 1);
  font.bold = TakeTruth(arguments, "bold");
  font.italic = TakeTruth(arguments, "italic");
  if (arguments.AtEnd()) arguments.Refuse("needs a name");
  font.name = arguments.Rest();
  world.answers.fonts.Add(font);
}

void PrepareSetup(World& world, Arguments& arguments, Json& /*answer*/) {
  const Orientation orientation = TakeOrientation(arguments);
  arguments.Finish();
  world.answers.setups.Add(orientation);
}

/// A command that cancels the next dialog of a kind.
template <typename T>
DriveCommand Cancel(AnswerQueue<T> ScriptAnswers::*queue) {
  return [queue](World& world, Arguments& arguments, Json& /*answer*/) {
    arguments.Finish();
    (world.answers.*queue).Add(std::nullopt);
  };
}

void TellWaiting(World& world, Arguments& arguments, Json& answer) {
  arguments.Finish();
  const ScriptAnswers& answers = world.answers;
  answer["waiting"] = {{"answer", answers.messages.Waiting()},
                       {"input", answers.inputs.Waiting()},
                       {"file", answers.files.Waiting()},
                       {"font", answers.fonts.Waiting()},
                       {"setup", answers.setups.Waiting()}};
}

void Forget(World& world, Arguments& arguments, Json& /*answer*/) {
  arguments.Finish();
  world.answers.Forget();
}

}  // namespace

Orientation TakeOrientation(Arguments& arguments) {
  const std::string word = arguments.Word("portrait or landscape");
  if (word == "portrait") return Orientation::Portrait;
  if (word == "landscape") return Orientation::Landscape;
  arguments.Refuse("there is no orientation " + word);
}

void AddPreparing(CommandTable& table) {
  table["answer"] = PrepareMessage;
  table["input"] = PrepareInput;
  table["input-cancel"] = Cancel(&ScriptAnswers::inputs);
  table["file"] = PrepareFile;
  table["file-cancel"] = Cancel(&ScriptAnswers::files);
  table["font"] = PrepareFont;
  table["font-cancel"] = Cancel(&ScriptAnswers::fonts);
  table["setup"] = PrepareSetup;
  table["setup-cancel"] = Cancel(&ScriptAnswers::setups);
  table["waiting"] = TellWaiting;
  table["forget"] = Forget;
}

}  // namespace marlowbeck
