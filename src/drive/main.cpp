#include <cstdlib>
#include <iostream>
#include <string>

#include "drive/driver.h"
#include "drive/options.h"

namespace {

using marlowbeck::BoxAnswers;
using marlowbeck::DriveOptions;
using marlowbeck::Driver;
using marlowbeck::FaceMaker;

constexpr int kSenseless = 2;

/// Windows were asked for where there are none.
struct NoWindows {};

FaceMaker FaceFor(const DriveOptions& options, int& argc, char** argv) {
  if (!options.window) return marlowbeck::MakeModelFace;
  return [&argc, argv](BoxAnswers& answers) {
    auto face = marlowbeck::MakeWindowFace(answers, argc, argv);
    if (!face) throw NoWindows{};
    return face;
  };
}

/// Answers every line of standard input, at once.
void Run(Driver& driver) {
  std::string line;
  while (std::getline(std::cin, line)) {
    if (const auto answer = driver.Answer(line)) std::cout << answer->dump() << std::endl;
  }
}

}  // namespace

int main(int argc, char** argv) {
  int exit_status = 0;
  const auto options = marlowbeck::ReadOptions(argc, argv, exit_status);
  if (!options) return exit_status;
  try {
    Driver driver(options->world, FaceFor(*options, argc, argv));
    Run(driver);
    // As if the power had gone: none of the program's closing steps are run.
    std::_Exit(EXIT_SUCCESS);
  } catch (const NoWindows&) {
    std::cerr << "--window: this driver was built without windows\n";
    return kSenseless;
  }
}
