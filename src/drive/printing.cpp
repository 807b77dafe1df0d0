#include "drive/command_table.h"

namespace marlowbeck {
namespace {

int LastNumber(Arguments& arguments, std::string_view what) {
  const int number = arguments.Number(what, 1);
  arguments.Finish();
  return number;
}

void SetPrinter(World& world, Arguments& arguments, Json& /*answer*/) {
  const std::string what = arguments.Word("width, height, name, orientation or fail");
  PageRecorder& printer = world.printer;
  if (what == "width") return printer.SetPageWidth(LastNumber(arguments, "the width"));
  if (what == "height") return printer.SetPageHeight(LastNumber(arguments, "the height"));
  if (what == "fail") return printer.FailAt(LastNumber(arguments, "the operation"));
  if (what == "name") return printer.SetDeviceName(arguments.Rest());
  if (what != "orientation") arguments.Refuse("there is no " + what + " to set");
  const Orientation orientation = TakeOrientation(arguments);
  arguments.Finish();
  printer.SetOrientation(orientation);
}

}  // namespace

void AddPrinter(CommandTable& table) { table["printer"] = SetPrinter; }

}  // namespace marlowbeck
