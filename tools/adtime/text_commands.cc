// parse and read: text in, one record per text out, from the command line or,
// for "-", from standard input one line at a time.
#include <AdDateTime.h>
#include <locale.h>  // newlocale, uselocale, freelocale (POSIX)

#include <clocale>
#include <cstdio>
#include <memory>
#include <string>
#include <string_view>

#include "commands.h"
#include "escape.h"
#include "line_reader.h"
#include "output_buffer.h"

namespace adtime {
namespace {

// No date text comes near this length; longer texts are refused unread, which
// keeps a batch run's memory bounded whatever its input.
constexpr std::size_t kMaxTextBytes = 4096;

constexpr const char kParseHelp[] =
    "Usage: adtime parse [--output text|tsv|json] TEXT...\n"
    "\n"
    "Reads each TEXT as a person types a date (ParseTolvaneDateTime), in the local\n"
    "time of TZ: \"now\", \"today\", \"yesterday.14:30\", \"Fri\", \"05-Jan\",\n"
    "\"05-Jan-2003.10:00\", \"10:00 UTC+2\". A TEXT of \"-\" reads one text per line\n"
    "from standard input.\n"
    "\n"
    "One line per text, with the fields\n"
    "  input    the text as read (escaped)\n"
    "  status   valid, invalid, null or outOfRange\n"
    "  seconds  seconds since 1970-01-01 00:00:00 UTC        (valid texts only)\n"
    "  local    the date-time in local time, YYYY-MM-DD HH:MM:SS  (valid only)\n"
    "  gmt      the same in UTC                              (valid only)\n"
    "  compact  the compact form, DD-Mon-YYYY.HH:MM:SS         (valid only)\n"
    "as name=value pairs (text), tab-separated columns in this order (tsv) or one\n"
    "JSON object per line (json; missing fields are null).\n"
    "\n"
    "Standard input: a line ends at a line feed, and a carriage return before it\n"
    "is dropped. Every line gives one result line, an empty line too. A line\n"
    "holding a NUL byte, or longer than 4096 bytes, is invalid without being read;\n"
    "its input field shows its first 4096 bytes.\n"
    "\n"
    "Exit status: 0 when every text was valid, 1 when any was not, 2 for a usage\n"
    "error.\n";

constexpr const char kReadHelp[] =
    "Usage: adtime read [--gmt] [--locale NAME] [--output text|tsv|json] TEXT...\n"
    "\n"
    "Reads each TEXT in the forms of a locale (ParseDateTime), as local time of TZ,\n"
    "or as UTC with --gmt (ParseDateTimeGMT). Every locale reads\n"
    "\"2003-05-17 14:03:09\". The locale is that of the environment (LC_ALL,\n"
    "LC_TIME, LANG), or NAME, a POSIX locale name such as de_DE.UTF-8.\n"
    "A TEXT of \"-\" reads one text per line from standard input.\n"
    "\n"
    "Output, standard input and exit status as for 'adtime parse --help'.\n";

enum class Reader { kTyped, kLocal, kGmt };

// Sets the calling thread's locale for the lifetime of the object.
class ScopedThreadLocale {
 public:
  explicit ScopedThreadLocale(const std::string& name)
      : locale_(newlocale(LC_ALL_MASK, name.c_str(), locale_t{})) {
    if (locale_ == locale_t{}) {
      throw UsageError("locale \"" + Escaped(name) + "\" is not installed");
    }
    previous_ = uselocale(locale_);
  }
  ~ScopedThreadLocale() {
    uselocale(previous_);
    freelocale(locale_);
  }
  ScopedThreadLocale(const ScopedThreadLocale&) = delete;
  ScopedThreadLocale& operator=(const ScopedThreadLocale&) = delete;

 private:
  locale_t locale_;
  locale_t previous_{};
};

// Fills `record` with the result of one text; true when it is valid. `text` must
// be followed by a '\0' in memory. A text the library cannot be handed whole (it
// holds a NUL) or that is too long is invalid without being read.
bool Convert(std::string_view text, bool readable, Reader reader, Record* record) {
  record->Clear();
  record->AddText("input", std::string(text));
  AdDateTime value;
  if (readable) {
    switch (reader) {
      case Reader::kTyped:
        value.ParseTolvaneDateTime(text.data());
        break;
      case Reader::kLocal:
        value.ParseDateTime(text.data(), 0);
        break;
      case Reader::kGmt:
        value.ParseDateTimeGMT(text.data());
        break;
    }
  } else {
    value.SetStatus(AdDateTime::invalid);
  }
  record->AddText("status", StatusName(value.GetStatus()));
  if (!value.IsValid()) {
    for (const char* name : {"seconds", "local", "gmt", "compact"})
      record->AddAbsent(name);
    return false;
  }
  record->AddNumber("seconds", value.GetCTime().GetTime());
  record->AddText("local", value.Format(kCanonicalPattern));
  record->AddText("gmt", value.FormatGMT(kCanonicalPattern));
  record->AddText("compact", value.FormatTolvane());
  return true;
}

// Converts every line of standard input; false when any was not valid. Sets
// `*read_failed` when the input broke off on an error.
bool ConvertStandardInput(Reader reader, OutputFormat format, OutputBuffer* out,
                          bool* read_failed) {
  LineReader lines(stdin, kMaxTextBytes);
  Record record;
  bool all_valid = true;
  Line line;
  while (lines.Next(&line)) {
    if (!Convert(line.text, !line.has_nul && !line.too_long, reader, &record)) {
      all_valid = false;
    }
    WriteRecord(record, format, out->text());
    out->LineDone();
  }
  if (lines.failed()) *read_failed = true;
  return all_valid;
}

int RunConversions(const Args& args, const char* help, bool is_read) {
  std::vector<OptionRule> options = {kHelpOption, kOutputOption};
  if (is_read) {
    options.push_back({"gmt", false});
    options.push_back({"locale", true});
  }
  const CommandLine command_line = ParseCommandLine(args, options);
  if (command_line.Has("help")) return PrintHelp(help);
  const OutputFormat format = OutputFormatOf(command_line);
  if (command_line.operands.empty()) {
    throw UsageError("give at least one TEXT, or - to read standard input");
  }
  const Reader reader = !is_read                  ? Reader::kTyped
                        : command_line.Has("gmt") ? Reader::kGmt
                                                  : Reader::kLocal;
  std::unique_ptr<ScopedThreadLocale> locale;
  if (command_line.Has("locale")) {
    locale = std::make_unique<ScopedThreadLocale>(command_line.Get("locale", ""));
  }

  OutputBuffer out(stdout);
  Record record;
  bool all_valid = true;
  bool read_failed = false;
  for (const std::string& operand : command_line.operands) {
    if (operand == "-") {
      all_valid = ConvertStandardInput(reader, format, &out, &read_failed) && all_valid;
      continue;
    }
    const std::string_view text = operand;
    const bool readable = text.size() <= kMaxTextBytes;
    all_valid =
        Convert(text.substr(0, kMaxTextBytes), readable, reader, &record) && all_valid;
    WriteRecord(record, format, out.text());
    out.LineDone();
  }
  const int status = FinishOutput(&out, all_valid ? 0 : 1);
  if (read_failed) {
    std::fputs("adtime: cannot read standard input\n", stderr);
    return kExitIoError;
  }
  return status;
}

}  // namespace

int RunParse(const Args& args) { return RunConversions(args, kParseHelp, false); }

int RunRead(const Args& args) { return RunConversions(args, kReadHelp, true); }

}  // namespace adtime
