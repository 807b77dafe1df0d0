#include "session/forfeits_choice.h"

#include "data/side_file.h"

namespace marlowbeck {
namespace {

constexpr const char* kForfeitsFile = "Forfeits.qz3";

}  // namespace

bool ReadForfeitsIncluded(const Context& context) {
  context.GoToWorkingFolder();
  try {
    context.channels.OpenInput(Channel::GameNames, kForfeitsFile);
    const double answer = context.channels.Reader(Channel::GameNames).Number();
    context.channels.Close(Channel::GameNames);
    return answer != 0;
  } catch (const RunTimeError& error) {
    if (!SideFileIsAtFault(error)) throw;
    context.channels.AbandonAll();
    WriteForfeitsIncluded(context, true);
    return true;
  }
}

void WriteForfeitsIncluded(const Context& context, bool included) {
  context.GoToWorkingFolder();
  context.channels.OpenOutput(Channel::GameNames, kForfeitsFile, Keeping::Lasting);
  context.channels.Writer(Channel::GameNames).PlainLine(included ? "1" : "0");
  context.channels.Close(Channel::GameNames);
}

}  // namespace marlowbeck
