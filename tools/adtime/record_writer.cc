#include "record_writer.h"

#include <utility>

#include "command_line.h"
#include "escape.h"

namespace adtime {
namespace {

void WriteText(const Record& record, std::string* out) {
  bool first = true;
  for (const Field& field : record.fields()) {
    if (field.kind == Field::Kind::kAbsent) continue;
    if (!first) out->push_back(' ');
    first = false;
    out->append(field.name);
    out->push_back('=');
    if (field.kind == Field::Kind::kNumber) {
      out->append(field.value);
    } else {
      AppendLogfmtValue(field.value, out);
    }
  }
}

void WriteTsv(const Record& record, std::string* out) {
  bool first = true;
  for (const Field& field : record.fields()) {
    if (!first) out->push_back('\t');
    first = false;
    AppendEscaped(field.value, out);
  }
}

void WriteJson(const Record& record, std::string* out) {
  out->push_back('{');
  bool first = true;
  for (const Field& field : record.fields()) {
    if (!first) out->push_back(',');
    first = false;
    AppendJsonString(field.name, out);
    out->push_back(':');
    switch (field.kind) {
      case Field::Kind::kText:
        AppendJsonString(field.value, out);
        break;
      case Field::Kind::kNumber:
        out->append(field.value);
        break;
      case Field::Kind::kAbsent:
        out->append("null");
        break;
    }
  }
  out->push_back('}');
}

}  // namespace

OutputFormat ParseOutputFormat(const std::string& name) {
  if (name == "text") return OutputFormat::kText;
  if (name == "tsv") return OutputFormat::kTsv;
  if (name == "json") return OutputFormat::kJson;
  throw UsageError("--output must be text, tsv or json, not \"" + name + "\"");
}

void Record::AddText(const char* name, std::string value) {
  fields_.push_back(Field{name, std::move(value), Field::Kind::kText});
}

void Record::AddNumber(const char* name, std::int64_t value) {
  fields_.push_back(Field{name, std::to_string(value), Field::Kind::kNumber});
}

void Record::AddAbsent(const char* name) {
  fields_.push_back(Field{name, std::string(), Field::Kind::kAbsent});
}

void WriteRecord(const Record& record, OutputFormat format, std::string* out) {
  switch (format) {
    case OutputFormat::kText:
      WriteText(record, out);
      break;
    case OutputFormat::kTsv:
      WriteTsv(record, out);
      break;
    case OutputFormat::kJson:
      WriteJson(record, out);
      break;
  }
}

}  // namespace adtime
