#include "drive/workbench.h"

#include "session/frmErrors.h"

namespace marlowbeck {

Screens::Factory WorkbenchTest::MakeErrors(const Context& context) {
  return [&context](Screens& in) { return std::make_unique<frmErrors>(in, context); };
}

}  // namespace marlowbeck
