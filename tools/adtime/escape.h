// Writing arbitrary bytes into the tool's output formats without letting them
// break a line, a field or the terminal.
//
// Input reaches these functions from the command line and from standard input,
// so it may hold any byte. Well-formed UTF-8 passes through unchanged in every
// form; what changes is how control characters and bytes that are not
// well-formed UTF-8 are written.
#ifndef DATETIMELIB_TOOLS_ADTIME_ESCAPE_H_
#define DATETIMELIB_TOOLS_ADTIME_ESCAPE_H_

#include <string>
#include <string_view>

namespace adtime {

// Appends `text` as a JSON string, quotes included (RFC 8259): '"' and '\' are
// escaped, control characters (U+0000..U+001F and DEL) become \n, \t, ... or
// \u00XX, and each byte that is not part of well-formed UTF-8 becomes \ufffd, so
// the result is always valid UTF-8.
void AppendJsonString(std::string_view text, std::string* out);

// Appends `text` C-style, without quotes: '\' becomes "\\", tab, line feed and
// carriage return become \t, \n and \r, any other control character and any byte
// that is not part of well-formed UTF-8 becomes \xHH. The result holds no tab and
// no line end, so it fits a TSV field.
void AppendEscaped(std::string_view text, std::string* out);

// `text` escaped as AppendEscaped does: safe to show in a message.
std::string Escaped(std::string_view text);

// Appends `text` as a logfmt value: escaped as AppendEscaped does, and in double
// quotes (with '"' written \") when it is empty or holds a blank, '"' or '='.
void AppendLogfmtValue(std::string_view text, std::string* out);

// The length of the well-formed UTF-8 sequence at the start of `text` (1 to 4),
// or 0 when the first byte does not start one: stray continuation bytes, overlong
// forms, surrogates, code points above U+10FFFF and cut sequences give 0.
int Utf8SequenceLength(std::string_view text);

}  // namespace adtime

#endif  // DATETIMELIB_TOOLS_ADTIME_ESCAPE_H_
