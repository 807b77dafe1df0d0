// What the start of the program is measured against: a window with nothing in it, and no library
// but those that a window needs.

#include <QApplication>
#include <QMainWindow>

#include "bench/first_paint.h"

int main(int argc, char** argv) {
  QApplication application(argc, argv);
  marlowbeck::bench::EndAfterFirstPaint end;
  application.installEventFilter(&end);
  QMainWindow window;
  window.resize(800, 600);
  window.show();
  return QApplication::exec();
}
