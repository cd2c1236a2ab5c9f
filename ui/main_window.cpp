#include "ui/main_window.h"

#include "app/existence.h"
#include "app/names.h"
#include "app/startup.h"
#include "library/category_view.h"
#include "library/grid_click.h"
#include "library/loaded_record.h"
#include "library/preview.h"
#include "library/record_replay.h"
#include "library/refresh.h"
#include "library/reset_all.h"
#include "settings/eaw_ini.h"
#include "settings/game_start_qt.h"
#include "settings/ini_editor.h"
#include "settings/music_sets.h"
#include "settings/music_switch.h"
#include "ui/folder_grid_model.h"
#include "ui/picture.h"
#include "ui/qt_paths.h"
#include "ui/slot_grid_view.h"
#include "ui/twips.h"
#include "ui/window_icon.h"

#include <QGuiApplication>
#include <QHeaderView>
#include <QKeyEvent>
#include <QMessageBox>
#include <QMouseEvent>
#include <QScreen>
#include <QStyle>
#include <QTimer>

namespace fs = std::filesystem;

namespace {

// The picture file `name` of the game folder, whatever its letter case; empty when there is none.
fs::path GamePicture(const fs::path &eawDir, const char *name) {
  const fs::path picture = FindAnyCase(eawDir, name);
  FileCheck(picture);
  return FileFound ? picture : fs::path();
}

} // namespace

MainWindow::MainWindow(const fs::path &eawDir)
    : state_(StateFor(eawDir)), c_(BuildControls(this)), caption_(this),
      gridModel_(new FolderGridModel(state_.Unigrid, this)) {
  setObjectName("ZEPForm");
  setWindowTitle(WindowCaptionText());
  setWindowIcon(WindowIcon());
  c_.Unigrid->setModel(gridModel_);
  WireEvents();
}

// The widgets outlive the state they show by a moment: detach the grid from it first.
MainWindow::~MainWindow() { c_.Unigrid->setModel(nullptr); }

void MainWindow::WireEvents() {
  connect(c_.Command3, &QPushButton::clicked, this, &MainWindow::Command3_Click);
  connect(c_.Command8, &QPushButton::clicked, this, &MainWindow::Command8_Click);
  connect(c_.Command1, &QPushButton::clicked, this, &MainWindow::Command1_Click);
  connect(c_.Unigrid, &QTableView::clicked, this, &MainWindow::Unigrid_Click);
  connect(c_.List3, &QListWidget::currentRowChanged, this, &MainWindow::List3_Click);
  connect(c_.IniEdit, &QPushButton::clicked, this, &MainWindow::IniEdit_Click);
  connect(c_.InSaver, &QPushButton::clicked, this, &MainWindow::InSaver_Click);
  connect(c_.List4, &QListWidget::itemClicked, this, &MainWindow::List4_Click);
  connect(c_.delmsn, &QPushButton::clicked, this, &MainWindow::delmsn_Click);
  for (QLineEdit *box : SettingsBoxes())
    connect(box, &QLineEdit::returnPressed, this, &MainWindow::inisave);
  c_.Frame21->installEventFilter(this);
  c_.LoadFrame->installEventFilter(this);
  c_.List3->viewport()->installEventFilter(this);
  c_.Unigrid->installEventFilter(this);
  c_.Unigrid->viewport()->installEventFilter(this);
  c_.Unigrid->horizontalHeader()->installEventFilter(this);
  c_.Label33->installEventFilter(this);
}

void MainWindow::FormLoad() {
  Failures failures;
  c_.EAWDirLabel->setText(FromPath(state_.EAWDir));
  state_.Ready = false;
  const std::vector<SkippedLine> skipped = PrepareLibrary(state_, failures);
  if (QScreen *screen = QGuiApplication::primaryScreen()) {
    const QRect area = screen->geometry();
    move(area.x() + (area.width() - width()) / 2, area.y() + (area.height() - height()) / 2);
    const QSize pixels = area.size() * screen->devicePixelRatio();
    c_.Label18[0]->setText(QString::number(pixels.width()));
    c_.Label18[1]->setText(QString::number(pixels.height()));
  }
  c_.Label3->setText("Concept: by and for the players\r\n"
                     "Programmed in C++ with Qt\r\n");
  c_.List3->clear();
  for (const std::string &entry : state_.List3)
    c_.List3->addItem(FromName(entry));
  c_.Label1->setText(FromPath(state_.EAWDir / ""));
  IniRead();
  BuildGrid(state_, failures);
  ShowGridRows();
  EnsureRecord(state_, failures);
  ReplayRecord(state_, caption_, failures);
  state_.BackPic = GamePicture(state_.EAWDir, "background");
  ShowPicture(c_.MyImage, state_.BackPic);
  ShowPicture(c_.Image3, GamePicture(state_.EAWDir, "newpic"));
  c_.SSTab1->setCurrentIndex(0);
  c_.List3->setCurrentRow(0);
  List3_Click(0);
  state_.Ready = true;
  c_.SSTab1->setEnabled(true);
  ShowGridChanges();
  FillMusicList();
  if (!skipped.empty())
    failures.Add(SkippedLinesMessage(skipped));
  QTimer::singleShot(0, this, [this, failures] { Tell(failures, "Start-up could not do all:"); });
}

