#include "ui/window_layout.h"

#include "ui/twips.h"
#include "ui/wrapping_button.h"

#include <QApplication>
#include <QHeaderView>
#include <QStyle>

#include <algorithm>

namespace {

// The tab control's page area starts below its tab strip; page positions are given relative to
// the tab control itself.
QPoint PageOrigin(QTabWidget *tabs) { return QPoint(2, tabs->tabBar()->sizeHint().height() + 2); }

template <class Widget>
Widget *Make(QWidget *parent, const char *name, QRect place, QPoint origin = {}) {
  auto *widget = new Widget(parent);
  widget->setObjectName(name);
  widget->setGeometry(place.translated(-origin));
  return widget;
}

enum class Wrap { No, Yes };

QLabel *MakeLabel(QWidget *parent, const char *name, const QString &text, QRect place,
                  QPoint origin = {}, Wrap wrap = Wrap::No) {
  QLabel *label = Make<QLabel>(parent, name, place, origin);
  label->setText(text);
  label->setAlignment(Qt::AlignLeft | Qt::AlignTop);
  label->setWordWrap(wrap == Wrap::Yes);
  // Fonts other than the Windows one are a little wider: a short caption may grow to stay whole.
  if (wrap == Wrap::No)
    label->resize(std::max(label->width(), label->sizeHint().width()), label->height());
  return label;
}

void Paint(QWidget *widget, const QColor &background) {
  QPalette palette = widget->palette();
  palette.setColor(QPalette::Window, background);
  palette.setColor(QPalette::Base, background);
  widget->setPalette(palette);
  widget->setAutoFillBackground(true);
}

void SetTextColour(QWidget *widget, const QColor &colour) {
  QPalette palette = widget->palette();
  palette.setColor(QPalette::WindowText, colour);
  widget->setPalette(palette);
}

void SetFont(QWidget *widget, double points, bool bold = false, bool italic = false) {
  QFont font = widget->font();
  font.setPointSizeF(points);
  font.setBold(bold);
  font.setItalic(italic);
  widget->setFont(font);
}

QPushButton *MakeFaceButton(QWidget *parent, const char *name, const QString &text, QRect place,
                            const char *face, double points) {
  QPushButton *button = Make<QPushButton>(parent, name, place);
  button->setText(text);
  button->setStyleSheet(QString("QPushButton { background-color: %1; font-weight: bold; "
                                "font-size: %2pt; border: 1px solid #404040; }"
                                "QPushButton:pressed { border: 2px inset #404040; }")
                            .arg(face)
                            .arg(points));
  return button;
}

void BuildWindowButtons(QWidget *window, Controls &c) {
  c.delmsn = MakeFaceButton(window, "delmsn", "FLY", Twips(10710, 60, 945, 555), "#FFFF00", 8.25);
  c.delmsn->setToolTip("Deletes \"DefaultXXX.msn\"");
  c.Command1 =
      MakeFaceButton(window, "Command1", "Reset All", Twips(11775, 60, 945, 555), "#FF0000", 8.25);
  c.Command1->setToolTip("Moves all extra files added by this software to the EAW folder back to "
                         "their original folders.");
  c.Command8 =
      MakeFaceButton(window, "Command8", "Minimise", Twips(12840, 60, 945, 555), "#E0E0E0", 8.25);
  c.Command3 =
      MakeFaceButton(window, "Command3", "Exit", Twips(13905, 60, 945, 555), "#FFC0C0", 9.75);
}

// Where each settings box sits, in the order of the settings keys.
struct BoxPlace {
  const char *name;
  QRect place;
};

void BuildSettingsBoxes(QWidget *frame, Controls &c) {
  const auto places = std::to_array<BoxPlace>({{"Text5", Twips(960, 2820, 705, 375)},
                                               {"Text6", Twips(960, 3270, 705, 375)},
                                               {"Text4", Twips(1410, 3840, 375, 345)},
                                               {"Text7", Twips(1410, 4320, 525, 345)},
                                               {"Text88", Twips(1410, 4740, 525, 345)},
                                               {"Text11", Twips(1410, 5400, 525, 345)}});
  static_assert(places.size() == kSettingCount, "one box for each setting");
  for (size_t key = 0; key < kSettingCount; ++key)
    c.SettingsBoxes[key] = Make<QLineEdit>(frame, places[key].name, places[key].place);
  c.SettingsBoxes[2]->setText("0");
}

void BuildSettingsFrame(QWidget *page, QPoint origin, Controls &c) {
  c.Frame2 = Make<QGroupBox>(page, "Frame2", Twips(11160, 930, 2235, 6660), origin);
  c.Frame2->setTitle("User settings");
  c.Frame2->setStyleSheet("QGroupBox::title { color: #0000FF; }");
  QWidget *f = c.Frame2;
  c.Label5 = MakeLabel(f, "Label5", "User's PC natural resolution:", Twips(210, 360, 1695, 435), {},
                       Wrap::Yes);
  MakeLabel(f, "Label30(0)", "Width", Twips(210, 930, 675, 315));
  c.Label18[0] = MakeLabel(f, "Label18(0)", "", Twips(990, 900, 630, 255));
  MakeLabel(f, "Label31(0)", "Height", Twips(210, 1380, 675, 315));
  c.Label18[1] = MakeLabel(f, "Label18(1)", "", Twips(990, 1320, 630, 255));
  c.Label32 = MakeLabel(f, "Label32", "Current settings:  Press \"Enter\" after changing any value",
                        Twips(180, 1710, 1815, 945), {}, Wrap::Yes);
  SetFont(c.Label32, 9.75);
  MakeLabel(f, "Label30(1)", "Width", Twips(150, 2880, 675, 315));
  MakeLabel(f, "Label31(1)", "Height", Twips(150, 3330, 675, 315));
  MakeLabel(f, "Label31(2)", "Extra Squads", Twips(210, 3900, 1095, 315));
  MakeLabel(f, "Label34(0)", "Day", Twips(930, 4380, 285, 255));
  MakeLabel(f, "Label34(1)", "Month", Twips(810, 4800, 495, 255));
  MakeLabel(f, "Label34(2)", "Planeset", Twips(210, 5490, 975, 255));
  BuildSettingsBoxes(f, c);
  c.IniEdit = Make<WrappingButton>(f, "IniEdit", Twips(60, 5910, 2115, 645));
  c.IniEdit->setText("Display \"eaw.ini' for inspection or further editing");
}

void BuildGeneralPage(QWidget *page, QPoint origin, Controls &c) {
  c.Image3 = Make<QLabel>(page, "Image3", Twips(1860, 930, 9270, 6690), origin);
  c.Label3 = MakeLabel(page, "Label3", "", Twips(5670, 8460, 3285, 240), origin);
  Paint(c.Label3, QColor("#C0FFC0"));
  SetFont(c.Label3, 9.75, true, true);
  c.EAWDirLabel = MakeLabel(page, "EAWDirLabel", "", Twips(4560, 690, 105, 255), origin);
  c.EAWDirLabel->hide();
  BuildSettingsFrame(page, origin, c);
  c.Frame21 = Make<QGroupBox>(page, "Frame21", Twips(1980, 990, 4395, 8265), origin);
  c.Frame21->setTitle("Click to hide");
  // The editor keeps the style's own grey frame and white text box, not the window's teal.
  c.Frame21->setPalette(QApplication::style()->standardPalette());
  c.Frame21->setAutoFillBackground(true);
  c.InSaver = Make<QPushButton>(c.Frame21, "InSaver", Twips(210, 270, 2085, 345));
  c.InSaver->setText("Save ini in EAW Directory");
  c.Text14 = Make<QPlainTextEdit>(c.Frame21, "Text14", Twips(180, 810, 4095, 7275));
  c.Frame21->hide();
  c.Frame21->raise();
}

void BuildFolderGrid(QWidget *frame, Controls &c) {
  c.Unigrid = Make<QTableView>(frame, "Unigrid", Twips(3840, 150, 4005, 6375));
  c.Unigrid->setFont(WindowFont(8.25));
  c.Unigrid->setSelectionMode(QAbstractItemView::NoSelection);
  c.Unigrid->setEditTriggers(QAbstractItemView::NoEditTriggers);
  c.Unigrid->setMouseTracking(true);
  c.Unigrid->verticalHeader()->hide();
  c.Unigrid->verticalHeader()->setSectionResizeMode(QHeaderView::Fixed);
  c.Unigrid->verticalHeader()->setDefaultSectionSize(TwipsToPixels(240));
  c.Unigrid->verticalHeader()->setMinimumSectionSize(1);
  c.Unigrid->horizontalHeader()->setSectionsClickable(false);
  c.Unigrid->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOn);
  c.Unigrid->horizontalHeader()->setFixedHeight(TwipsToPixels(240));
  c.Unigrid->horizontalHeader()->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);
  c.Unigrid->horizontalHeader()->setStyleSheet(
      "QHeaderView::section { background-color: #FFC0C0; border: 1px solid #808080; "
      "padding-left: 2px; }");
}

