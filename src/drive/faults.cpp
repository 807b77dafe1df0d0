#include <optional>
#include <string_view>

#include "drive/command_table.h"

namespace marlowbeck {
namespace {

/// The operation that a word names; nothing for any.
std::optional<FileOperation> OperationOf(const std::string& word, const Arguments& arguments) {
  if (word == "any") return std::nullopt;
  const auto operation = FileOperationFromWord(word);
  if (!operation) arguments.Refuse("there is no operation " + word);
  return operation;
}

void Crash(World& world, Arguments& arguments) {
  const auto operation = OperationOf(arguments.Word("an operation"), arguments);
  const int nth = arguments.Number("N", 1);
  arguments.Finish();
  world.Faults().CrashAt(operation, nth);
}

void Cut(World& world, Arguments& arguments) {
  const int nth = arguments.Number("N", 1);
  const int bytes = arguments.Number("BYTES", 0);
  const int number = arguments.Number("NUMBER", 1);
  arguments.Finish();
  world.Faults().CutAt(nth, static_cast<std::size_t>(bytes), number);
}

void Count(World& world, Arguments& arguments, Json& answer) {
  arguments.Finish();
  Json& operations = answer["operations"] = Json::object();
  for (std::size_t i = 0; i < kFileOperations; ++i) {
    const auto operation = static_cast<FileOperation>(i);
    operations[std::string(WordOf(operation))] = world.Faults().Done(operation);
  }
}

/// N, or N+ for all that follow too.
int TakeNth(Arguments& arguments, bool& and_after) {
  std::string word = arguments.Word("N");
  and_after = word.ends_with('+');
  if (and_after) word.pop_back();
  const auto nth = WholeNumber(word);
  if (!nth || *nth < 1) arguments.Refuse("needs a number for N, not \"" + word + "\"");
  return *nth;
}

void Fail(World& world, Arguments& arguments, const std::string& word) {
  const auto operation = OperationOf(word, arguments);
  bool and_after = false;
  const int nth = TakeNth(arguments, and_after);
  const int number = arguments.Number("NUMBER", 1);
  arguments.Finish();
  world.Faults().FailAt(operation, nth, number, and_after);
}

void SetFault(World& world, Arguments& arguments, Json& answer) {
  const std::string word = arguments.Word("an operation, cut, crash, count or off");
  if (word == "crash") return Crash(world, arguments);
  if (word == "cut") return Cut(world, arguments);
  if (word == "count") return Count(world, arguments, answer);
  if (word != "off") return Fail(world, arguments, word);
  arguments.Finish();
  world.Faults().Off();
}

void SetClock(World& world, Arguments& arguments, Json& /*answer*/) {
  const Date today = arguments.Day("a date");
  arguments.Finish();
  world.clock.Set(today);
}

}  // namespace

void AddFaults(CommandTable& table) {
  table["fault"] = SetFault;
  table["clock"] = SetClock;
}

}  // namespace marlowbeck
