#include "support/club.h"

namespace marlowbeck {

std::vector<TestFace> FacesUnderTest() { return ModelFaceAlone(); }

}  // namespace marlowbeck
