#include "drive/face.h"

namespace marlowbeck {

// Stands in for the windows where the driver is built without them.
std::unique_ptr<Face> MakeWindowFace(BoxAnswers& /*answers*/, int& /*argc*/, char** /*argv*/) {
  return nullptr;
}

}  // namespace marlowbeck
