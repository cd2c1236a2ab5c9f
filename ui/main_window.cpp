#include "ui/main_window.h"

#include "platform/qt_paths.h"
#include "ui/event_hook.h"
#include "ui/failure_box.h"
#include "ui/folder_grid_model.h"
#include "ui/picture.h"
#include "ui/setup_menu.h"
#include "ui/slot_grid_view.h"
#include "ui/twips.h"
#include "ui/window_icon.h"

#include <QApplication>
#include <QGuiApplication>
#include <QHeaderView>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QScreen>
#include <QStyle>
#include <QTimer>
#include <utility>

namespace fs = std::filesystem;

MainWindow::MainWindow(const fs::path &eawDir)
    : c_(BuildControls(this)), caption_(this, c_.Label22), selector_(eawDir, caption_, starter_),
      gridModel_(new FolderGridModel(selector_.State().Unigrid, this)) {
  setObjectName("ZEPForm");
  setWindowTitle(WindowCaptionText());
  setWindowIcon(WindowIcon());
  c_.Unigrid->setModel(gridModel_);
  WireEvents();
  WireHooks();
  connect(new SetupMenu(selector_, runner_, c_.Unigrid, this), &SetupMenu::Changed, this,
          &MainWindow::ShowGridChanges);
  starter_.OnQuickFailure([this](const QString &program, const QString &status) {
    ShowNotice(this, ToName(program + " ended at once (" + status + "): the game did not start."));
  });
}

// The widgets outlive the state they show by a moment: detach the grid from it first.
MainWindow::~MainWindow() { c_.Unigrid->setModel(nullptr); }

void MainWindow::WireEvents() {
  connect(c_.Command3, &QPushButton::clicked, this, &MainWindow::Command3_Click);
  connect(c_.Command8, &QPushButton::clicked, this, &MainWindow::Command8_Click);
  connect(c_.Command1, &QPushButton::clicked, this, &MainWindow::Command1_Click);
  connect(c_.Unigrid, &QTableView::clicked, this, &MainWindow::Unigrid_Click);
  connect(c_.List3, &QListWidget::currentRowChanged, this, &MainWindow::List3_Click);
  // A click on the entry already selected shows its view again (after a Refresh, say).
  connect(c_.List3, &QListWidget::itemClicked, this,
          [this](QListWidgetItem *item) { List3_Click(c_.List3->row(item)); });
  connect(c_.IniEdit, &QPushButton::clicked, this, &MainWindow::IniEdit_Click);
  connect(c_.InSaver, &QPushButton::clicked, this, &MainWindow::InSaver_Click);
  connect(c_.List4, &QListWidget::itemClicked, this, &MainWindow::List4_Click);
  connect(c_.delmsn, &QPushButton::clicked, this, &MainWindow::delmsn_Click);
  for (QLineEdit *box : c_.SettingsBoxes)
    connect(box, &QLineEdit::returnPressed, this, &MainWindow::inisave);
}

