#include "program/register_screens.h"

#include <memory>

#include "session/frmErrors.h"

namespace marlowbeck {
namespace {

template <typename S>
void Register(Screens& screens, const char* name, const Context& context) {
  screens.Register(name, [&context](Screens& in) { return std::make_unique<S>(in, context); });
}

}  // namespace

void RegisterScreens(Screens& screens, const Context& context) {
  Register<frmErrors>(screens, "frmErrors", context);
}

}  // namespace marlowbeck
