#include "base/plain_name.h"

#include <gtest/gtest.h>

#include <string>

TEST(PlainName, TakesOrdinaryNamesOfAnyBytesAndRefusesEveryPathOrDevice) {
  for (const std::string name : {"game.cfg", "m1.msn", "F-Spitfire", "a..b", ".hidden",
                                 "\xC4nderung.txt", "COM0", "console.txt", "nul_x.dat"}) {
    EXPECT_TRUE(IsPlainName(name)) << name;
  }
  const std::string refused[] = {"",
                                 ".",
                                 "..",
                                 "../victim.dat",
                                 "a/b",
                                 "a\\b",
                                 "C:x",
                                 "/etc/passwd",
                                 "CON",
                                 "nul.txt",
                                 "Com1.ini",
                                 "lpt9",
                                 "nul .txt",
                                 "name.",
                                 "name ",
                                 std::string("a\0b", 3),
                                 "tab\there",
                                 std::string(256, 'x'),
                                 "com\xC2\xB9.ini"};
  for (const std::string &name : refused) {
    EXPECT_FALSE(IsPlainName(name)) << name;
  }
}
