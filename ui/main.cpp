#include "platform/qt_paths.h"
#include "ui/run_selector.h"

#include <QApplication>

int main(int argc, char *argv[]) {
  QApplication app(argc, argv);
  return RunSelector(ToPath(QCoreApplication::applicationDirPath()));
}
