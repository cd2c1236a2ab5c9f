#include "ui/run_selector.h"

#include "platform/instance_lock.h"
#include "ui/duplicate_instance.h"
#include "ui/main_window.h"

#include <QApplication>

int RunSelector(const std::filesystem::path &eawDir) {
  InstanceLock lock(eawDir);
  if (!lock.Acquired()) {
    ShowDuplicateInstanceMessage();
    return 0;
  }
  MainWindow window(eawDir);
  window.FormLoad();
  window.show();
  return QApplication::exec();
}
