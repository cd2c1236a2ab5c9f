#pragma once

#include "app/selector.h"
#include "platform/qt_program_starter.h"
#include "ui/held_key.h"
#include "ui/verb_runner.h"
#include "ui/window_caption.h"
#include "ui/window_layout.h"

#include <QElapsedTimer>
#include <QWidget>
#include <filesystem>

class FolderGridModel;

// The program's one window: builds its controls, forwards their events to the Selector's verbs
// and draws the Selector's state.
class MainWindow : public QWidget {
  Q_OBJECT
public:
  explicit MainWindow(const std::filesystem::path &eawDir);
  ~MainWindow() override;

  // The start-up sequence, run once before the window is first shown.
  void FormLoad();

private:
  void WireEvents();
  void WireHooks();
  void Command3_Click();
  void Command8_Click();
  void ClearPreview();
  void List3_Click(int k);
  void Label33_Click();
  void Command1_Click();
  void Unigrid_Click(const QModelIndex &index);
  void Unigrid_KeyPress(int key);
  void Unigrid_MouseMove(int row);
  void Unigrid_Type(const QString &text);
  void IniRead();
  void inisave();
  void IniEdit_Click();
  void InSaver_Click();
  void ShowEditorText(Failures &failures);
  bool EditorEdited() const;
  // Fills the music list; with `tell`, says which lines of Music.ini name no set.
  void FillMusicList(bool tell = true);
  void List4_Click(QListWidgetItem *item);
  void delmsn_Click();
  void ShowScreenSize();
  void ShowGridRows();
  void ShowGridChanges();
  void ShowSlotPanel();
  void ShowPicture(QLabel *label, const std::filesystem::path &picture);
  const SelectorState &State() const { return selector_.State(); }

  Controls c_;
  WindowCaption caption_;
  QtProgramStarter starter_;
  Selector selector_;
  FolderGridModel *gridModel_;
  VerbRunner runner_{this, c_.Label22};
  QString EditorText() const;

  bool editorWindows1252_ = false; // the eaw.ini editor's text came from Windows-1252 bytes
  QString editorShown_;            // the text the editor was given
  QString editorShownPlain_;       // the same as the editor gives it back
  std::string editorFile_;         // eaw.ini's bytes when the editor was given its text
  std::string currentMusic_;       // the music set Label11 shows, byte for byte
  QString typed_;                  // letters typed into the grid in quick succession
  QElapsedTimer typedSince_;
  HeldKey enterHeld_;           // Enter on the grid acts once however long it is held
  bool label33Pressed_ = false; // "Refresh!" acts on the release of a press it saw
};