void MainWindow::Command3_Click() { close(); }

void MainWindow::Command8_Click() { showMinimized(); }

void MainWindow::ClearPreview() {
  c_.MyLabel->clear();
  ShowPicture(c_.MyImage, state_.BackPic);
}

void MainWindow::List3_Click(int k) {
  c_.Label6->setText(FromName(List3Click(state_, k)));
  c_.Label6->repaint();
  ShowGridChanges();
}

void MainWindow::Label33_Click() {
  Failures failures;
  Label33Click(state_, caption_, failures);
  ShowGridRows();
  ShowGridChanges();
  Tell(failures, "Refresh could not do all:");
}

void MainWindow::Command1_Click() {
  Failures failures;
  Command1Click(state_, caption_, failures);
  ShowGridChanges();
  Tell(failures, "Reset All could not delete these files:");
}

void MainWindow::Unigrid_MouseMove(int row) {
  if (!EnterHoverRow(state_, row))
    return;
  c_.MyLabel->clear();
  c_.Text9->clear();
  ShowPicture(c_.MyImage, state_.BackPic);
  const FolderPreview preview = PreviewOfRow(state_, row);
  const QString description = FromText(preview.description);
  c_.MyLabel->setText(description);
  c_.Text9->setPlainText(description);
  if (!preview.picture.empty()) {
    const QPixmap picture = LoadPicture(preview.picture, c_.MyImage->size());
    if (!picture.isNull())
      c_.MyImage->setPixmap(picture);
  }
}

std::array<QLineEdit *, 6> MainWindow::SettingsBoxes() const {
  return {c_.Text5, c_.Text6, c_.Text4, c_.Text7, c_.Text88, c_.Text11};
}

void MainWindow::IniRead() {
  Failures failures;
  const IniValues values = ::IniRead(state_.EAWDir, failures);
  const bool wasReady = state_.Ready;
  state_.Ready = false;
  const std::array<QLineEdit *, 6> boxes = SettingsBoxes();
  for (size_t key = 0; key < boxes.size(); ++key)
    if (values[key])
      boxes[key]->setText(FromName(*values[key]));
  state_.Ready = wasReady;
  Tell(failures, "The settings could not be read:");
}

void MainWindow::inisave() {
  IniTexts texts;
  const std::array<QLineEdit *, 6> boxes = SettingsBoxes();
  for (size_t key = 0; key < boxes.size(); ++key)
    texts[key] = ToName(boxes[key]->text());
  Failures failures;
  ::inisave(state_.EAWDir, state_.Ready, texts, failures);
  Tell(failures, "The settings could not be saved:");
}

void MainWindow::IniEdit_Click() {
  c_.Frame21->show();
  Failures failures;
  c_.Text14->setPlainText(FromText(IniDisplayText(state_.EAWDir, failures), &editorLatin1_));
  Tell(failures, "The settings file could not be shown:");
}

void MainWindow::InSaver_Click() {
  Failures failures;
  if (IniEditorSave(state_.EAWDir, ToText(c_.Text14->toPlainText(), editorLatin1_), failures))
    IniRead();
  Tell(failures, "The settings file could not be saved:");
}

void MainWindow::FillMusicList() {
  Failures failures;
  const MusicList music = ::FillMusicList(state_.EAWDir, failures);
  c_.List4->clear();
  for (const std::string &name : music.entries)
    c_.List4->addItem(FromName(name));
  if (music.current)
    c_.Label11->setText(FromName(*music.current));
  Tell(failures, "The music sets could not be read:");
}

void MainWindow::List4_Click(QListWidgetItem *item) {
  Failures failures;
  SwitchMusic(state_.EAWDir, ToName(c_.Label11->text()), ToName(item->text()), failures);
  FillMusicList();
  Tell(failures, "The music could not be switched:");
}

void MainWindow::delmsn_Click() {
  const std::string problem = StartGame(state_.EAWDir);
  if (!problem.empty()) {
    Failures failures;
    failures.Add(problem);
    Tell(failures, "The game could not be started:");
  }
}

void MainWindow::Unigrid_Click(const QModelIndex &index) {
  state_.Unigrid.currentRow = index.row() + 1;
  Failures failures;
  UnigridClick(state_, caption_, failures);
  ShowGridChanges();
  Tell(failures, "Some files could not be handled:");
}

