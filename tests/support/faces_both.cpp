#include "drive/workbench_forms.h"
#include "support/club.h"

namespace marlowbeck {

std::vector<TestFace> FacesUnderTest() {
  static int argc = 1;
  static char name[] = "marlowbeck_window_tests";
  static char* argv[] = {name, nullptr};
  AddWorkbenchForms();
  std::vector<TestFace> faces = ModelFaceAlone();
  faces.push_back(
      {"windows", [](BoxAnswers& answers) { return MakeWindowFace(answers, argc, argv); }});
  return faces;
}

}  // namespace marlowbeck
