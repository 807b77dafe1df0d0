#include <iostream>
#include <string_view>

#include <QApplication>
#include <gtest/gtest.h>

#include "desktop/services.h"
#include "desktop/theme.h"

int main(int argc, char** argv) {
  if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
  testing::InitGoogleTest(&argc, argv);
  QApplication application(argc, argv);
  // Asked by a test that cannot change the scale of the display it runs on.
  if (argc > 1 && argv[1] == std::string_view("--tell-width")) {
    std::cout << marlowbeck::DesktopDisplay([] {}).WidthInTwips() << "\n";
    return 0;
  }
  marlowbeck::ApplyTheme();
  return RUN_ALL_TESTS();
}