void MainWindow::Unigrid_KeyPress(int key) {
  const QModelIndex current = c_.Unigrid->currentIndex();
  if (!current.isValid())
    return;
  state_.Unigrid.currentRow = current.row() + 1;
  Failures failures;
  UnigridKeyPress(state_, key, caption_, failures);
  ShowGridChanges();
  Tell(failures, "Some files could not be handled:");
}

bool MainWindow::eventFilter(QObject *watched, QEvent *event) {
  const bool moved = event->type() == QEvent::MouseMove;
  if (moved && (watched == c_.LoadFrame || watched == c_.List3->viewport())) {
    ClearPreview();
  } else if (moved && watched == c_.Unigrid->viewport()) {
    const int row = c_.Unigrid->rowAt(static_cast<QMouseEvent *>(event)->position().toPoint().y());
    if (row >= 0)
      Unigrid_MouseMove(row + 1);
  } else if (moved && watched == c_.Unigrid->horizontalHeader()) {
    Unigrid_MouseMove(0);
  } else if (watched == c_.Frame21 && (event->type() == QEvent::MouseButtonRelease ||
                                       event->type() == QEvent::MouseButtonDblClick)) {
    c_.Frame21->hide();
  } else if (watched == c_.Label33 && event->type() == QEvent::MouseButtonRelease) {
    Label33_Click();
  } else if (watched == c_.Unigrid && event->type() == QEvent::KeyPress) {
    auto *key = static_cast<QKeyEvent *>(event);
    if (key->key() == Qt::Key_Return || key->key() == Qt::Key_Enter) {
      Unigrid_KeyPress(kEnterKey);
      return true;
    }
    // Typed characters do nothing; arrow keys still move the current row.
    return !key->text().isEmpty();
  }
  return QWidget::eventFilter(watched, event);
}

void MainWindow::ShowGridRows() {
  gridModel_->Rebuilt();
  QTableView *grid = c_.Unigrid;
  grid->setColumnHidden(0, true);
  grid->setColumnWidth(1, TwipsToPixels(5000));
  grid->horizontalHeader()->setStretchLastSection(true);
  // The name column is wider than the grid, so the horizontal scroll bar is always there; its
  // height is added so that it covers no row.
  const int scrollBar = grid->style()->pixelMetric(QStyle::PM_ScrollBarExtent);
  const QRect place = grid->geometry();
  grid->setGeometry(place.x(), place.y(), place.width(),
                    TwipsToPixels(GridHeightTwips(state_.Unigrid.RowCount())) + scrollBar);
}

void MainWindow::ShowGridChanges() {
  QTableView *grid = c_.Unigrid;
  grid->setUpdatesEnabled(false);
  for (int row = 1; row < state_.Unigrid.RowCount(); ++row) {
    const bool hidden = state_.Unigrid.rows[static_cast<size_t>(row)].height == 0;
    if (grid->isRowHidden(row - 1) != hidden)
      grid->setRowHidden(row - 1, hidden);
  }
  gridModel_->Changed();
  const int current = state_.Unigrid.currentRow;
  if (current >= 1)
    grid->setCurrentIndex(gridModel_->index(current - 1, state_.Unigrid.currentCol));
  grid->setUpdatesEnabled(true);
  ShowSlotPanel();
}

void MainWindow::ShowSlotPanel() {
  const SlotPanel &panel = state_.Slots;
  c_.SlotFrame->setVisible(panel.frameVisible);
  c_.SlotLabel->setText(FromName(panel.label));
  c_.SlotGrid->setVisible(panel.gridVisible);
  FillSlotGrid(c_.SlotGrid, panel, QColor(kSlotFrameColour));
}

void MainWindow::ShowPicture(QLabel *label, const fs::path &picture) {
  label->setPixmap(picture.empty() ? QPixmap() : LoadPicture(picture, label->size()));
}

void MainWindow::Tell(const Failures &failures, const QString &heading) {
  if (failures.Empty())
    return;
  // A disk that fails half-way through a big folder names every file; the box shows the first
  // few and keeps the whole list under "Show Details".
  constexpr int kShownLines = 12;
  const std::vector<std::string> &lines = failures.Lines();
  QString text = heading;
  for (size_t i = 0; i < lines.size() && i < kShownLines; ++i)
    text += "\n" + FromName(lines[i]);
  auto *box = new QMessageBox(QMessageBox::Warning, WindowCaptionText().simplified(), text,
                              QMessageBox::Ok, this);
  if (lines.size() > kShownLines) {
    box->setText(text + QString("\n... and %1 more.").arg(lines.size() - kShownLines));
    box->setDetailedText(FromName(failures.Message(heading.toStdString())));
  }
  box->setAttribute(Qt::WA_DeleteOnClose);
  box->open();
}
