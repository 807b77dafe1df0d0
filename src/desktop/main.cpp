#include <QApplication>
#include <QStandardPaths>

#include "desktop/desktop.h"
#include "desktop/fonts_ahead.h"
#include "desktop/theme.h"
#include "desktop/working_folder.h"

int main(int argc, char** argv) {
  marlowbeck::FontsAhead fonts;
  QApplication application(argc, argv);
  QApplication::setApplicationName("Marlowbeck");
  QApplication::setApplicationVersion("4.2");
  marlowbeck::ApplyTheme();
  const QString own = QApplication::applicationDirPath();
  const QString data = QStandardPaths::writableLocation(QStandardPaths::AppDataLocation);
  marlowbeck::Desktop desktop(marlowbeck::WorkingFolder(own, data), own);
  return desktop.Start([&fonts] { fonts.Wait(); }) ? QApplication::exec() : 0;
}
