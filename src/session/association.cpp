#include "session/association.h"

#include "data/competition.h"
#include "data/text.h"

namespace marlowbeck {
namespace {

constexpr const char* kAssociationFile = "Association.qz3";

}  // namespace

void LoadAssociationName(const Context& context) {
  try {
    context.session.AssociationName = ReadOneString(context.channels, kAssociationFile);
  } catch (const RunTimeError&) {
    context.channels.AbandonAll();
    context.session.AssociationName.clear();
  }
}

void AskAssociationName(const Context& context) {
  const std::string reply = context.platform.boxes.Input({"Enter the name of your Association.",
                                                          "Association Name",
                                                          context.session.AssociationName,
                                                          {}});
  if (Trimmed(reply).empty()) return;
  context.GoToWorkingFolder();
  WriteOneString(context.channels, kAssociationFile, reply);
  context.session.AssociationName = reply;
}

}  // namespace marlowbeck