// Events that the widgets have no signal for.
void MainWindow::WireHooks() {
  const auto clearOnMove = [this](QEvent *event) {
    if (event->type() == QEvent::MouseMove)
      ClearPreview();
    return false;
  };
  OnEvents(c_.LoadFrame, clearOnMove);
  OnEvents(c_.List3->viewport(), clearOnMove);
  OnEvents(c_.Unigrid->viewport(), [this](QEvent *event) {
    // The slot panel covers the description: it gives way while the pointer is over a row.
    if (event->type() == QEvent::Leave)
      c_.SlotFrame->setVisible(State().Slots.frameVisible);
    if (event->type() != QEvent::MouseMove)
      return false;
    const int y = static_cast<QMouseEvent *>(event)->position().toPoint().y();
    const int row = c_.Unigrid->rowAt(y);
    if (row >= 0)
      Unigrid_MouseMove(row);
    return false;
  });
  OnEvents(c_.Unigrid->horizontalHeader(), [this](QEvent *event) {
    if (event->type() == QEvent::MouseMove)
      Unigrid_MouseMove(-1);
    return false;
  });
  OnEvents(c_.Unigrid, [this](QEvent *event) {
    if (event->type() != QEvent::KeyPress && event->type() != QEvent::KeyRelease)
      return false;
    auto *key = static_cast<QKeyEvent *>(event);
    if (key->key() == Qt::Key_Return || key->key() == Qt::Key_Enter) {
      // Only a fresh press acts: a held key would load and unload the row by turns.
      if (enterHeld_.FreshPress(*key))
        Unigrid_KeyPress(kEnterKey);
      return true;
    }
    if (event->type() != QEvent::KeyPress || key->text().isEmpty() || !key->text()[0].isPrint())
      return false;
    Unigrid_Type(key->text());
    return true;
  });
  OnEvents(c_.Frame21, [this](QEvent *event) {
    if (event->type() == QEvent::MouseButtonRelease || event->type() == QEvent::MouseButtonDblClick)
      c_.Frame21->hide();
    return false;
  });
  // A click is a press and a release on the label: a release alone, after a press dropped while
  // an operation ran, does nothing.
  OnEvents(c_.Label33, [this](QEvent *event) {
    if (event->type() == QEvent::MouseButtonPress)
      label33Pressed_ = true;
    if (event->type() == QEvent::MouseButtonRelease && std::exchange(label33Pressed_, false))
      Label33_Click();
    return false;
  });
}

void MainWindow::FormLoad() {
  c_.EAWDirLabel->setText(FromPath(State().EAWDir));
  const Failures failures = selector_.StartUp().failures;
  ShowScreenSize();
  c_.Label3->setText("Concept: by and for the players\r\n"
                     "Programmed in C++ with Qt\r\n");
  c_.List3->clear();
  for (const std::string &entry : State().List3)
    c_.List3->addItem(FromName(entry));
  c_.Label1->setText(FromPath(State().EAWDir / ""));
  IniRead();
  ShowGridRows();
  ShowPicture(c_.MyImage, State().BackPic);
  ShowPicture(c_.Image3, State().NewPic);
  c_.SSTab1->setCurrentIndex(0);
  // Choosing the first entry shows its category and draws the grid (List3_Click).
  c_.List3->setCurrentRow(0);
  c_.SSTab1->setEnabled(true);
  FillMusicList();
  // Finishing an interrupted operation showed its progress in the instructions' place.
  runner_.ShowSummary();
  QTimer::singleShot(
      0, this, [this, failures] { ShowFailures(this, failures, "Start-up could not do all:"); });
}

// Centres the window and shows the screen's size in pixels.
void MainWindow::ShowScreenSize() {
  QScreen *screen = QGuiApplication::primaryScreen();
  if (!screen)
    return;
  const QRect area = screen->geometry();
  move(area.x() + (area.width() - width()) / 2, area.y() + (area.height() - height()) / 2);
  const QSize pixels = area.size() * screen->devicePixelRatio();
  c_.Label18[0]->setText(QString::number(pixels.width()));
  c_.Label18[1]->setText(QString::number(pixels.height()));
}

void MainWindow::Command3_Click() { close(); }

void MainWindow::Command8_Click() { showMinimized(); }

// The description goes with the picture, so that the two never tell of different folders.
void MainWindow::ClearPreview() {
  selector_.LeaveGrid();
  c_.SlotFrame->setVisible(State().Slots.frameVisible);
  c_.MyLabel->clear();
  c_.Text9->clear();
  ShowPicture(c_.MyImage, State().BackPic);
}

void MainWindow::List3_Click(int k) {
  c_.Label6->setText(FromName(selector_.ShowCategory(k)));
  c_.Label6->repaint();
  ShowGridChanges();
}

void MainWindow::Label33_Click() {
  runner_.Run(
      VerbRunner::Input::blocked, [this] { return selector_.RefreshLibrary(); },
      "Refresh could not do all:",
      [this](Outcome &) {
        ShowGridRows();
        ShowGridChanges();
      });
}

