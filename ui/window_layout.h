#pragma once

#include "settings/eaw_ini.h"

#include <QFrame>
#include <QGroupBox>
#include <QLabel>
#include <QLineEdit>
#include <QListWidget>
#include <QPlainTextEdit>
#include <QPushButton>
#include <QTabWidget>
#include <QTableView>
#include <QTableWidget>
#include <array>

// Every control of the main window, named as the window's logic knows them.
struct Controls {
  QPushButton *delmsn, *Command1, *Command8, *Command3;
  QLabel *Label1;
  QTabWidget *SSTab1;
  // "General Settings" page
  QLabel *Image3, *Label3, *EAWDirLabel;
  QGroupBox *Frame2;
  QLabel *Label5, *Label32;
  QLabel *Label18[2];
  // Text5, Text6, Text4, Text7, Text88 and Text11: one box per setting, in key order.
  std::array<QLineEdit *, kSettingCount> SettingsBoxes;
  QPushButton *IniEdit;
  QGroupBox *Frame21;
  QPushButton *InSaver;
  QPlainTextEdit *Text14;
  // "World settings" page
  QFrame *LoadFrame;
  QLabel *Label22, *Label9, *Label6, *Label33, *Label15, *Label11;
  QListWidget *List3, *List4;
  QTableView *Unigrid;
  QLabel *MyImage, *MyLabel;
  QPlainTextEdit *Text9;
  QFrame *SlotFrame;
  QLabel *SlotLabel;
  QTableWidget *SlotGrid;
};

// The instructions above the category list, which a summary line replaces for a while.
inline constexpr char kInstructions[] =
    "Click on a white row to load a folder, or click on a green row to unload it. Right-click a "
    "row for setups and the folder's files.";

// The slot panel's colour, also the colour of the slot grid's header cells.
inline constexpr char kSlotFrameColour[] = "#E0E0E0";

// The window's font at `points` size: the Windows dialog font or a look-alike.
QFont WindowFont(double points);
// The window's exact caption, 108 characters.
QString WindowCaptionText();
// Creates every control on `window` with its name, text, tool tip, colours, font and place.
Controls BuildControls(QWidget *window);
