#include "tests/game_folder.h"
#include "tests/window_driver.h"

#include <QApplication>
#include <QStyle>
#include <QTest>
#include <gtest/gtest.h>

namespace {

void PressEnterIn(WindowDriver &driver, const char *box, const QString &text) {
  auto *edit = driver.Find<QLineEdit>(box);
  edit->setFocus();
  edit->setText(text);
  QTest::keyClick(edit, Qt::Key_Return);
}

int StartedCount(const fs::path &folder) {
  int count = 0;
  for (const auto &entry : fs::directory_iterator(folder))
    count += entry.path().filename().string().rfind("started-", 0) == 0;
  return count;
}

} // namespace

// Which key lines are read and rewritten is eaw_ini_test.cpp's matter: this checks the wiring.
TEST(SettingsWindow, BoxesShowTheFileAndEnterSavesThemOrSaysWhyNot) {
  GameFolder game;
  game.Write("eaw.ini", "Width=0800\nMonth=abc\nDay=14");
  WindowDriver driver(game.Path());
  EXPECT_EQ(driver.Find<QLineEdit>("Text5")->text(), "800");
  EXPECT_EQ(driver.Find<QLineEdit>("Text6")->text(), "");
  EXPECT_EQ(driver.Find<QLineEdit>("Text4")->text(), "0");

  PressEnterIn(driver, "Text7", "");
  EXPECT_EQ(game.Read("eaw.ini"), "Width=800\r\nMonth=0\r\nDay=\r\n");
  EXPECT_TRUE(driver.TakeMessages().isEmpty());
  EXPECT_EQ(driver.Summary(), "3 settings saved to eaw.ini");

  // A temporary name taken by a folder makes the write fail.
  game.Write("eaw.ini.partial/in-the-way");
  PressEnterIn(driver, "Text5", "640");
  EXPECT_TRUE(driver.OneMessage({"The settings could not be saved:", "eaw.ini"}));
  EXPECT_EQ(driver.Summary(), kInstructions); // the line of the save before is gone
  driver.Click("InSaver");
  EXPECT_TRUE(driver.OneMessage({"The settings file could not be saved:"}));
}

TEST(SettingsWindow, EditorShowsFollowsTheBoxesAsksBeforeSavingOverAChangeKeepsBytesAndHides) {
  GameFolder game;
  game.Write("eaw.ini", "Width=800\r\nHeight=600\r\n");
  WindowDriver driver(game.Path());
  auto *editor = driver.Find<QWidget>("Frame21");
  driver.Find<QTabWidget>("SSTab1")->setCurrentIndex(0);
  driver.Click("IniEdit");
  EXPECT_TRUE(editor->isVisible());
  auto *text = driver.Find<QPlainTextEdit>("Text14");
  EXPECT_EQ(text->toPlainText(), "Width=800\nHeight=600\n");
  // The editor has the style's own colours, not the window's teal.
  const QPalette standard = QApplication::style()->standardPalette();
  EXPECT_EQ(editor->palette().color(QPalette::Window), standard.color(QPalette::Window));
  EXPECT_EQ(text->palette().color(QPalette::Base), standard.color(QPalette::Base));
  PressEnterIn(driver, "Text5", "1024");
  EXPECT_EQ(text->toPlainText(), "Width=1024\nHeight=600\n");

  text->setPlainText("Width=1280\nHeight=600\nExtra=1\n");
  PressEnterIn(driver, "Text6", "768");
  EXPECT_EQ(text->toPlainText(), "Width=1280\nHeight=600\nExtra=1\n");
  EXPECT_EQ(driver.AnswerNextBox(QMessageBox::Cancel, [&] { driver.Click("InSaver"); }),
            "eaw.ini has changed since the editor showed it (Height). Save the editor's text over "
            "it?");
  EXPECT_EQ(game.Read("eaw.ini"), "Width=1024\r\nHeight=768\r\n");
  driver.AnswerNextBox(QMessageBox::Ok, [&] { driver.Click("InSaver"); });
  EXPECT_EQ(game.Read("eaw.ini"), "Width=1280\r\nHeight=600\r\nExtra=1\r\n\r\n");
  EXPECT_EQ(driver.Find<QLineEdit>("Text5")->text(), "1280");
  EXPECT_EQ(driver.Summary(), "eaw.ini saved");

  // An unchanged text is saved byte for byte: a byte-order mark, no-break spaces and Unicode line
  // and paragraph separators in UTF-8, then curly quotes and a no-break space in Windows-1252.
  for (const std::string &ini :
       {std::string("\xEF\xBB\xBFWidth=800\xC2\xA0\r\nName=a\xE2\x80\xA8-\xE2\x80\xA9-\r\n"),
        std::string("Pilot=\x93Top\x94\xA0\x81\r\n")}) {
    game.Write("eaw.ini", ini);
    driver.Click("IniEdit");
    driver.Click("InSaver");
    EXPECT_EQ(game.Read("eaw.ini"), ini + "\r\n");
  }
  EXPECT_TRUE(text->toPlainText().startsWith(QString::fromUtf8("Pilot=\u201CTop\u201D")));
  text->moveCursor(QTextCursor::End);
  text->insertPlainText("Day=3\n");
  driver.Click("InSaver");
  EXPECT_EQ(game.Read("eaw.ini"), "Pilot=\x93Top\x94\xA0\x81\r\nDay=3\r\n\r\n");
  QTest::mouseClick(editor, Qt::LeftButton, {}, QPoint(editor->width() - 5, editor->height() - 5));
  EXPECT_FALSE(editor->isVisible());
}