void MainWindow::Command1_Click() {
  Failures failures;
  const std::vector<std::string> names = selector_.ResetAllFiles(failures);
  const int loadedFiles = selector_.ResetAllLoadedFiles(failures);
  if ((loadedFiles > 0 || !names.empty()) && !ConfirmDeletion(this, loadedFiles, names))
    return;
  runner_.Run(
      VerbRunner::Input::blocked, [&] { return AfterAsking(failures, selector_.ResetAll(names)); },
      "Reset All could not delete these files:", [this](Outcome &) { ShowGridChanges(); });
}

void MainWindow::Unigrid_Click(const QModelIndex &index) {
  runner_.Run(
      VerbRunner::Input::blocked, [&] { return selector_.ClickRow(index.row()); },
      "Some files could not be handled:", [this](Outcome &) { ShowGridChanges(); });
}

void MainWindow::Unigrid_KeyPress(int key) {
  const QModelIndex current = c_.Unigrid->currentIndex();
  if (!current.isValid())
    return;
  runner_.Run(
      VerbRunner::Input::blocked, [&] { return selector_.PressKey(current.row(), key); },
      "Some files could not be handled:", [this](Outcome &) { ShowGridChanges(); });
}

// Typed letters go to the next shown row whose name starts with them, as in any list; the same
// letter typed again goes on to the next such row.
void MainWindow::Unigrid_Type(const QString &text) {
  if (!typedSince_.isValid() || typedSince_.elapsed() > QApplication::keyboardInputInterval())
    typed_.clear();
  typedSince_.restart();
  typed_ += text;
  const int current = c_.Unigrid->currentIndex().row();
  const int row = selector_.FindRow(typed_.size() == 1 ? current + 1 : current, ToName(typed_));
  if (row >= 0)
    c_.Unigrid->setCurrentIndex(gridModel_->index(row, 1));
}

void MainWindow::Unigrid_MouseMove(int row) {
  const std::optional<FolderPreview> preview = selector_.HoverRow(row);
  if (!preview)
    return;
  c_.SlotFrame->setVisible(State().Slots.frameVisible && row < 0);
  c_.MyLabel->clear();
  c_.Text9->clear();
  ShowPicture(c_.MyImage, State().BackPic);
  const QString description = FromText(preview->description);
  c_.MyLabel->setText(description);
  c_.Text9->setPlainText(description);
  if (!preview->picture.empty()) {
    const QPixmap picture = LoadPicture(preview->picture, c_.MyImage->size());
    if (!picture.isNull())
      c_.MyImage->setPixmap(picture);
  }
}

void MainWindow::IniRead() {
  Failures failures;
  const IniValues values = selector_.ReadSettings(failures);
  for (size_t key = 0; key < kSettingCount; ++key)
    if (values[key])
      c_.SettingsBoxes[key]->setText(FromName(*values[key]));
  ShowFailures(this, failures, "The settings could not be read:");
}

void MainWindow::inisave() {
  IniTexts texts;
  for (size_t key = 0; key < kSettingCount; ++key)
    texts[key] = ToName(c_.SettingsBoxes[key]->text());
  runner_.Run(
      VerbRunner::Input::open, [&] { return selector_.SaveSettings(texts); },
      "The settings could not be saved:",
      [this](Outcome &outcome) {
        // The editor shows the file as it is now, unless the player has changed its text.
        if (outcome.done && c_.Frame21->isVisible() && !EditorEdited())
          ShowEditorText(outcome.failures);
      });
}

void MainWindow::IniEdit_Click() {
  c_.Frame21->show();
  Failures failures;
  ShowEditorText(failures);
  ShowFailures(this, failures, "The settings file could not be shown:");
}

void MainWindow::ShowEditorText(Failures &failures) {
  editorFile_ = selector_.SettingsFileText(failures);
  editorShown_ = FromText(editorFile_, &editorWindows1252_);
  c_.Text14->setPlainText(editorShown_);
  editorShownPlain_ = c_.Text14->toPlainText();
}

