#include "library/preview.h"
#include "tests/selector_fixture.h"

#include <gtest/gtest.h>

using Preview = SelectorTest;

TEST_F(Preview, RebuiltOnlyWhenThePointerEntersAnotherRow) {
  EXPECT_TRUE(selector->HoverRow(2));
  EXPECT_FALSE(selector->HoverRow(2));
  EXPECT_TRUE(selector->HoverRow(-1)); // the header
  EXPECT_TRUE(selector->HoverRow(2));
  selector->LeaveGrid();
  EXPECT_TRUE(selector->HoverRow(-1));
}

TEST_F(Preview, DescriptionAndFirstPictureInNameOrderOrNothing) {
  game.Write("S-A/Contents.TXT", "one\r\ntwo\nthree");
  for (const char *name : {"S-A/a.jpg", "S-A/mypic", "S-B/mypic", "S-B/z.jpg", "S-C/mypic.txt"})
    game.Write(name);
  FolderPreview preview = PreviewOf(game.Path() / "S-A");
  EXPECT_EQ(preview.description, "one\r\ntwo\r\nthree\r\n");
  EXPECT_EQ(preview.picture, game.Path() / "S-A/a.jpg");
  preview = PreviewOf(game.Path() / "S-B");
  EXPECT_EQ(preview.description, "");
  EXPECT_EQ(preview.picture, game.Path() / "S-B/mypic");
  EXPECT_TRUE(PreviewOf(game.Path() / "S-C").picture.empty());

  // The header, a row past the last, a folder gone and an unreadable description show nothing.
  LibraryState state;
  state.Unigrid.library = game.Path();
  for (const char *name : {"S-Gone", "S-Locked"})
    state.Unigrid.rows.push_back(GridRow{name});
  game.MakeFolder("S-Locked/contents.txt/not-a-file");
  for (int row : {-1, 0, 1, 2}) {
    preview = PreviewOfRow(state, row);
    EXPECT_EQ(preview.description + preview.picture.string(), "") << row;
  }
}
