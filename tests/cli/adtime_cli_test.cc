// adtime end to end: the built tool run as a child process with a given standard
// input, a fixed TZ and the C locale. Each command's output and exit status, usage
// errors, batch mode and the escaping of hostile input.
#include <gtest/gtest.h>
#include <sys/wait.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <sstream>
#include <string>
#include <vector>

namespace {

using Args = std::vector<std::string>;

struct RunOptions {
  std::string input = "";             // the tool's standard input
  Args environment = {};              // "NAME=value", TZ=America/New_York unless set
  const char* stdout_path = nullptr;  // where standard output goes if not captured
};

struct RunResult {
  int exit_status;  // a signal that ends adtime shows as 128 + its number
  std::string out, err;
};

std::string ShellQuoted(const std::string& text) {
  std::string quoted = "'";
  for (char c : text) quoted += c == '\'' ? std::string("'\\''") : std::string(1, c);
  return quoted + "'";
}

std::string ReadFile(const std::string& path) {
  std::ostringstream text;
  text << std::ifstream(path, std::ios::binary).rdbuf();
  return text.str();
}

// Runs adtime with `args` through the shell. LC_ALL=C overrides LANG and LC_*, and
// LOCPATH is dropped, so no result depends on the machine's settings.
RunResult RunAdtime(const Args& args, const RunOptions& options = {}) {
  char dir[] = "/tmp/adtime_XXXXXX";
  if (mkdtemp(dir) == nullptr) return {-1, "", "mkdtemp failed"};
  const std::string path = std::string(dir) + "/";
  std::ofstream(path + "in", std::ios::binary) << options.input;
  std::string command = "env -u LOCPATH LC_ALL=C TZ=America/New_York";
  for (const auto& setting : options.environment) command += " " + ShellQuoted(setting);
  command += " " + ShellQuoted(ADTIME_PATH);
  for (const std::string& arg : args) command += " " + ShellQuoted(arg);
  command += " <" + path + "in 2>" + path + "err >" +
             (options.stdout_path ? options.stdout_path : path + "out");
  const int status = std::system(command.c_str());
  RunResult result{WIFEXITED(status) ? WEXITSTATUS(status) : -1, ReadFile(path + "out"),
                   ReadFile(path + "err")};
  for (const char* name : {"in", "out", "err", ""}) std::remove((path + name).c_str());
  return result;
}

// New York: EST is UTC-5, EDT UTC-4.
TEST(AdtimeCommands, WriteTheirResultsAndExitStatus) {
  char table_dir[] = "/tmp/adtime_table_XXXXXX";
  ASSERT_NE(mkdtemp(table_dir), nullptr);
  std::ofstream(std::string(table_dir) + "/dst_dates.dat")
      << "# our own dates\n2004-04-11 01:59:59;2004-10-24 02:00:00\n";
  const struct {
    int exit_status;
    Args args;
    std::string out;
    RunOptions options = {};
  } cases[] = {
      // parse; "-" reads standard input in its place, and "--" ends the options
      {0,
       {"parse", "05-Jan-2003.10:00"},
       "input=05-Jan-2003.10:00 status=valid seconds=1041778800 local=\"2003-01-05 "
       "10:00:00\" gmt=\"2003-01-05 15:00:00\" compact=05-Jan-2003.10:00:00\n"},
      {1,
       {"parse", "-", "--", "-d"},
       "input=b status=invalid\ninput=-d status=invalid\n",
       {"b\n"}},
      // read: --gmt on standard input, and an empty standard input
      {0,
       {"read", "--gmt", "-", "--output", "tsv"},
       "2001-09-09 01:46:40\tvalid\t1000000000\t2001-09-08 21:46:40\t"
       "2001-09-09 01:46:40\t08-Sep-2001.21:46:40\n",
       {"2001-09-09 01:46:40\n"}},
      // format (a pattern, the default one in UTC, the locale form) and compact; 127 is
      // the invariant locale ("C"): %x and %X
      {0, {"format", "-1", "%Y-%m-%d %H:%M:%S %Z"}, "1969-12-31 18:59:59 EST\n"},
      {0,
       {"format", "1000000000", "--gmt", "--output", "json"},
       "{\"seconds\":1000000000,\"text\":\"2001-09-09 01:46:40\"}\n"},
      {0, {"compact", "2147483647"}, "18-Jan-2038.22:14:07\n"},
      // week
      {0,
       {"week", "2003", "6", "18", "--output", "tsv"},
       "2003\t6\t18\t0\t30\tvalid\t2003-06-15 00:00:00\tvalid\t2003-06-21 00:00:00\n"},
      {1,
       {"week", "1970", "1", "2", "--output", "tsv"},
       "1970\t1\t2\t0\t31\toutOfRange\t1969/12/28 0:0:0\tvalid\t1970-01-03 00:00:00\n"},
      // dst: 2004 from the table, 2005 from the rule; 2039 lies past 2038-01-18
      {0,
       {"dst", "--table", table_dir, "2004", "2005", "--output", "tsv"},
       "2004\tvalid\t2004-04-11 01:59:59\t2004-10-24 02:00:00\n"
       "2005\tvalid\t2005-03-13 01:59:59\t2005-11-06 02:00:00\n"},
      {1,
       {"dst", "2039", "--output", "tsv"},
       "2039\toutOfRange\t2039/3/13 1:59:59\t2039/11/6 2:0:0\n"},
      {0, {"dst", "2007"}, "year=2007 status=none\n", {"", {"TZ=Asia/Tokyo"}}},
      // Hostile bytes in text and TSV: escaped; text quotes a value with " = or space
      {1, {"parse", "a\tb\nc\\d\xff"}, "input=a\\tb\\nc\\\\d\\xff status=invalid\n"},
      {1, {"parse", "a\tb\nc", "--output", "tsv"}, "a\\tb\\nc\tinvalid\t\t\t\t\n"},
  };
  for (const auto& row : cases) {
    const RunResult result = RunAdtime(row.args, row.options);
    EXPECT_EQ(result.out, row.out) << testing::PrintToString(row.args);
    EXPECT_EQ(result.exit_status, row.exit_status) << testing::PrintToString(row.args);
  }
  std::remove((std::string(table_dir) + "/dst_dates.dat").c_str());
  std::remove(table_dir);
}

TEST(AdtimeRead, ReadsInTheNamedLocale) {
  if (!std::ifstream(ADTIME_TEST_LOCALE_DIR "/de_DE.utf8/LC_TIME"))
    GTEST_SKIP() << "test locales not compiled";
  const RunResult result =
      RunAdtime({"read", "--locale", "de_DE.UTF-8", "--output", "tsv", "17.05.2003"},
                {"",
                 {"LOCPATH=" ADTIME_TEST_LOCALE_DIR,
                  "LSAN_OPTIONS=suppressions=" ADTIME_LSAN_SUPPRESSIONS}});
  EXPECT_EQ(result.out,
            "17.05.2003\tvalid\t1053144000\t2003-05-17 00:00:00\t"
            "2003-05-17 04:00:00\t17-May-2003.00:00:00\n");
  EXPECT_EQ(result.exit_status, 0) << result.err;
}

TEST(AdtimeZone, ReportsTheOffsetAndDaylightSavingOfTz) {
  // The line up to this year's number; this year's dates follow with DST.
  const RunResult result = RunAdtime({"zone"}, {"", {"TZ=EST5EDT,M3.2.0,M11.1.0"}});
  EXPECT_EQ(result.exit_status, 0);
  EXPECT_EQ(result.out.rfind("zone=EST5EDT,M3.2.0,M11.1.0 offset_minutes=300 uses_dst=1 "
                             "year=",
                             0),
            0u)
      << result.out;
  EXPECT_NE(result.out.find(" dst_start=\""), std::string::npos) << result.out;
}

TEST(AdtimeUsage, ExitsTwoWithTheReasonOnStandardError) {
  const struct {
    Args args;
    const char* reason;  // part of the message on standard error
    RunOptions options = {};
  } cases[] = {
      {{}, "no command"},
      {{"frobnicate"}, "unknown command"},
      {{"format", "+-5"}, "whole number"},
      {{"format", "2147483648"}, "outside"},
      // An output that cannot be written is an error, not silence.
      {{"parse", "05-Jan-2003"}, "cannot write", {"", {}, "/dev/full"}},
  };
  for (const auto& row : cases) {
    const RunResult result = RunAdtime(row.args, row.options);
    EXPECT_EQ(result.exit_status, 2) << testing::PrintToString(row.args);
    EXPECT_EQ(result.out, "") << testing::PrintToString(row.args);
    EXPECT_NE(result.err.find(row.reason), std::string::npos) << result.err;
  }
}

// --version names the library the loader mapped, not the one adtime was built
// with: a copy under a later release's file name, found first through
// LD_LIBRARY_PATH behind the same SONAME link, is the one reported.
TEST(AdtimeVersion, NamesTheLoadedLibraryItsVersionAndSoname) {
  const std::string linker_name = ADTIME_LIBRARY_LINKER_NAME;
  const std::string soname = ADTIME_LIBRARY_SONAME;
  char dir[] = "/tmp/adtime_library_XXXXXX";
  ASSERT_NE(mkdtemp(dir), nullptr);
  const std::string upgraded = std::string(dir) + "/" + soname + ".99";
  std::ofstream(upgraded, std::ios::binary)
      << std::ifstream(ADTIME_LIBRARY_FILE, std::ios::binary).rdbuf();
  const std::string link = std::string(dir) + "/" + soname;
  ASSERT_EQ(symlink(upgraded.c_str(), link.c_str()), 0);
  const RunResult result =
      RunAdtime({"--version"}, {"", {std::string("LD_LIBRARY_PATH=") + dir}});
  EXPECT_EQ(result.out, "adtime " ADTIME_TOOL_VERSION "\n" + linker_name + " " +
                            soname.substr(linker_name.size() + 1) + ".99 (SONAME " +
                            soname + ") from " + upgraded + "\n");
  for (const std::string& path : {link, upgraded, std::string(dir)})
    std::remove(path.c_str());
}

TEST(AdtimeBatch, WritesOneResultPerInputLineWhateverTheLineHolds) {
  // Each line, then the input and status columns of its result.
  std::vector<std::pair<std::string, std::string>> cases = {
      {"\n", "\tinvalid"},
      {"17-May-2003.14:03:09\r\n", "17-May-2003.14:03:09\tvalid"},  // CR dropped
      // A NUL, and a line too long (and longer than the read buffer): refused unread
      {std::string("05-Jan-2003\0x\n", 14), "05-Jan-2003\\x00x\tinvalid"},
      {std::string(100000, 'x') + "\n", std::string(4096, 'x') + "\tinvalid"},
  };
  // Far more lines than one read buffer holds, of two lengths so that the seams fall
  // anywhere, and a last line without a line feed.
  for (int i = 0; i < 50000; ++i) {
    const std::string text = i % 3 ? "05-Jan-2003.10:00" : "05-Jan-2003";
    cases.emplace_back(text + "\n", text + "\tvalid");
  }
  cases.emplace_back("05-Jan-2003", "05-Jan-2003\tvalid");
  RunOptions options;
  for (const auto& row : cases) options.input += row.first;
  const RunResult result = RunAdtime({"parse", "-", "--output", "tsv"}, options);
  EXPECT_EQ(result.exit_status, 1);
  std::istringstream lines(result.out);
  std::string line;
  for (std::size_t i = 0; i < cases.size(); ++i) {
    ASSERT_TRUE(std::getline(lines, line)) << "no result for line " << i + 1;
    ASSERT_EQ(line.rfind(cases[i].second + "\t", 0), 0u) << "line " << i + 1;
  }
  EXPECT_FALSE(std::getline(lines, line)) << "more results than lines";
}

TEST(AdtimeEscaping, JsonStringsStayValidWhateverTheBytes) {
  const std::pair<std::string, std::string> cases[] = {
      // text, then as written
      {"q\"b\\\t\n\b\f\x01\x1f\x7f", R"("q\"b\\\t\n\b\f\u0001\u001f\u007f")"},
      // Well-formed UTF-8 as it is, U+FFFD for each byte of anything else
      {"\xed\xa0\x80", R"("\ufffd\ufffd\ufffd")"},            // a surrogate
      {"\xf4\x90\x80\x80", R"("\ufffd\ufffd\ufffd\ufffd")"},  // above U+10FFFF
      {"\xe2\x82x", R"("\ufffd\ufffdx")"},                    // cut short before ASCII
  };
  for (const auto& [text, json] : cases) {
    EXPECT_EQ(RunAdtime({"parse", "--output=json", text}).out,
              "{\"input\":" + json +
                  ",\"status\":\"invalid\",\"seconds\":null,\"local\":null,"
                  "\"gmt\":null,\"compact\":null}\n");
  }
}

}  // namespace
