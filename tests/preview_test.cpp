#include "app/selector.h"
#include "library/preview.h"
#include "tests/game_folder.h"

#include <gtest/gtest.h>

TEST(Preview, RebuiltOnlyWhenThePointerEntersAnotherRow) {
  GameFolder game;
  RecordingCaption caption;
  NotingStarter starter;
  Selector selector(game.Path(), caption, starter);
  EXPECT_TRUE(selector.HoverRow(2));
  EXPECT_FALSE(selector.HoverRow(2));
  EXPECT_TRUE(selector.HoverRow(-1)); // the header
  EXPECT_TRUE(selector.HoverRow(2));
  selector.LeaveGrid();
  EXPECT_TRUE(selector.HoverRow(-1));
}

TEST(Preview, DescriptionAndFirstPictureInNameOrder) {
  TestFolder lib;
  lib.Write("S-A/Contents.TXT", "one\r\ntwo\nthree");
  for (const char *name : {"S-A/a.jpg", "S-A/mypic", "S-B/mypic", "S-B/z.jpg", "S-C/mypic.txt"})
    lib.Write(name);
  FolderPreview preview = PreviewOf(lib.Path() / "S-A");
  EXPECT_EQ(preview.description, "one\r\ntwo\r\nthree\r\n");
  EXPECT_EQ(preview.picture, lib.Path() / "S-A/a.jpg");
  preview = PreviewOf(lib.Path() / "S-B");
  EXPECT_EQ(preview.description, "");
  EXPECT_EQ(preview.picture, lib.Path() / "S-B/mypic");
  EXPECT_TRUE(PreviewOf(lib.Path() / "S-C").picture.empty());
}

TEST(Preview, HeaderRowRemovedFolderAndUnreadableDescriptionGiveAnEmptyPreview) {
  TestFolder lib;
  LibraryState state;
  state.Unigrid.library = lib.Path();
  for (const char *name : {"S-Gone", "S-Locked"})
    state.Unigrid.rows.push_back(GridRow{name});
  lib.MakeFolder("S-Locked/contents.txt/not-a-file");
  for (int row : {-1, 0, 1, 2}) {
    const FolderPreview preview = PreviewOfRow(state, row);
    EXPECT_EQ(preview.description, "") << row;
    EXPECT_TRUE(preview.picture.empty()) << row;
  }
}
