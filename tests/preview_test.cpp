#include "library/preview.h"

#include "tests/test_folder.h"

#include <gtest/gtest.h>

namespace fs = std::filesystem;

TEST(Preview, RebuiltOnlyWhenThePointerEntersAnotherRow) {
  AppState state;
  EXPECT_TRUE(EnterHoverRow(state, 3));
  EXPECT_FALSE(EnterHoverRow(state, 3));
  EXPECT_TRUE(EnterHoverRow(state, 0));
  EXPECT_TRUE(EnterHoverRow(state, 3));
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
  AppState state;
  for (const char *name : {"S-Gone", "S-Locked"}) {
    GridRow folderRow;
    folderRow.path = lib.Path() / name;
    state.Unigrid.rows.push_back(folderRow);
  }
  lib.MakeFolder("S-Locked/contents.txt/not-a-file");
  for (int row : {-1, 0, 1, 2, 3}) {
    const FolderPreview preview = PreviewOfRow(state, row);
    EXPECT_EQ(preview.description, "") << row;
    EXPECT_TRUE(preview.picture.empty()) << row;
  }
}
