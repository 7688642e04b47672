// One result of the tool as named fields, and the three ways of writing it:
// text (logfmt, for people), TSV and JSON lines (for scripts). Each record is one
// line in every format, so a batch run gives one line per input line.
#ifndef DATETIMELIB_TOOLS_ADTIME_RECORD_WRITER_H_
#define DATETIMELIB_TOOLS_ADTIME_RECORD_WRITER_H_

#include <cstdint>
#include <string>
#include <vector>

namespace adtime {

enum class OutputFormat { kText, kTsv, kJson };

// "text", "tsv" or "json"; throws UsageError for anything else.
OutputFormat ParseOutputFormat(const std::string& name);

struct Field {
  enum class Kind { kText, kNumber, kAbsent };
  const char* name;
  std::string value;  // digits for kNumber, empty for kAbsent
  Kind kind;
};

// The fields of one result, in output order. A record type keeps the same
// fields in every record, marking the ones it has no value for as absent, so
// that TSV columns line up.
class Record {
 public:
  void Clear() { fields_.clear(); }
  void AddText(const char* name, std::string value);
  void AddNumber(const char* name, std::int64_t value);
  void AddAbsent(const char* name);
  const std::vector<Field>& fields() const { return fields_; }

 private:
  std::vector<Field> fields_;
};

// Appends the record as one line without its line feed:
//   text  name=value pairs separated by blanks; absent fields left out
//   tsv   the values separated by tabs; absent fields empty
//   json  an object; absent fields null
// Text values are escaped as escape.h describes for each format.
void WriteRecord(const Record& record, OutputFormat format, std::string* out);

}  // namespace adtime

#endif  // DATETIMELIB_TOOLS_ADTIME_RECORD_WRITER_H_
