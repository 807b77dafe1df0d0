#include <QApplication>
#include <QDir>
#include <QStandardPaths>
#include <QTemporaryFile>

#include "desktop/desktop.h"
#include "desktop/encoding.h"
#include "desktop/theme.h"

namespace {

bool CanBeWritten(const QString& folder) {
  QTemporaryFile file(QDir(folder).filePath("marlowbeck-XXXXXX.tmp"));
  return file.open();
}

/// The program's own folder, or, where that is read only, one for the user's data.
QString WorkingFolder() {
  QString own = QApplication::applicationDirPath();
  if (CanBeWritten(own)) return own;
  QString data = QStandardPaths::writableLocation(QStandardPaths::AppDataLocation);
  QDir().mkpath(data);
  return data;
}

}  // namespace

int main(int argc, char** argv) {
  QApplication application(argc, argv);
  QApplication::setApplicationName("Marlowbeck");
  QApplication::setApplicationVersion("4.2");
  marlowbeck::ApplyTheme();
  const QString folder = QDir::toNativeSeparators(WorkingFolder());
  marlowbeck::Desktop desktop(marlowbeck::FromQt(folder), QApplication::applicationDirPath());
  return desktop.Start() ? QApplication::exec() : 0;
}
