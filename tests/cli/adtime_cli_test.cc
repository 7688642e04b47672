// adtime end to end: each subcommand, the exit statuses, batch mode and the
// escaping of hostile input, run against the built tool.
#include <gtest/gtest.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <string>
#include <vector>

#include "adtime_runner.h"

namespace adtime_test {
namespace {

using Args = std::vector<std::string>;

struct OutputCase {
  Args args;
  std::string out;
  int exit_status;
};

void ExpectOutputs(const std::vector<OutputCase>& cases, const RunOptions& options = {}) {
  for (const OutputCase& row : cases) {
    std::string command;
    for (const std::string& arg : row.args) command += " " + arg;
    SCOPED_TRACE("adtime" + command);
    const RunResult result = RunAdtime(row.args, options);
    EXPECT_EQ(result.out, row.out);
    EXPECT_EQ(result.exit_status, row.exit_status) << result.err;
  }
}

bool TestLocalesCompiled() {
  struct stat info {};
  return stat(ADTIME_TEST_LOCALE_DIR "/de_DE.utf8/LC_TIME", &info) == 0;
}

// All examples in New York (TZ=America/New_York): EST is UTC-5, EDT UTC-4.

TEST(AdtimeParse, PrintsEveryFieldOfValidTextsAndTheStatusOfOthers) {
  ExpectOutputs({
      {{"parse", "05-Jan-2003.10:00"},
       "input=05-Jan-2003.10:00 status=valid seconds=1041778800 local=\"2003-01-05 "
       "10:00:00\" gmt=\"2003-01-05 15:00:00\" compact=05-Jan-2003.10:00:00\n",
       0},
      // "UTC+2" adds two hours to the time read.
      {{"parse", "05-Jan-2003.10:00 UTC+2", "--output", "tsv"},
       "05-Jan-2003.10:00 UTC+2\tvalid\t1041768000\t2003-01-05 07:00:00\t"
       "2003-01-05 12:00:00\t05-Jan-2003.07:00:00\n",
       0},
      {{"parse", "tomorrow"}, "input=tomorrow status=invalid\n", 1},
      {{"parse", "--output=json", "17-May-2003.14:03:09", "05-Jan-2039"},
       "{\"input\":\"17-May-2003.14:03:09\",\"status\":\"valid\",\"seconds\":1053194589,"
       "\"local\":\"2003-05-17 14:03:09\",\"gmt\":\"2003-05-17 18:03:09\","
       "\"compact\":\"17-May-2003.14:03:09\"}\n"
       "{\"input\":\"05-Jan-2039\",\"status\":\"invalid\",\"seconds\":null,\"local\":"
       "null,"
       "\"gmt\":null,\"compact\":null}\n",
       1},
      // A text that starts with a dash is a text after "--".
      {{"parse", "--", "-05-Jan"}, "input=-05-Jan status=invalid\n", 1},
  });
}

TEST(AdtimeParse, KeywordsAreReadAgainstTheClock) {
  const RunResult result = RunAdtime({"parse", "now", "yesterday.14:30", "Fri"});
  EXPECT_EQ(result.exit_status, 0) << result.out;
  ASSERT_EQ(Lines(result.out).size(), 3u);
  EXPECT_NE(Lines(result.out)[1].find(" local=\""), std::string::npos);
  EXPECT_NE(Lines(result.out)[1].find(" 14:30:00\" gmt="), std::string::npos);
}

TEST(AdtimeRead, ReadsLocalAndGmtTextAndKeepsTheStatusOfRefusedText) {
  ExpectOutputs({
      {{"read", "2003-05-17 14:03:09", "--output", "tsv"},
       "2003-05-17 14:03:09\tvalid\t1053194589\t2003-05-17 14:03:09\t"
       "2003-05-17 18:03:09\t17-May-2003.14:03:09\n",
       0},
      {{"read", "--gmt", "2001-09-09 01:46:40", "--output", "tsv"},
       "2001-09-09 01:46:40\tvalid\t1000000000\t2001-09-08 21:46:40\t"
       "2001-09-09 01:46:40\t08-Sep-2001.21:46:40\n",
       0},
      {{"read", "2040-01-01 00:00:00"},
       "input=\"2040-01-01 00:00:00\" status=outOfRange\n",
       1},
      {{"read", "2003-02-30 00:00:00"},
       "input=\"2003-02-30 00:00:00\" status=invalid\n",
       1},
  });
}

TEST(AdtimeRead, ReadsInTheNamedLocale) {
  if (!TestLocalesCompiled()) GTEST_SKIP() << "test locales not compiled";
  RunOptions options;
  options.extra_environment = {"LOCPATH=" ADTIME_TEST_LOCALE_DIR,
                               "LSAN_OPTIONS=suppressions=" ADTIME_LSAN_SUPPRESSIONS};
  ExpectOutputs({{{"read", "--locale", "de_DE.UTF-8", "--output", "tsv", "17.05.2003"},
                  "17.05.2003\tvalid\t1053144000\t2003-05-17 00:00:00\t"
                  "2003-05-17 04:00:00\t17-May-2003.00:00:00\n",
                  0},
                 // The same text means nothing in the C locale.
                 {{"read", "17.05.2003"}, "input=17.05.2003 status=invalid\n", 1}},
                options);
}

TEST(AdtimeFormat, WritesPatternsLocallyInUtcAndInLocaleForms) {
  ExpectOutputs({
      {{"format", "1000000000"}, "2001-09-08 21:46:40\n", 0},
      {{"format", "1000000000", "%A %d %B %Y %H:%M %Z", "--gmt"},
       "Sunday 09 September 2001 01:46 GMT\n",
       0},
      {{"format", "-1", "%Y-%m-%d %H:%M:%S %Z"}, "1969-12-31 18:59:59 EST\n", 0},
      {{"format", "1000000000", "--output", "json"},
       "{\"seconds\":1000000000,\"text\":\"2001-09-08 21:46:40\"}\n",
       0},
      // 127 is the invariant locale ("C"): %x and %X.
      {{"format", "1053194589", "--locale", "127"}, "05/17/03 14:03:09\n", 0},
      {{"format", "1053194589", "--locale", "127", "--only", "date"}, "05/17/03\n", 0},
      {{"compact", "1000000000"}, "08-Sep-2001.21:46:40\n", 0},
      {{"compact", "2147483647", "--output", "tsv"},
       "2147483647\t18-Jan-2038.22:14:07\n",
       0},
  });
}

TEST(AdtimeFormat, NowIsTheCurrentTime) {
  const RunResult result = RunAdtime({"format", "now", "%Y"});
  EXPECT_EQ(result.exit_status, 0);
  EXPECT_EQ(result.out.size(), 5u) << result.out;
}

TEST(AdtimeWeek, GivesTheWeekAroundADateAndOutOfRangeAtTheEnds) {
  ExpectOutputs({
      {{"week", "2003", "6", "18"},
       "year=2003 month=6 day=18 leap_year=0 days_in_month=30 start_status=valid "
       "start=\"2003-06-15 00:00:00\" end_status=valid end=\"2003-06-21 00:00:00\"\n",
       0},
      // Month 13 carries into the next year.
      {{"week", "2000", "13", "1", "--output", "tsv"},
       "2000\t13\t1\t1\t30\tvalid\t2000-12-31 00:00:00\tvalid\t2001-01-06 00:00:00\n",
       0},
      {{"week", "1970", "1", "2", "--output", "json"},
       "{\"year\":1970,\"month\":1,\"day\":2,\"leap_year\":0,\"days_in_month\":31,"
       "\"start_status\":\"outOfRange\",\"start\":\"1969/12/28 0:0:0\","
       "\"end_status\":\"valid\",\"end\":\"1970-01-03 00:00:00\"}\n",
       1},
  });
}

// --- Time zone ------------------------------------------------------------------------

TEST(AdtimeZone, ReportsTheZoneOfTz) {
  const struct {
    const char* tz;
    const char* fields;  // what the JSON line holds before "year"
    bool has_dst;
  } cases[] = {
      {"EST5EDT,M3.2.0,M11.1.0",
       R"({"zone":"EST5EDT,M3.2.0,M11.1.0","offset_minutes":300,"uses_dst":1,)", true},
      {"<+0530>-5:30", R"({"zone":"<+0530>-5:30","offset_minutes":-330,"uses_dst":0,)",
       false},
      {"Asia/Tokyo", R"({"zone":"Asia/Tokyo","offset_minutes":-540,"uses_dst":0,)",
       false},
  };
  for (const auto& row : cases) {
    SCOPED_TRACE(row.tz);
    RunOptions options;
    options.tz = row.tz;
    const RunResult result = RunAdtime({"zone", "--output", "json"}, options);
    EXPECT_EQ(result.exit_status, 0);
    EXPECT_EQ(result.out.rfind(row.fields, 0), 0u) << result.out;
    EXPECT_EQ(result.out.find(R"("dst_start":null)") == std::string::npos, row.has_dst)
        << result.out;
  }
}

TEST(AdtimeDst, GivesTheDatesOfEachYearFromTheRuleOrTheTable) {
  ExpectOutputs({
      {{"dst", "2007", "2008"},
       "year=2007 status=valid start=\"2007-03-11 01:59:59\" end=\"2007-11-04 "
       "02:00:00\"\n"
       "year=2008 status=valid start=\"2008-03-09 01:59:59\" end=\"2008-11-02 "
       "02:00:00\"\n",
       0},
      // The 2039 dates lie past 2038-01-18.
      {{"dst", "2039", "--output", "tsv"},
       "2039\toutOfRange\t2039/3/13 1:59:59\t2039/11/6 2:0:0\n",
       1},
  });
  RunOptions tokyo;
  tokyo.tz = "Asia/Tokyo";
  ExpectOutputs({{{"dst", "2007"}, "year=2007 status=none\n", 0}}, tokyo);
}

TEST(AdtimeDst, ATableEntryComesBeforeTheRule) {
  char dir_template[] = "/tmp/adtime_table_XXXXXX";
  ASSERT_NE(mkdtemp(dir_template), nullptr);
  const std::string dir = dir_template;
  const std::string table = dir + "/dst_dates.dat";
  {
    std::ofstream out(table);
    out << "# our own dates\n2004-04-11 01:59:59;2004-10-24 02:00:00\n";
  }
  ExpectOutputs({{{"dst", "--table", dir, "2004", "2005", "--output", "tsv"},
                  "2004\tvalid\t2004-04-11 01:59:59\t2004-10-24 02:00:00\n"
                  "2005\tvalid\t2005-03-13 01:59:59\t2005-11-06 02:00:00\n",
                  0}});
  std::remove(table.c_str());
  rmdir(dir.c_str());
}

TEST(AdtimeUsage, RefusesBadCommandLinesWithStatusTwoAndAReason) {
  const struct {
    Args args;
    const char* reason;  // part of the message on standard error
  } cases[] = {
      {{}, "no command"},
      {{"frobnicate"}, "unknown command"},
      {{"parse"}, "at least one TEXT"},
      {{"parse", "--bogus", "x"}, "unknown option --bogus"},
      {{"parse", "--output"}, "needs a value"},
      {{"parse", "--output", "xml", "x"}, "text, tsv or json"},
      {{"parse", "--help=yes"}, "takes no value"},
      {{"read", "--locale", "xx_XX.NOPE", "x"}, "not installed"},
      {{"format"}, "SECONDS"},
      {{"format", "12x"}, "whole number"},
      {{"format", "+-5"}, "whole number"},
      {{"format", "2147483648"}, "outside"},
      {{"format", "-2147483649"}, "outside"},
      {{"format", "1", "%Y", "extra"}, "at most one PATTERN"},
      {{"format", "1", "--only", "date"}, "--only goes with --locale"},
      {{"format", "1", "--locale", "1033", "--gmt"}, "do not go together"},
      {{"format", "1", "--locale", "4294967296"}, "outside"},
      {{"compact"}, "one SECONDS"},
      {{"week", "2003", "6"}, "YEAR MONTH DAY"},
      {{"week", "2003", "June", "1"}, "MONTH must be a whole number"},
      {{"week", "99999999999", "1", "1"}, "outside"},
      {{"zone", "now"}, "no arguments"},
      {{"dst"}, "at least one YEAR"},
      {{"dst", "2007", "next"}, "YEAR must be a whole number"},
      {{"dst", "--table"}, "needs a value"},
  };
  for (const auto& row : cases) {
    std::string command;
    for (const std::string& arg : row.args) command += " " + arg;
    SCOPED_TRACE("adtime" + command);
    const RunResult result = RunAdtime(row.args);
    EXPECT_EQ(result.exit_status, 2);
    EXPECT_EQ(result.out, "");
    EXPECT_NE(result.err.find(row.reason), std::string::npos) << result.err;
  }
}

TEST(AdtimeUsage, EveryCommandHasHelp) {
  for (const char* command :
       {"parse", "read", "format", "compact", "week", "zone", "dst"}) {
    SCOPED_TRACE(command);
    const RunResult result = RunAdtime({command, "--help"});
    EXPECT_EQ(result.exit_status, 0);
    EXPECT_EQ(result.out.rfind(std::string("Usage: adtime ") + command, 0), 0u)
        << result.out;
  }
  const RunResult top = RunAdtime({"--help"});
  EXPECT_EQ(top.exit_status, 0);
  EXPECT_NE(top.out.find("Commands:"), std::string::npos);
}

TEST(AdtimeOutput, AFullOutputIsAnErrorNotSilence) {
  RunOptions options;
  options.stdout_path = "/dev/full";
  const RunResult result = RunAdtime({"parse", "05-Jan-2003"}, options);
  EXPECT_EQ(result.exit_status, 2);
  EXPECT_NE(result.err.find("cannot write"), std::string::npos) << result.err;
}

// --- Batch mode ---------------------------------------------------------------------

TEST(AdtimeBatch, WritesOneResultPerInputLineWhateverTheLineHolds) {
  const std::string long_line(10000, 'x');
  RunOptions options;
  options.input = std::string("05-Jan-2003.10:00\n") +   // valid
                  "tomorrow\n" +                         // invalid
                  "\n" +                                 // empty: invalid
                  "17-May-2003.14:03:09\r\n" +           // CRLF: the CR is dropped
                  std::string("05-Jan-2003\0x\n", 14) +  // a NUL: invalid unread
                  long_line + "\n" +                     // too long: invalid unread
                  "\r\n" +                               // empty after the CR
                  "05-Jan-2003";                         // no final line feed
  const RunResult result = RunAdtime({"parse", "-", "--output", "tsv"}, options);
  EXPECT_EQ(result.exit_status, 1);

  const std::vector<std::string> lines = Lines(result.out);
  const struct {
    std::string input;
    const char* status;
  } expected[] = {
      {"05-Jan-2003.10:00", "valid"},
      {"tomorrow", "invalid"},
      {"", "invalid"},
      {"17-May-2003.14:03:09", "valid"},
      {"05-Jan-2003\\x00x", "invalid"},
      {std::string(4096, 'x'), "invalid"},
      {"", "invalid"},
      {"05-Jan-2003", "valid"},
  };
  ASSERT_EQ(lines.size(), std::size(expected)) << result.out;
  for (std::size_t i = 0; i < lines.size(); ++i) {
    SCOPED_TRACE("line " + std::to_string(i + 1));
    const std::string prefix = expected[i].input + "\t" + expected[i].status + "\t";
    EXPECT_EQ(lines[i].substr(0, prefix.size()), prefix);
    // Every row has the same six columns, empty ones included.
    EXPECT_EQ(std::count(lines[i].begin(), lines[i].end(), '\t'), 5);
  }
}

TEST(AdtimeBatch, StatusIsZeroOnlyWhenEveryLineIsValid) {
  RunOptions options;
  options.input = "2003-05-17 14:03:09\n2001-09-09 01:46:40\n";
  EXPECT_EQ(RunAdtime({"read", "-"}, options).exit_status, 0);
  options.input += "\n";
  EXPECT_EQ(RunAdtime({"read", "-"}, options).exit_status, 1);
  options.input = "";
  const RunResult empty = RunAdtime({"read", "-"}, options);
  EXPECT_EQ(empty.exit_status, 0);
  EXPECT_EQ(empty.out, "");
}

TEST(AdtimeBatch, MixesArgumentsAndStandardInputInOrder) {
  RunOptions options;
  options.input = "b\nc\n";
  const RunResult result =
      RunAdtime({"parse", "a", "-", "d", "--output", "tsv"}, options);
  const std::vector<std::string> lines = Lines(result.out);
  ASSERT_EQ(lines.size(), 4u);
  EXPECT_EQ(lines[0][0], 'a');
  EXPECT_EQ(lines[1][0], 'b');
  EXPECT_EQ(lines[2][0], 'c');
  EXPECT_EQ(lines[3][0], 'd');
}

TEST(AdtimeBatch, KeepsLinesAcrossBufferRefills) {
  // Far more input than one read buffer: no line is lost or split at the seams.
  std::string input;
  const int kLines = 50000;
  for (int i = 0; i < kLines; ++i)
    input += (i % 3 == 0 ? "bad\n" : "05-Jan-2003.10:00\n");
  RunOptions options;
  options.input = input;
  const RunResult result = RunAdtime({"parse", "-", "--output", "tsv"}, options);
  const std::vector<std::string> lines = Lines(result.out);
  ASSERT_EQ(lines.size(), static_cast<std::size_t>(kLines));
  for (int i = 0; i < kLines; i += 997) {
    EXPECT_EQ(lines[static_cast<std::size_t>(i)].substr(0, 4),
              i % 3 == 0 ? "bad\t" : "05-J");
  }
}

// --- Escaping of hostile input ------------------------------------------------------

TEST(AdtimeEscaping, JsonStringsStayValidWhateverTheBytes) {
  const struct {
    std::string input;
    const char* json;  // the "input" member as written
  } cases[] = {
      {"quote\" backslash\\", R"("quote\" backslash\\")"},
      {"\t\b\f\x01\x1f\x7f", R"("\t\b\f\u0001\u001f\u007f")"},
      {"\x1b[31mred", R"("\u001b[31mred")"},
      // Well-formed UTF-8 passes through.
      {"d\xc3\xa9j\xc3\xa0 \xe2\x82\xac \xf0\x9f\x98\x80",
       "\"d\xc3\xa9j\xc3\xa0 \xe2\x82\xac \xf0\x9f\x98\x80\""},
      // Each byte that is not well-formed UTF-8 becomes U+FFFD.
      {"\x80", R"("\ufffd")"},                                // stray continuation byte
      {"\xc0\xaf", R"("\ufffd\ufffd")"},                      // overlong "/"
      {"\xed\xa0\x80", R"("\ufffd\ufffd\ufffd")"},            // a surrogate
      {"\xf4\x90\x80\x80", R"("\ufffd\ufffd\ufffd\ufffd")"},  // above U+10FFFF
      {"\xe2\x82", R"("\ufffd\ufffd")"},                      // cut short at the end
      {"\xe2\x82x", R"("\ufffd\ufffdx")"},                    // cut short before ASCII
      {"\xff\xfe", R"("\ufffd\ufffd")"},
  };
  for (const auto& row : cases) {
    SCOPED_TRACE(row.json);
    RunOptions options;
    options.input = row.input + "\n";
    const RunResult result = RunAdtime({"parse", "-", "--output", "json"}, options);
    const std::string expected =
        std::string("{\"input\":") + row.json +
        ",\"status\":\"invalid\",\"seconds\":null,\"local\":null,"
        "\"gmt\":null,\"compact\":null}\n";
    EXPECT_EQ(result.out, expected);
  }
}

TEST(AdtimeEscaping, TextAndTsvNeverSplitALineOrAField) {
  ExpectOutputs({
      {{"parse", "a\tb\nc\\d\xff"}, "input=a\\tb\\nc\\\\d\\xff status=invalid\n", 1},
      {{"parse", "say \"hi\"=x"}, "input=\"say \\\"hi\\\"=x\" status=invalid\n", 1},
      {{"parse", "a\tb\nc", "--output", "tsv"}, "a\\tb\\nc\tinvalid\t\t\t\t\n", 1},
  });
}

}  // namespace
}  // namespace adtime_test