void BuildSlotPanel(QWidget *frame, Controls &c) {
  // The slot grid sits where the description box is, in front of it, so that the folder grid,
  // the category list and the music list stay in view.
  c.SlotFrame = Make<QFrame>(frame, "SlotFrame", Twips(7860, 5460, 6465, 2835));
  c.SlotFrame->setFrameShape(QFrame::Box);
  c.SlotFrame->setStyleSheet(
      QString("QFrame#SlotFrame { background-color: %1; }").arg(kSlotFrameColour));
  c.SlotLabel = MakeLabel(c.SlotFrame, "SlotLabel", "", Twips(60, 30, 6345, 255));
  c.SlotGrid = Make<QTableWidget>(c.SlotFrame, "SlotGrid", Twips(60, 300, 6345, 2475));
  c.SlotGrid->setFont(WindowFont(8));
  c.SlotGrid->verticalHeader()->hide();
  c.SlotGrid->horizontalHeader()->setDefaultAlignment(Qt::AlignLeft | Qt::AlignVCenter);
  c.SlotGrid->horizontalHeader()->setFixedHeight(TwipsToPixels(240));
  c.SlotGrid->horizontalHeader()->setStyleSheet(
      QString("QHeaderView::section { background-color: %1; border: 1px solid #808080; }")
          .arg(kSlotFrameColour));
  c.SlotGrid->verticalHeader()->setDefaultSectionSize(TwipsToPixels(240));
  c.SlotGrid->setEditTriggers(QAbstractItemView::NoEditTriggers);
  c.SlotFrame->hide();
}

