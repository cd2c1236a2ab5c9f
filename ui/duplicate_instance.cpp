#include "ui/duplicate_instance.h"

#include <QCoreApplication>
#include <QMessageBox>

QString DuplicateInstanceTitle() { return "Hang On" + QString(11, '.'); }

QString DuplicateInstanceText() {
  return "We know you would love our software, but you really \r\n"
         "don't have to run it more than once.\r\n"
         "\r\n"
         "You have probably minimised a version already running,\r\n"
         "and it has been waiting patiently for you \r\n"
         "at the bottom of your screen!";
}

void ShowDuplicateInstanceMessage() {
  QCoreApplication::setApplicationName("... duplicate instance.");
  QMessageBox box(QMessageBox::Warning, DuplicateInstanceTitle(), DuplicateInstanceText(),
                  QMessageBox::Ok);
  box.setObjectName("DuplicateInstanceBox");
  box.exec();
}
