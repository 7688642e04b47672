#include "platform/zone/zone_source.h"

#include <gtest/gtest.h>
#include <sys/stat.h>

#include <string>
#include <utility>

#include "support/rule_text.h"
#include "support/temp_dir.h"
#include "support/tzif_bytes.h"

namespace {

using datetimelib::platform::CurrentRule;
using datetimelib::platform::LoadZone;
using Source = datetimelib::platform::LoadedZone::Source;

// A zone file with one transition to `last_type` and the given footer.
std::string ZoneFile(const char* footer, std::uint8_t last_type = 1, char version = '2') {
  datetimelib::testing::TzifParts parts;
  parts.version = version;
  parts.times = {1000000000};
  parts.type_indices = {last_type};
  parts.types = {{-10800, 0, 0}, {-7200, 1, 4}, {3600, 0, 8}};
  parts.designations = std::string("FST\0FDT\0GST\0", 12);
  parts.footer = footer;
  return datetimelib::testing::TzifBytes(parts);
}

// The cases that the zone engine's agreement with glibc (zone_timeline_test)
// does not reach: an empty TZ, rule strings and missing files are among its
// sample zones.
TEST(LoadZone, DecidesAsTheCLibraryDoes) {
  constexpr char kFooter[] = "\nFST3FDT,M4.1.0,M10.5.0/3\n";
  constexpr char kFileRule[] = "FST -10800 FDT -7200 M4.1.0@7200 M10.5.0@10800";
  datetimelib::testing::TempDir folder;
  ASSERT_TRUE(folder.ok());
  for (const auto& [name, bytes] : {std::pair{"Test/Zone", ZoneFile(kFooter)},
                                    {"posixrules", ZoneFile(kFooter)},
                                    {"NotAZone", std::string("TZ data it is not\n")},
                                    {"Version1", ZoneFile("", 2, '\0')},
                                    {"EmptyFooter", ZoneFile("\n\n", 1)},
                                    {"BadFooter", ZoneFile("\nFST3FDT\n", 2)}})
    folder.Write(name, bytes);
  ASSERT_EQ(mkfifo(folder.Path("Fifo").c_str(), 0600), 0);
  const struct {
    const char* tz;  // nullptr: TZ unset
    Source source;
    const char* rule;
  } cases[] = {
      // TZ unset: the local zone file (here Version1's).
      {nullptr, Source::kFile, "GST 3600"},
      // ":" is as empty: UTC, whatever files exist.
      {":", Source::kUtc, "UTC 0"},
      // A zone file under the folder, named with ":" (an absolute path in TZ is
      // read in zone_timeline_test).
      {":Test/Zone", Source::kFile, kFileRule},
      // Files without a usable footer keep the type of their last transition, a
      // daylight one read with the standard offset before it.
      {"Version1", Source::kFile, "GST 3600"},
      {"EmptyFooter", Source::kFile, "FST -10800"},
      {"BadFooter", Source::kFile, "GST 3600"},
      // Not a zone file, nor a rule string: UTC.
      {"NotAZone", Source::kUtc, "UTC 0"},
      {"Fifo", Source::kUtc, "UTC 0"},  // never opened for reading, never waited on
      // A daylight name without rules: the transitions of the folder's
      // "posixrules" (else ",M3.2.0,M11.1.0"), the names and offsets of TZ.
      {"XST5XDT", Source::kRule, "XST -18000 XDT -14400 M4.1.0@7200 M10.5.0@10800"},
  };
  for (const auto& c : cases) {
    SCOPED_TRACE(c.tz == nullptr ? "(unset)" : c.tz);
    const auto zone = LoadZone({c.tz ? std::optional<std::string>(c.tz) : std::nullopt,
                                folder.path(), folder.Path("Version1")});
    EXPECT_EQ(zone.source, c.source);
    EXPECT_EQ(datetimelib::testing::RuleText(CurrentRule(zone)), c.rule);
  }
}

}  // namespace
