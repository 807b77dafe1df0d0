#include "support/sample.h"

#include <fstream>
#include <iterator>

namespace marlowbeck {

void LaySample(Club& club) {
  for (const auto& entry : std::filesystem::directory_iterator(MARLOWBECK_SOURCE_DIR "/samples")) {
    if (entry.path().extension() == ".drive") continue;
    std::ifstream file(entry.path(), std::ios::binary);
    club.WriteFile(entry.path().filename().string(),
                   std::string(std::istreambuf_iterator<char>(file), {}));
  }
  club.NameOpenFile("Winter.qza");
}

}  // namespace marlowbeck