TEST(SettingsWindow, MusicListSwitchesThereAndBack) {
  GameFolder game;
  game.Write("Music.ini", "Swing\r\n..\r\nClassic\r\nRock\r\n");
  game.Write("Music/rock.bgm");
  game.Write("Swing/swing.bgm");
  game.Write("Classic/classic.bgm");
  WindowDriver driver(game.Path());
  auto *list = driver.Find<QListWidget>("List4");
  auto *current = driver.Find<QLabel>("Label11");
  ASSERT_EQ(list->count(), 2);
  EXPECT_EQ(list->item(0)->text(), "Swing");
  EXPECT_EQ(current->text(), "Rock");

  driver.ClickEntry("List4", 0);
  EXPECT_EQ(current->text(), "Swing");
  // The line ".." is named once, at the start, and not again at each switch.
  EXPECT_TRUE(driver.OneMessage({"line 2 was ignored"}));
  EXPECT_EQ(driver.Summary(), "Music set Swing is playing");
  ASSERT_EQ(list->count(), 2);
  EXPECT_EQ(list->item(1)->text(), "Rock");

  driver.ClickEntry("List4", 1);
  EXPECT_EQ(current->text(), "Rock");
}

// POSIX only: names there are bytes, which need not be text; Windows names are UTF-16 text.
#ifndef _WIN32
TEST(SettingsWindow, MusicSetNamesThatAreNotTextKeepTheirBytes) {
  GameFolder game;
  const std::string latin1 = "Kl\xE4nge";
  game.Write("Music.ini", latin1 + "\r\nRock\r\n");
  game.Write("Music/rock.bgm");
  game.Write(latin1 + "/klang.bgm");
  WindowDriver driver(game.Path());
  for (int time = 0; time < 2; ++time)
    driver.ClickEntry("List4", 0);
  EXPECT_TRUE(game.All({latin1 + "/klang.bgm", "Music/rock.bgm"}));
  EXPECT_TRUE(driver.TakeMessages().isEmpty());
}
#endif

TEST(SettingsWindow, FlyStartsTheGameEachTimeOrSaysWhyNotAndTellsAQuickFailureOnce) {
  GameFolder game;
  WindowDriver driver(game.Path());
  driver.Click("delmsn");
  const QStringList messages = driver.TakeMessages();
  ASSERT_EQ(messages.size(), 1);
  EXPECT_TRUE(messages[0].contains(QString::fromStdString((game.Path() / "eaw.exe").string())));
  EXPECT_EQ(messages[0].count("started"), 1); // said once

  MakeStandInGame(game);
  driver.Click("delmsn");
  driver.Click("delmsn");
  EXPECT_TRUE(QTest::qWaitFor([&] { return StartedCount(game.Path()) == 2; }, 5000));
  EXPECT_EQ(driver.Summary(), "Game started");
  EXPECT_TRUE(driver.Window().isVisible());
  EXPECT_TRUE(driver.TakeMessages().isEmpty());

  MakeStandInGame(game, 3);
  driver.Click("delmsn");
  EXPECT_TRUE(QTest::qWaitFor([&] { return driver.OneMessage({"status 3"}); }));
  QTest::qWait(300);
  EXPECT_TRUE(driver.TakeMessages().isEmpty());
}
