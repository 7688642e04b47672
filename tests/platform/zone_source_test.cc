#include "platform/zone_source.h"

#include <gtest/gtest.h>
#include <sys/stat.h>

#include <optional>
#include <string>

#include "support/env_guard.h"
#include "support/rule_text.h"
#include "support/temp_dir.h"
#include "support/tzif_bytes.h"

namespace {

using datetimelib::platform::CurrentRule;
using datetimelib::platform::LoadedZone;
using datetimelib::platform::LoadProcessZone;
using datetimelib::platform::LoadZone;
using datetimelib::platform::ZoneSettings;
using datetimelib::testing::EnvGuard;
using datetimelib::testing::RuleText;
using datetimelib::testing::TempDir;
using datetimelib::testing::TzifBytes;
using datetimelib::testing::TzifParts;
using Source = LoadedZone::Source;

// A zone file with one transition to `last_type` and the given footer.
std::string ZoneFile(const char* footer, std::uint8_t last_type = 1, char version = '2') {
  TzifParts parts;
  parts.version = version;
  parts.times = {1000000000};
  parts.type_indices = {last_type};
  parts.types = {{-10800, 0, 0}, {-7200, 1, 4}, {3600, 0, 8}};
  parts.designations = std::string("FST\0FDT\0GST\0", 12);
  parts.footer = footer;
  return TzifBytes(parts);
}

constexpr char kFileRule[] = "FST -10800 FDT -7200 M4.1.0@7200 M10.5.0@10800";
constexpr char kFooter[] = "\nFST3FDT,M4.1.0,M10.5.0/3\n";

// The folder of zone files the cases below see as TZDIR.
class ZoneSourceTest : public ::testing::Test {
 protected:
  void SetUp() override {
    ASSERT_TRUE(folder_.ok());
    folder_.Write("Test/Zone", ZoneFile(kFooter));
    folder_.Write("localtime", ZoneFile("\nGST-1\n"));
    folder_.Write("NotAZone", "TZ data it is not\n");
    folder_.Write("Version1", ZoneFile("", 2, '\0'));
    folder_.Write("EmptyFooter", ZoneFile("\n\n", 1));
    folder_.Write("BadFooter", ZoneFile("\nFST3FDT\n", 2));
    ASSERT_EQ(mkfifo(folder_.Path("Fifo").c_str(), 0600), 0);
  }

  ZoneSettings Settings(const char* tz) const {
    ZoneSettings settings;
    if (tz != nullptr) settings.tz = tz;
    settings.zone_folder = folder_.path();
    settings.localtime_path = folder_.Path("localtime");
    return settings;
  }

  TempDir folder_;
};

TEST_F(ZoneSourceTest, DecidesAsTheCLibraryDoes) {
  const std::string absolute = folder_.Path("Test/Zone");
  const struct {
    const char* tz;  // nullptr: TZ unset
    Source source;
    const char* rule;
  } cases[] = {
      // TZ unset: the local zone file.
      {nullptr, Source::kFile, "GST 3600"},
      // Empty: UTC, whatever files exist.
      {"", Source::kUtc, "UTC 0"},
      {":", Source::kUtc, "UTC 0"},
      // A zone file, with or without ":", under the folder or by absolute path.
      {"Test/Zone", Source::kFile, kFileRule},
      {":Test/Zone", Source::kFile, kFileRule},
      {absolute.c_str(), Source::kFile, kFileRule},
      // Files without a usable footer keep the type of their last transition, a
      // daylight one read with the standard offset before it.
      {"Version1", Source::kFile, "GST 3600"},
      {"EmptyFooter", Source::kFile, "FST -10800"},
      {"BadFooter", Source::kFile, "GST 3600"},
      // No such file, or not a zone file: a rule string, else UTC.
      {"EST5EDT,M3.2.0/2,M11.1.0", Source::kRule,
       "EST -18000 EDT -14400 M3.2.0@7200 M11.1.0@7200"},
      {":<+0530>-5:30", Source::kRule, "+0530 19800"},
      {"Missing/Zone", Source::kUtc, "UTC 0"},
      {"NotAZone", Source::kUtc, "UTC 0"},
      {"Test", Source::kUtc, "UTC 0"},  // a directory
      {"Fifo", Source::kUtc, "UTC 0"},  // never opened for reading, never waited on
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.tz == nullptr ? "(unset)" : c.tz);
    const LoadedZone zone = LoadZone(Settings(c.tz));
    EXPECT_EQ(zone.source, c.source);
    EXPECT_EQ(RuleText(CurrentRule(zone)), c.rule);
  }
}

TEST_F(ZoneSourceTest, UnreadableLocalZoneIsUtc) {
  ZoneSettings settings = Settings(nullptr);
  settings.localtime_path = folder_.Path("NotAZone");
  EXPECT_EQ(LoadZone(settings).source, Source::kUtc);
}

// A daylight name without rules: the transitions of the folder's "posixrules"
// file when it has two types or more and a footer with rules, else the C
// library's own ",M3.2.0,M11.1.0"; names and offsets always from TZ.
TEST_F(ZoneSourceTest, DaylightNameWithoutRules) {
  const char* const kFallback = "XST -10800 XDT -7200 M3.2.0@7200 M11.1.0@7200";
  TzifParts one_type;
  one_type.types = {{-10800, 0, 0}};
  one_type.designations = std::string("FST\0", 4);
  one_type.footer = kFooter;
  const struct {
    std::optional<std::string> posixrules;  // what the file holds, if there is one
    const char* rule;
  } cases[] = {
      {std::nullopt, kFallback},
      {"", kFallback},  // not a zone file
      {ZoneFile(kFooter), "XST -10800 XDT -7200 M4.1.0@7200 M10.5.0@10800"},
      {TzifBytes(one_type), kFallback},
      {ZoneFile("\nGST-1\n"), kFallback},  // no rule in its footer
  };
  for (const auto& c : cases) {
    TempDir folder;
    if (c.posixrules) folder.Write("posixrules", *c.posixrules);
    ZoneSettings settings;
    settings.zone_folder = folder.path();
    for (const char* tz : {"XST3XDT", "XST3XDT,"}) {
      settings.tz = tz;
      const LoadedZone zone = LoadZone(settings);
      EXPECT_EQ(zone.source, Source::kRule) << tz;
      EXPECT_EQ(RuleText(CurrentRule(zone)), c.rule) << tz;
    }
  }
}

// TZ and TZDIR are read at each call; an empty TZDIR means the system folder.
TEST_F(ZoneSourceTest, ReadsTheEnvironmentAtEachCall) {
  EnvGuard folder("TZDIR", folder_.path().c_str());
  {
    EnvGuard tz("TZ", "Test/Zone");
    EXPECT_EQ(RuleText(CurrentRule(LoadProcessZone())), kFileRule);
  }
  {
    EnvGuard tz("TZ", "<+01>-1");
    EXPECT_EQ(RuleText(CurrentRule(LoadProcessZone())), "+01 3600");
  }
  EnvGuard empty_folder("TZDIR", "");
  EXPECT_EQ(ZoneSettings::FromEnvironment().zone_folder, "/usr/share/zoneinfo");
  EnvGuard unset("TZ", nullptr);
  EXPECT_FALSE(ZoneSettings::FromEnvironment().tz.has_value());
}

}  // namespace
