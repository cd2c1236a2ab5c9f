// take_screenshots <game folder> <output folder>: starts the window on a game folder and saves a
// picture of each tab page, for the README.
#include "ui/main_window.h"

#include <QApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QTabWidget>

#include <filesystem>
#include <iostream>

namespace {

struct Page {
  int index;
  const char *file;
};

const Page kPages[] = {{0, "page-general-settings.png"}, {1, "page-world-settings.png"}};

// Lets the window lay itself out and paint before it is grabbed.
void Settle() {
  QElapsedTimer timer;
  timer.start();
  while (timer.elapsed() < 300)
    QApplication::processEvents(QEventLoop::AllEvents, 50);
}

bool SavePage(MainWindow &window, QTabWidget &tabs, const Page &page, const QDir &output) {
  tabs.setCurrentIndex(page.index);
  Settle();
  const QString path = output.filePath(page.file);
  if (!window.grab().save(path, "PNG")) {
    std::cerr << "take_screenshots: cannot save " << path.toStdString() << "\n";
    return false;
  }
  std::cout << "take_screenshots: saved " << path.toStdString() << "\n";
  return true;
}

} // namespace

int main(int argc, char *argv[]) {
  QApplication app(argc, argv);
  if (argc != 3) {
    std::cerr << "usage: take_screenshots <game folder> <output folder>\n";
    return 2;
  }
  const QDir output(QString::fromLocal8Bit(argv[2]));
  MainWindow window{std::filesystem::path(argv[1])};
  window.FormLoad();
  window.show();
  auto *tabs = window.findChild<QTabWidget *>("SSTab1");
  if (tabs == nullptr) {
    std::cerr << "take_screenshots: the window has no tab control SSTab1\n";
    return 1;
  }
  bool saved = true;
  for (const Page &page : kPages)
    saved = SavePage(window, *tabs, page, output) && saved;
  return saved ? 0 : 1;
}
