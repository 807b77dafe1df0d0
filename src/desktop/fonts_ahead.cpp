#include "desktop/fonts_ahead.h"

#include <QLibrary>

namespace marlowbeck {

FontsAhead::FontsAhead() {
#ifdef Q_OS_LINUX
  // The toolkit stands on this library already; it is found, not linked. It is looked for here: the
  // first thread to use the toolkit is taken for its main one.
  using FcInit = int (*)();
  const auto init = reinterpret_cast<FcInit>(QLibrary::resolve("fontconfig", 1, "FcInit"));
  if (init != nullptr) reader_ = std::jthread([init] { init(); });
#endif
}

void FontsAhead::Wait() {
  if (reader_.joinable()) reader_.join();
}

}  // namespace marlowbeck
