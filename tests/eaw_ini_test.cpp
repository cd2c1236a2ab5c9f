#include "settings/eaw_ini.h"
#include "settings/ini_editor.h"
#include "settings/loose_number.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

namespace {

// Lines end in CR LF or in a line feed alone, as editors leave them.
const std::string kIni = "[Screen]\nWidth=0800\r\nHeight=600 ; small\n Width=5\r\nwidth=6\n"
                         "[Game]\r\nDay=abc\nWidth=1024\r\nMonth=\r\nPlaneSetNumber=&H10";
const IniTexts kTexts = {"1280", "", "3", "12", "abc", "2"};

using Shown = std::vector<std::optional<std::string>>;
Shown Read(const TestFolder &game) {
  Failures failures;
  const IniValues values = IniRead(game.Path(), failures);
  return Shown(values.begin(), values.end());
}

} // namespace

using EawIni = GameTest;
using IniEditor = GameTest;

TEST_F(EawIni, TheLastLineOfAKeyIsShownEveryLineRewrittenAndTheFileNeverDamaged) {
  inisave(game.Path(), kTexts, failures);
  EXPECT_FALSE(game.Exists("eaw.ini"));
  SetReadOnly(game.Write("eaw.ini", kIni), true);
  EXPECT_EQ(Read(game), (Shown{"1024", "600", std::nullopt, "0", "0", "16"}));
  inisave(game.Path(), kTexts, failures);
  const std::string saved = game.Read("eaw.ini");
  EXPECT_EQ(saved, "[Screen]\r\nWidth=1280\r\nHeight=\r\n Width=5\r\nwidth=6\r\n"
                   "[Game]\r\nDay=12\r\nWidth=1280\r\nMonth=abc\r\nPlaneSetNumber=2\r\n");
  EXPECT_TRUE(IsWritable(game.Path() / "eaw.ini"));
  EXPECT_TRUE(failures.Empty());

  game.Write("eaw.ini.partial/in the way");
  inisave(game.Path(), {"640"}, failures);
  EXPECT_FALSE(IniEditorSave(game.Path(), "Width=2", failures));
  EXPECT_EQ(game.Read("eaw.ini"), saved);
  EXPECT_TRUE(Contains(Taken().Message(""), "eaw.ini"));
}

TEST_F(IniEditor, ShowsTheFileAndSavesTheTextWithOneMoreLine) {
  EXPECT_EQ(IniDisplayText(game.Path(), failures), "");
  EXPECT_FALSE(IniEditorSave(game.Path(), "Width=1", failures));
  EXPECT_FALSE(game.Exists("eaw.ini"));
  game.Write("Eaw.ini", "a\r\nb\nc");
  const std::string shown = IniDisplayText(game.Path(), failures);
  EXPECT_EQ(shown, "a\r\nb\r\nc\r\n");
  EXPECT_TRUE(IniEditorSave(game.Path(), shown, failures));
  EXPECT_EQ(game.Read("Eaw.ini"), "a\r\nb\r\nc\r\n\r\n");
  EXPECT_TRUE(IniEditorSave(game.Path(), "x\ny", failures));
  EXPECT_EQ(game.Read("Eaw.ini"), "x\r\ny\r\n");
  EXPECT_TRUE(failures.Empty());

  SetReadOnly(game.Path() / "Eaw.ini", true);
  EXPECT_FALSE(IniEditorSave(game.Path(), "Width=2", failures));
  EXPECT_EQ(game.Read("Eaw.ini"), "x\r\ny\r\n");
  EXPECT_EQ(Taken().Lines().size(), 1u);
}

TEST(LooseNumber, ReadsTheNumberAtTheStartAndShowsItPlainly) {
  // clang-format off
  const std::pair<const char *, const char *> cases[] = {
      {"0800", "800"}, {"1024 ; comment", "1024"}, {"abc", "0"}, {"", "0"}, {"-0", "0"},
      {" 1 2\t3\n4", "1234"}, {"-7x", "-7"}, {"+7", "7"}, {"1.50.3", "1.5"}, {".5", "0.5"},
      {"12e2x", "1200"}, {"12D-1", "1.2"}, {"12e", "12"}, {"1e20", "100000000000000000000"},
      {"1e999", "0"}, {"&HFF", "255"}, {"&h1g", "1"}, {"&O17", "15"}, {"&O9", "0"}, {"&X1", "0"}};
  // clang-format on
  for (const auto &[text, shown] : cases)
    EXPECT_EQ(LooseNumberText(text), shown) << text;
}