bool MainWindow::EditorEdited() const { return c_.Text14->toPlainText() != editorShownPlain_; }

void MainWindow::InSaver_Click() {
  Failures failures;
  const std::string file = selector_.SettingsFileText(failures);
  if (file != editorFile_ && !EditorEdited()) {
    ShowEditorText(failures);
  } else if (file != editorFile_) {
    QString keys;
    for (const std::string &key : selector_.ChangedSettings(editorFile_, file))
      keys += (keys.isEmpty() ? "" : ", ") + FromName(key);
    if (!Confirm(this, "eaw.ini has changed since the editor showed it (" + keys +
                           "). Save the editor's text over it?"))
      return;
  }
  const std::string text = ToText(EditorText(), editorWindows1252_);
  runner_.Run(
      VerbRunner::Input::open,
      [&] { return AfterAsking(failures, selector_.SaveSettingsFile(text)); },
      "The settings file could not be saved:",
      [this](Outcome &outcome) {
        if (!outcome.done)
          return;
        editorFile_ = selector_.SettingsFileText(outcome.failures);
        IniRead();
      });
}

// The editor's text as the player left it. Plain text would turn no-break spaces into blanks and
// line separators into line ends, so an unchanged text is the one shown, and a changed one is
// taken raw with only the breaks between paragraphs made line ends.
QString MainWindow::EditorText() const {
  if (c_.Text14->toPlainText() == editorShownPlain_)
    return editorShown_;
  QString text = c_.Text14->document()->toRawText();
  text.replace(QChar::ParagraphSeparator, '\n');
  return text;
}

void MainWindow::FillMusicList(bool tell) {
  Failures failures;
  const MusicList music = selector_.MusicSets(failures);
  c_.List4->clear();
  // A name that is not valid text would not survive the list's text: its bytes go beside it.
  for (const std::string &name : music.entries)
    (new QListWidgetItem(FromName(name), c_.List4))
        ->setData(Qt::UserRole, QByteArray::fromStdString(name));
  if (music.current) {
    currentMusic_ = *music.current;
    c_.Label11->setText(FromName(*music.current));
  }
  if (tell)
    ShowFailures(this, failures, "The music sets could not be read:");
}

void MainWindow::List4_Click(QListWidgetItem *item) {
  const std::string chosen = item->data(Qt::UserRole).toByteArray().toStdString();
  runner_.Run(
      VerbRunner::Input::blocked, [&] { return selector_.SwitchMusic(currentMusic_, chosen); },
      "The music could not be switched:",
      // What Music.ini holds was said at the start, not again at each switch.
      [this](Outcome &) { FillMusicList(false); });
}

void MainWindow::delmsn_Click() {
  runner_.Run(
      VerbRunner::Input::open, [this] { return selector_.StartGame(); },
      "The game could not be started:");
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
  grid->setGeometry(place.x(), place.y(), place.width(), gridModel_->ViewHeight() + scrollBar);
}

void MainWindow::ShowGridChanges() {
  QTableView *grid = c_.Unigrid;
  const FolderGrid &rows = State().Unigrid;
  grid->setUpdatesEnabled(false);
  gridModel_->ShowRows(*grid);
  gridModel_->Changed();
  if (rows.currentRow >= 0)
    grid->setCurrentIndex(gridModel_->index(rows.currentRow, rows.currentCol));
  grid->setUpdatesEnabled(true);
  ShowSlotPanel();
}

void MainWindow::ShowSlotPanel() {
  const SlotPanel &panel = State().Slots;
  c_.SlotFrame->setVisible(panel.frameVisible);
  c_.SlotLabel->setText(FromName(panel.label));
  c_.SlotGrid->setVisible(panel.gridVisible);
  FillSlotGrid(c_.SlotGrid, panel, QColor(kSlotFrameColour));
}

void MainWindow::ShowPicture(QLabel *label, const fs::path &picture) {
  label->setPixmap(picture.empty() ? QPixmap() : LoadPicture(picture, label->size()));
}
