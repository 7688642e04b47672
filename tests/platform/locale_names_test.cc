#include "platform/locale_names.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace {

using datetimelib::platform::LanguageRegionName;
using datetimelib::platform::LocaleNameCandidates;

TEST(LanguageRegionName, NamedNumbersAndOthers) {
  const struct {
    std::uint32_t identifier;
    const char* name;  // nullptr: not in the table
  } cases[] = {
      {1033, "en_US"},
      {2057, "en_GB"},
      {1031, "de_DE"},
      {1036, "fr_FR"},
      {1040, "it_IT"},
      {3082, "es_ES"},
      {1043, "nl_NL"},
      {1046, "pt_BR"},
      {1049, "ru_RU"},
      {1041, "ja_JP"},
      {2052, "zh_CN"},
      {1042, "ko_KR"},
      // The special numbers and numbers of no language.
      {127, nullptr},
      {1024, nullptr},
      {2048, nullptr},
      {0, nullptr},
      {1047, nullptr},
      {1032 + 0x10000, nullptr},
      {0xFFFFFFFF, nullptr},
  };
  for (const auto& c : cases) {
    const char* name = LanguageRegionName(c.identifier);
    if (c.name == nullptr) {
      EXPECT_EQ(name, nullptr) << c.identifier;
    } else {
      ASSERT_NE(name, nullptr) << c.identifier;
      EXPECT_STREQ(name, c.name);
    }
  }
}

TEST(LocaleNameCandidates, UtfEightFirst) {
  EXPECT_EQ(LocaleNameCandidates(1041),
            (std::vector<std::string>{"ja_JP.UTF-8", "ja_JP"}));
  EXPECT_TRUE(LocaleNameCandidates(4242).empty());
}

}  // namespace
