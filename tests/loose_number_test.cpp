#include "settings/loose_number.h"

#include <gtest/gtest.h>

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
