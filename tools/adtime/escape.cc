#include "escape.h"

#include <cstddef>

namespace adtime {
namespace {

constexpr char kHexDigits[] = "0123456789abcdef";

unsigned char Byte(char c) { return static_cast<unsigned char>(c); }

bool IsContinuation(unsigned char byte) { return (byte & 0xC0) == 0x80; }

bool IsControl(unsigned char byte) { return byte < 0x20 || byte == 0x7F; }

void AppendHexByte(const char* prefix, unsigned char byte, std::string* out) {
  out->append(prefix);
  out->push_back(kHexDigits[byte >> 4]);
  out->push_back(kHexDigits[byte & 0x0F]);
}

// Calls `plain(run)` for each stretch of printable ASCII and well-formed UTF-8,
// and `special(byte, well_formed)` for each control byte or stray byte, in order.
// Printable stretches are handed over whole, which keeps the common case a plain
// append.
// Bytes that stand for themselves in every output: printable ASCII but the quote
// and the backslash.
constexpr bool IsPlainAscii(unsigned char byte) {
  return byte >= 0x20 && byte < 0x7F && byte != '"' && byte != '\\';
}

struct PlainAsciiTable {
  bool plain[256] = {};
  constexpr PlainAsciiTable() {
    for (int byte = 0; byte < 256; ++byte)
      plain[byte] = IsPlainAscii(static_cast<unsigned char>(byte));
  }
};
constexpr PlainAsciiTable kPlainAscii;

template <typename Plain, typename Special>
void ForEachPiece(std::string_view text, Plain plain, Special special) {
  std::size_t run_start = 0;
  std::size_t i = 0;
  while (i < text.size()) {
    // Most text is plain ASCII: skip it with one table lookup a byte.
    while (i < text.size() && kPlainAscii.plain[Byte(text[i])]) ++i;
    if (i == text.size()) break;
    const unsigned char byte = Byte(text[i]);
    std::size_t length = 1;
    bool is_special = false;
    bool well_formed = true;
    if (byte < 0x80) {
      is_special = IsControl(byte) || byte == '"' || byte == '\\';
    } else {
      const int sequence = Utf8SequenceLength(text.substr(i));
      if (sequence == 0) {
        is_special = true;
        well_formed = false;
      } else {
        length = static_cast<std::size_t>(sequence);
      }
    }
    if (is_special) {
      if (i > run_start) plain(text.substr(run_start, i - run_start));
      special(byte, well_formed);
      run_start = i + 1;
    }
    i += length;
  }
  if (text.size() > run_start) plain(text.substr(run_start));
}

// The C-style escape of one special byte; '"' stays as it is.
void AppendCStyle(unsigned char byte, bool well_formed, std::string* out) {
  if (!well_formed) return AppendHexByte("\\x", byte, out);
  switch (byte) {
    case '\\':
      out->append("\\\\");
      return;
    case '\t':
      out->append("\\t");
      return;
    case '\n':
      out->append("\\n");
      return;
    case '\r':
      out->append("\\r");
      return;
    case '"':
      out->push_back('"');
      return;
    default:
      AppendHexByte("\\x", byte, out);
  }
}

}  // namespace

int Utf8SequenceLength(std::string_view text) {
  if (text.empty()) return 0;
  const unsigned char lead = Byte(text[0]);
  if (lead < 0x80) return 1;
  int length = 0;
  unsigned char min_second = 0x80;  // the second byte's bounds rule out overlong
  unsigned char max_second = 0xBF;  // forms, surrogates and values past U+10FFFF
  if (lead >= 0xC2 && lead <= 0xDF) {
    length = 2;
  } else if (lead >= 0xE0 && lead <= 0xEF) {
    length = 3;
    if (lead == 0xE0) min_second = 0xA0;
    if (lead == 0xED) max_second = 0x9F;
  } else if (lead >= 0xF0 && lead <= 0xF4) {
    length = 4;
    if (lead == 0xF0) min_second = 0x90;
    if (lead == 0xF4) max_second = 0x8F;
  } else {
    return 0;
  }
  if (text.size() < static_cast<std::size_t>(length)) return 0;
  const unsigned char second = Byte(text[1]);
  if (second < min_second || second > max_second) return 0;
  for (std::size_t i = 2; i < static_cast<std::size_t>(length); ++i) {
    if (!IsContinuation(Byte(text[i]))) return 0;
  }
  return length;
}

void AppendJsonString(std::string_view text, std::string* out) {
  out->push_back('"');
  ForEachPiece(
      text, [out](std::string_view run) { out->append(run); },
      [out](unsigned char byte, bool well_formed) {
        if (!well_formed) {
          out->append("\\ufffd");
          return;
        }
        switch (byte) {
          case '"':
            out->append("\\\"");
            return;
          case '\\':
            out->append("\\\\");
            return;
          case '\b':
            out->append("\\b");
            return;
          case '\f':
            out->append("\\f");
            return;
          case '\n':
            out->append("\\n");
            return;
          case '\r':
            out->append("\\r");
            return;
          case '\t':
            out->append("\\t");
            return;
          default:
            AppendHexByte("\\u00", byte, out);
        }
      });
  out->push_back('"');
}

void AppendEscaped(std::string_view text, std::string* out) {
  ForEachPiece(
      text, [out](std::string_view run) { out->append(run); },
      [out](unsigned char byte, bool well_formed) {
        AppendCStyle(byte, well_formed, out);
      });
}

std::string Escaped(std::string_view text) {
  std::string out;
  AppendEscaped(text, &out);
  return out;
}

void AppendLogfmtValue(std::string_view text, std::string* out) {
  const bool quote = text.empty() || text.find_first_of(" \"=") != std::string_view::npos;
  if (!quote) return AppendEscaped(text, out);
  out->push_back('"');
  ForEachPiece(
      text, [out](std::string_view run) { out->append(run); },
      [out](unsigned char byte, bool well_formed) {
        if (byte == '"' && well_formed) {
          out->append("\\\"");
        } else {
          AppendCStyle(byte, well_formed, out);
        }
      });
  out->push_back('"');
}

}  // namespace adtime
