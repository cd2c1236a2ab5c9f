// take_screenshots <game folder> <output folder>: starts the window on a game folder and saves a
// picture of each tab page, for the README.
#include "platform/qt_paths.h"
#include "ui/main_window.h"
#include "ui/window_caption.h"

#include <QAction>
#include <QApplication>
#include <QContextMenuEvent>
#include <QDialog>
#include <QDir>
#include <QElapsedTimer>
#include <QLabel>
#include <QListWidget>
#include <QMenu>
#include <QMouseEvent>
#include <QPainter>
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

constexpr char kLargeAddon[] = "T-Big Terrain";
constexpr char kBigFile[] = "terrain.dat";

// A folder with one big file, large enough that its copy can be caught half way, and small ones.
void MakeLargeAddon(const std::filesystem::path &game) {
  const std::filesystem::path folder = game / "ZEP128" / kLargeAddon;
  std::filesystem::create_directories(folder);
  const std::string chunk(1 << 20, 'x');
  std::ofstream big(folder / kBigFile, std::ios::binary);
  for (int n = 0; n < 400; ++n)
    big << chunk;
  for (int n = 0; n < 20; ++n)
    std::ofstream(folder / ("part" + std::to_string(n) + ".dat"), std::ios::binary) << "x";
}

// Clicks the large folder's row, grabs the window while the big file is half copied and once
// more after the load.
bool SaveLoad(MainWindow &window, QTabWidget &tabs, const QDir &output) {
  tabs.setCurrentIndex(1);
  auto *grid = window.findChild<QTableView *>("Unigrid");
  const QModelIndexList found = grid->model()->match(grid->model()->index(0, 1), Qt::DisplayRole,
                                                     kLargeAddon, 1, Qt::MatchExactly);
  if (found.isEmpty())
    return false;
  grid->scrollTo(found.front());
  Settle();
  bool saved = false;
  auto *progress = window.findChild<QLabel *>("Label22");
  int bigShown = 0;
  const QMetaObject::Connection connection = QObject::connect(
      window.findChild<WindowCaption *>("caption"), &WindowCaption::ProgressShown, [&] {
        if (!window.windowTitle().contains(kBigFile) || ++bigShown != 2)
          return;
        progress->repaint();
        saved = Save(window, output, "load-in-progress.png");
      });
  emit grid->clicked(found.front());
  QObject::disconnect(connection);
  Settle();
  return Save(window, output, "load-summary.png") && saved;
}

void WriteFile(const std::filesystem::path &path, const std::string &bytes) {
  std::filesystem::create_directories(path.parent_path());
  std::ofstream(path, std::ios::binary) << bytes;
}

// A folder whose files stand in every state the files dialog shows, and three setups.
void MakeSetupsExample(const std::filesystem::path &game) {
  const std::filesystem::path library = game / "ZEP128";
  WriteFile(game / "bases.dat", "the game's own bases");
  for (const char *file : {"sky.spt", "horizon.spt", "bases.dat", "dusk.pal", "Dusk Patrol.msn"})
    WriteFile(library / "G-Dusk Sky" / file, file);
  const std::filesystem::path setups = library / "#Selector" / "setups";
  WriteFile(setups / "Evening flying.txt", "G-Dusk Sky\r\nH-Evening Haze\r\nN-Engine Hum\r\n");
  WriteFile(setups / "Channel Summer campaign.txt",
            "C-Channel Summer\r\nS-Autumn Camouflage\r\nN-Gun Bursts\r\n");
  WriteFile(setups / "Before Reset All.txt", "U-Grass Airfields\r\nR-Thin Cirrus\r\n");
}

QModelIndex RowNamed(QTableView *grid, const char *name) {
  const QModelIndexList found =
      grid->model()->match(grid->model()->index(0, 1), Qt::DisplayRole, name, 1, Qt::MatchExactly);
  return found.isEmpty() ? QModelIndex() : found.front();
}

// Adds the example and refreshes the grid, loads two of its folders, opens the grid's menu on one
// with its "Switch to setup" entry open and grabs the window with both menus over it; then opens
// that folder's files and grabs the dialog.
bool SaveSetupPictures(MainWindow &window, const QDir &output) {
  const std::filesystem::path game = ToPath(window.findChild<QLabel *>("EAWDirLabel")->text());
  MakeSetupsExample(game);
  QMouseEvent refresh(QEvent::MouseButtonRelease, QPointF(5, 5), QPointF(5, 5), Qt::LeftButton,
                      Qt::NoButton, Qt::NoModifier);
  QApplication::sendEvent(window.findChild<QLabel *>("Label33"), &refresh);
  auto *grid = window.findChild<QTableView *>("Unigrid");
  for (const char *name : {"G-Dusk Sky", "H-Evening Haze"})
    emit grid->clicked(RowNamed(grid, name));
  std::filesystem::remove(game / "dusk.pal");
  Settle();
  const QModelIndex row = RowNamed(grid, "G-Dusk Sky");
  grid->scrollTo(row);
  const QPoint at = grid->visualRect(row).center();
  QContextMenuEvent click(QContextMenuEvent::Mouse, at, grid->viewport()->mapToGlobal(at));
  QApplication::sendEvent(grid->viewport(), &click);
  auto *menu = window.findChild<QMenu *>("FolderGridMenu");
  if (menu == nullptr)
    return false;
  Settle();
  QMenu *setups = nullptr;
  for (QAction *action : menu->actions())
    if (action->text() == "Switch to setup") {
      menu->setActiveAction(action);
      setups = action->menu();
    }
  if (setups == nullptr)
    return false;
  setups->popup(menu->geometry().topRight() +
                QPoint(0, menu->actionGeometry(menu->activeAction()).y()));
  Settle();
  QPixmap picture = window.grab();
  QPainter painter(&picture);
  for (QMenu *shown : {menu, setups})
    painter.drawPixmap(window.mapFromGlobal(shown->pos()), shown->grab());
  painter.end();
  const QString path = output.filePath("context-menu.png");
  if (!picture.save(path, "PNG"))
    return false;
  std::cout << "take_screenshots: saved " << path.toStdString() << "\n";
  menu->actions().front()->trigger();
  menu->close();
  Settle();
  auto *dialog = window.findChild<QDialog *>("FolderFilesDialog");
  return dialog != nullptr && Save(*dialog, output, "files-dialog.png");
}

// Switches the music to the first set listed and grabs the line that says so.
bool SaveMusicSwitch(MainWindow &window, const QDir &output) {
  auto *music = window.findChild<QListWidget *>("List4");
  if (music == nullptr || music->count() == 0)
    return false;
  emit music->itemClicked(music->item(0));
  Settle();
  return Save(window, output, "music-summary.png");
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
  saved = SaveSetupPictures(window, output) && saved;
  saved = SaveMusicSwitch(window, output) && saved;
  return saved ? 0 : 1;
}