void BuildLoaderPage(QWidget *page, QPoint origin, Controls &c) {
  c.LoadFrame = Make<QFrame>(page, "LoadFrame", Twips(270, 660, 14370, 8415), origin);
  c.LoadFrame->setMouseTracking(true);
  QWidget *f = c.LoadFrame;
  c.Label22 = MakeLabel(f, "Label22", kInstructions, Twips(30, 180, 3645, 585), {}, Wrap::Yes);
  c.Label9 = MakeLabel(f, "Label9", "Code letter", Twips(120, 900, 885, 255));
  c.Label6 = MakeLabel(f, "Label6", "", Twips(990, 840, 465, 315));
  c.Label33 = MakeLabel(f, "Label33", "Refresh!", Twips(1590, 810, 1125, 375));
  Paint(c.Label33, QColor("#0000FF"));
  SetFont(c.Label33, 9.75);
  c.Label33->setAlignment(Qt::AlignCenter);
  c.Label33->setCursor(Qt::PointingHandCursor);
  c.List3 = Make<QListWidget>(f, "List3", Twips(30, 1230, 3675, 7080));
  Paint(c.List3, QColor("#FFC0C0"));
  c.List3->setMouseTracking(true);
  BuildFolderGrid(f, c);
  c.Label15 = MakeLabel(f, "Label15", "Current Music", Twips(4140, 6540, 555, 375), {}, Wrap::Yes);
  SetTextColour(c.Label15, QColor("#000080"));
  c.Label11 = MakeLabel(f, "Label11", "", Twips(4800, 6600, 2445, 345));
  SetTextColour(c.Label11, QColor("#000080"));
  c.List4 = Make<QListWidget>(f, "List4", Twips(3870, 7020, 3795, 1230));
  Paint(c.List4, QColor("#C0FFFF"));
  c.MyImage = Make<QLabel>(f, "MyImage", Twips(7890, 150, 6375, 5220));
  c.MyImage->setAlignment(Qt::AlignCenter);
  c.MyLabel = MakeLabel(f, "MyLabel", "", Twips(8220, 5670, 1905, 480), {}, Wrap::Yes);
  Paint(c.MyLabel, QColor("#FFE0C0"));
  c.Text9 = Make<QPlainTextEdit>(f, "Text9", Twips(7860, 5460, 6465, 2835));
  Paint(c.Text9, QColor("#C0C0FF"));
  c.Text9->setLineWrapMode(QPlainTextEdit::NoWrap);
  c.Text9->setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOn);
  c.Text9->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOn);
  c.Text9->raise();
  BuildSlotPanel(f, c);
}

} // namespace

QFont WindowFont(double points) {
  QFont font;
  // The Windows dialog font first, then look-alikes with similar widths.
  font.setFamilies({"MS Sans Serif", "Microsoft Sans Serif", "Arial", "Liberation Sans",
                    "Nimbus Sans", "DejaVu Sans Condensed"});
  font.setPointSizeF(points);
  return font;
}

QString WindowCaptionText() {
  return QString("ZEP for 150") + QString(71, ' ') + "Build: 22nd June 2016" + QString(3, ' ') +
         "#1";
}

Controls BuildControls(QWidget *window) {
  Controls c{};
  // Widgets with a style sheet take the application's font, not their window's: both are the
  // window font, so that every control, and every message box, is drawn in it.
  QApplication::setFont(WindowFont(8.25));
  window->setFont(WindowFont(8.25));
  window->setFixedSize(TwipsToPixels(14985), TwipsToPixels(9360));
  QPalette palette = window->palette();
  palette.setColor(QPalette::Window, QColor("#008080"));
  window->setPalette(palette);
  window->setAutoFillBackground(true);
  c.Label1 = MakeLabel(window, "Label1", "", Twips(4290, 1170, 1335, 345));
  c.SSTab1 = Make<QTabWidget>(window, "SSTab1", Twips(120, 60, 14805, 9255));
  auto *general = new QWidget;
  general->setObjectName("GeneralPage");
  auto *loader = new QWidget;
  loader->setObjectName("WorldPage");
  c.SSTab1->addTab(general, "General Settings");
  c.SSTab1->addTab(loader, "World settings");
  c.SSTab1->setEnabled(false);
  const QPoint origin = PageOrigin(c.SSTab1);
  BuildGeneralPage(general, origin, c);
  BuildLoaderPage(loader, origin, c);
  BuildWindowButtons(window, c);
  return c;
}
