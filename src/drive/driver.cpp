#include "drive/driver.h"

#include <exception>

#include "drive/refusal.h"

namespace marlowbeck {
namespace {

CommandTable AllCommands() {
  CommandTable table;
  AddActing(table);
  AddLooking(table);
  AddPreparing(table);
  AddPrinter(table);
  AddFaults(table);
  return table;
}

bool AnswersAfterTheEnd(const std::string& command) {
  return command == "screens" || command == "events";
}

}  // namespace

Json Done() { return Json::object({{"ok", true}}); }

Json NotDone(const std::string& why) { return {{"ok", false}, {"error", TextAsJson(why)}}; }

Driver::Driver(const WorldSettings& settings, const FaceMaker& make_face,
               const Program::Registration& registration)
    : commands_(AllCommands()), world_(settings, make_face, registration) {}

std::optional<Json> Driver::Answer(std::string_view line) {
  const std::optional<std::string> text = ReadScriptLine(line);
  if (!text) return std::nullopt;
  try {
    return Carry(*text);
  } catch (const Refusal& refusal) {
    return NotDone(refusal.what());
  } catch (const std::exception& fault) {
    // A fault of the program that no run-time error tells: the script goes on to show what is left.
    world_.GetProgram().GiveUpEvent();
    Json answer = NotDone(std::string("fault in the program: ") + fault.what());
    world_.log.MoveInto(answer);
    return answer;
  }
}

Json Driver::Carry(const std::string& line) {
  Arguments arguments(line);
  const auto command = commands_.find(arguments.Command());
  if (command == commands_.end()) {
    throw Refusal("there is no command \"" + arguments.Command() + "\"");
  }
  if (world_.Ended() && !AnswersAfterTheEnd(command->first)) {
    throw Refusal(command->first + ": the program has ended");
  }
  Json answer = Done();
  command->second(world_, arguments, answer);
  return answer;
}

}  // namespace marlowbeck
