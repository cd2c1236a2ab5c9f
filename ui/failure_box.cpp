#include "ui/failure_box.h"

#include "platform/qt_paths.h"
#include "ui/window_layout.h"

#include <QMessageBox>

void ShowFailures(QWidget *parent, const Failures &failures, const QString &heading) {
  if (failures.Empty())
    return;
  // A disk that fails half-way through a big folder names every file; the box shows the first
  // few and keeps the whole list under "Show Details".
  constexpr size_t kShownLines = 12;
  const std::vector<std::string> &lines = failures.Lines();
  QString text = heading;
  for (size_t i = 0; i < lines.size() && i < kShownLines; ++i)
    text += "\n" + FromName(lines[i]);
  auto *box = new QMessageBox(QMessageBox::Warning, WindowCaptionText().simplified(), text,
                              QMessageBox::Ok, parent);
  if (lines.size() > kShownLines) {
    box->setText(text + QString("\n... and %1 more.").arg(lines.size() - kShownLines));
    box->setDetailedText(FromName(failures.Message(heading.toStdString())));
  }
  box->setAttribute(Qt::WA_DeleteOnClose);
  box->open();
}
