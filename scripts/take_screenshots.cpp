// take_screenshots <game folder> <output folder>: starts the window on a game folder and saves a
// picture of each tab page, for the README.
#include "ui/main_window.h"

#include <QApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QTabWidget>
#include <QTableView>
#include <QTimer>

#include <filesystem>
#include <fstream>
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

bool Save(QWidget &window, const QDir &output, const char *file) {
  const QString path = output.filePath(file);
  if (!window.grab().save(path, "PNG")) {
    std::cerr << "take_screenshots: cannot save " << path.toStdString() << "\n";
    return false;
  }
  std::cout << "take_screenshots: saved " << path.toStdString() << "\n";
  return true;
}

bool SavePage(MainWindow &window, QTabWidget &tabs, const Page &page, const QDir &output) {
  tabs.setCurrentIndex(page.index);
  Settle();
  return Save(window, output, page.file);
}

// A folder large enough that its load can be caught half way.
void MakeLargeAddon(const std::filesystem::path &game) {
  const std::filesystem::path folder = game / "ZEP128" / "S-Thousands of Small Files";
  std::filesystem::create_directories(folder);
  const std::string bytes(64 * 1024, 'x');
  for (int n = 0; n < 3000; ++n)
    std::ofstream(folder / ("part" + std::to_string(n) + ".dat"), std::ios::binary) << bytes;
}

// Clicks the large folder's row, grabs the window while it loads and once more after.
bool SaveLoad(MainWindow &window, QTabWidget &tabs, const QDir &output) {
  tabs.setCurrentIndex(1);
  auto *grid = window.findChild<QTableView *>("Unigrid");
  const QModelIndexList found =
      grid->model()->match(grid->model()->index(0, 1), Qt::DisplayRole,
                           "S-Thousands of Small Files", 1, Qt::MatchExactly);
  if (found.isEmpty())
    return false;
  grid->scrollTo(found.front());
  Settle();
  bool saved = false;
  QTimer::singleShot(250, [&] { saved = Save(window, output, "load-in-progress.png"); });
  emit grid->clicked(found.front());
  Settle();
  return Save(window, output, "load-summary.png") && saved;
}

} // namespace

int main(int argc, char *argv[]) {
  QApplication app(argc, argv);
  if (argc != 3) {
    std::cerr << "usage: take_screenshots <game folder> <output folder>\n";
    return 2;
  }
  const QDir output(QString::fromLocal8Bit(argv[2]));
  MakeLargeAddon(argv[1]);
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
  saved = SaveLoad(window, *tabs, output) && saved;
  return saved ? 0 : 1;
}
