#pragma once

#include "app/app_state.h"
#include "app/failures.h"
#include "ui/window_caption.h"
#include "ui/window_layout.h"

#include <QPixmap>
#include <QWidget>
#include <array>
#include <filesystem>

class FolderGridModel;

// The program's one window: builds its controls, forwards their events to the logic and shows
// the logic's state.
class MainWindow : public QWidget {
  Q_OBJECT
public:
  explicit MainWindow(const std::filesystem::path &eawDir);
  ~MainWindow() override;

  // The start-up sequence, run once before the window is first shown.
  void FormLoad();
  const AppState &State() const { return state_; }

protected:
  bool eventFilter(QObject *watched, QEvent *event) override;

private:
  void WireEvents();
  std::array<QLineEdit *, 6> SettingsBoxes() const;
  void Command3_Click();
  void Command8_Click();
  void ClearPreview();
  void List3_Click(int k);
  void Label33_Click();
  void Command1_Click();
  void Unigrid_MouseMove(int row);
  void IniRead();
  void inisave();
  void IniEdit_Click();
  void InSaver_Click();
  void FillMusicList();
  void List4_Click(QListWidgetItem *item);
  void delmsn_Click();
  void Unigrid_Click(const QModelIndex &index);
  void Unigrid_KeyPress(int key);
  void ShowGridRows();
  void ShowGridChanges();
  void ShowSlotPanel();
  void ShowPicture(QLabel *label, const std::filesystem::path &picture);
  void Tell(const Failures &failures, const QString &heading);

  AppState state_;
  Controls c_;
  WindowCaption caption_;
  FolderGridModel *gridModel_;
  bool editorLatin1_ = false; // the eaw.ini editor's text came from Latin-1 bytes
};
