#include "platform/instance_lock.h"
#include "platform/qt_paths.h"

#include <QApplication>
#include <QThread>
#include <cstdio>
#include <cstring>
#include <gtest/gtest.h>

// The window tests need one application object for the whole run. Started with
// "--hold-instance-lock FOLDER", the program is instead an instance that holds the folder's lock
// until it is killed.
int main(int argc, char **argv) {
  if (argc == 3 && std::strcmp(argv[1], "--hold-instance-lock") == 0) {
    const InstanceLock lock(ToPath(QString::fromLocal8Bit(argv[2])));
    std::puts(lock.Acquired() ? "held" : "refused");
    std::fflush(stdout);
    for (;;)
      QThread::sleep(60);
  }
  qputenv("QT_QPA_PLATFORM", "offscreen");
  QApplication app(argc, argv);
  ::testing::InitGoogleTest(&argc, argv);
  return RUN_ALL_TESTS();
}
