#include <QApplication>
#include <gtest/gtest.h>

#include "desktop/theme.h"

int main(int argc, char** argv) {
  if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM")) qputenv("QT_QPA_PLATFORM", "offscreen");
  testing::InitGoogleTest(&argc, argv);
  QApplication application(argc, argv);
  marlowbeck::ApplyTheme();
  return RUN_ALL_TESTS();
}
