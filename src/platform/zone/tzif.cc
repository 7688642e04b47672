#include "platform/zone/tzif.h"

namespace datetimelib::platform {
namespace {

constexpr std::uint32_t kMaxTypes = 256;  // type indices are one byte
constexpr std::size_t kTypeRecordBytes = 6;

// The six counts of a header, in file order.
struct Counts {
  std::uint32_t isut;   // UT/local indicators, 0 or `type`
  std::uint32_t isstd;  // standard/wall indicators, 0 or `type`
  std::uint32_t leap;
  std::uint32_t time;
  std::uint32_t type;
  std::uint32_t chars;
};

// Big-endian reads over the bytes; each checks that the bytes are there.
class ByteReader {
 public:
  explicit ByteReader(std::string_view bytes) : bytes_(bytes) {}

  std::size_t Remaining() const { return bytes_.size() - position_; }

  bool Take(std::size_t count, std::string_view* out) {
    if (count > Remaining()) return false;
    *out = bytes_.substr(position_, count);
    position_ += count;
    return true;
  }

  bool Skip(std::uint64_t count) {
    if (count > Remaining()) return false;
    position_ += static_cast<std::size_t>(count);
    return true;
  }

  bool Unsigned(std::size_t width, std::uint64_t* value) {  // width in bytes, <= 8
    std::string_view raw;
    if (!Take(width, &raw)) return false;
    std::uint64_t result = 0;
    for (const char c : raw) result = (result << 8) | static_cast<unsigned char>(c);
    *value = result;
    return true;
  }

  bool Byte(std::uint8_t* value) {
    std::uint64_t wide = 0;
    if (!Unsigned(1, &wide)) return false;
    *value = static_cast<std::uint8_t>(wide);
    return true;
  }

  bool Count(std::uint32_t* value) {
    std::uint64_t wide = 0;
    if (!Unsigned(4, &wide)) return false;
    *value = static_cast<std::uint32_t>(wide);
    return true;
  }

  // A two's-complement number of `width` bytes (4 or 8).
  bool Signed(std::size_t width, std::int64_t* value) {
    std::uint64_t raw = 0;
    if (!Unsigned(width, &raw)) return false;
    if (width == 4) {
      *value = raw < 0x80000000u ? static_cast<std::int64_t>(raw)
                                 : static_cast<std::int64_t>(raw) - 0x100000000;
    } else {
      *value = raw <= 0x7fffffffffffffffu ? static_cast<std::int64_t>(raw)
                                          : -static_cast<std::int64_t>(~raw) - 1;
    }
    return true;
  }

 private:
  std::string_view bytes_;
  std::size_t position_ = 0;
};

// header = "TZif" version 15*OCTET 6*COUNT; the version as 1 to 4.
bool ReadHeader(ByteReader* reader, int* version, Counts* counts) {
  std::string_view fixed;
  if (!reader->Take(20, &fixed) || fixed.substr(0, 4) != "TZif") return false;
  // The C library reads 64-bit data after any version byte but NUL, so a file
  // of a version yet to come reads as the latest one known.
  switch (fixed[4]) {
    case '\0':
      *version = 1;
      break;
    case '2':
    case '3':
      *version = fixed[4] - '0';
      break;
    default:
      *version = 4;
      break;
  }
  return reader->Count(&counts->isut) && reader->Count(&counts->isstd) &&
         reader->Count(&counts->leap) && reader->Count(&counts->time) &&
         reader->Count(&counts->type) && reader->Count(&counts->chars);
}

// Bytes of a data block whose times are `time_width` bytes wide. At most about
// 2^37, so the sum cannot overflow.
std::uint64_t BlockBytes(const Counts& c, std::size_t time_width) {
  return std::uint64_t{c.time} * (time_width + 1) +
         std::uint64_t{c.type} * kTypeRecordBytes + c.chars +
         std::uint64_t{c.leap} * (time_width + 4) + c.isstd + c.isut;
}

bool CountsAreConsistent(const Counts& c) {
  return c.type >= 1 && c.type <= kMaxTypes && c.chars >= 1 &&
         (c.isut == 0 || c.isut == c.type) && (c.isstd == 0 || c.isstd == c.type);
}

// The designation that starts at `index` of the NUL-terminated designations.
bool Designation(std::string_view chars, std::uint8_t index, std::string* out) {
  if (index >= chars.size()) return false;
  const std::size_t end = chars.find('\0', index);
  if (end == std::string_view::npos) return false;
  out->assign(chars.substr(index, end - index));
  return true;
}

// block = transition times, their types, type records, designations, leap-second
// records (skipped), standard/wall and UT/local indicators.
bool ReadBlock(ByteReader* reader, const Counts& counts, std::size_t time_width,
               Tzif* out) {
  if (!CountsAreConsistent(counts) ||
      BlockBytes(counts, time_width) > reader->Remaining()) {
    return false;
  }
  std::vector<std::int64_t>& times = out->transition_times;
  times.resize(counts.time);
  for (std::size_t i = 0; i < times.size(); ++i) {
    if (!reader->Signed(time_width, &times[i])) return false;
    if (i > 0 && times[i] <= times[i - 1]) return false;
  }
  out->transition_types.resize(counts.time);
  for (std::uint8_t& type : out->transition_types) {
    if (!reader->Byte(&type) || type >= counts.type) return false;
  }

  struct RawType {
    std::int64_t utc_offset;
    std::uint8_t is_dst;
    std::uint8_t designation;
  };
  std::vector<RawType> raw(counts.type);
  for (RawType& type : raw) {
    if (!reader->Signed(4, &type.utc_offset) || !reader->Byte(&type.is_dst) ||
        !reader->Byte(&type.designation)) {
      return false;
    }
    if (type.utc_offset == INT32_MIN || type.is_dst > 1) return false;
  }
  std::string_view chars;
  if (!reader->Take(counts.chars, &chars)) return false;
  out->types.resize(counts.type);
  for (std::size_t i = 0; i < raw.size(); ++i) {
    out->types[i].utc_offset = static_cast<std::int32_t>(raw[i].utc_offset);
    out->types[i].is_dst = raw[i].is_dst == 1;
    if (!Designation(chars, raw[i].designation, &out->types[i].abbreviation)) {
      return false;
    }
  }
  if (!reader->Skip(std::uint64_t{counts.leap} * (time_width + 4))) return false;
  for (std::uint32_t i = 0; i < counts.isstd; ++i) {
    std::uint8_t flag = 0;
    if (!reader->Byte(&flag)) return false;
    out->types[i].is_standard = flag != 0;
  }
  for (std::uint32_t i = 0; i < counts.isut; ++i) {
    std::uint8_t flag = 0;
    if (!reader->Byte(&flag)) return false;
    out->types[i].is_ut = flag != 0;
  }
  return true;
}

// footer = "\n" rule "\n", the rule holding no newline
//
// Read as the C library reads a footer that is not so: a file that ends with
// its data is refused; a footer that does not start with "\n" is none, the data
// being kept; one without its closing "\n" loses its last byte instead, which
// the C library takes for that "\n".
bool ReadFooter(ByteReader* reader, std::string* footer) {
  std::string_view rest;
  reader->Take(reader->Remaining(), &rest);
  if (rest.empty()) return false;
  if (rest.front() != '\n') {
    footer->clear();
    return true;
  }
  rest.remove_prefix(1);
  if (rest.empty()) return false;
  const std::size_t end = rest.find('\n');
  footer->assign(rest.substr(0, end != std::string_view::npos ? end : rest.size() - 1));
  return true;
}

}  // namespace

// tzif = header block [header block footer]   ; the second part from version 2
std::optional<Tzif> ParseTzif(std::string_view bytes) {
  ByteReader reader(bytes);
  Tzif zone;
  Counts counts{};
  if (!ReadHeader(&reader, &zone.version, &counts)) return std::nullopt;
  if (zone.version == 1) {
    if (!ReadBlock(&reader, counts, 4, &zone)) return std::nullopt;
    return zone;
  }
  // The 32-bit block only repeats what the 64-bit one says; skip it unread.
  int second_version = 0;
  if (!reader.Skip(BlockBytes(counts, 4)) ||
      !ReadHeader(&reader, &second_version, &counts) ||
      !ReadBlock(&reader, counts, 8, &zone) || !ReadFooter(&reader, &zone.footer)) {
    return std::nullopt;
  }
  return zone;
}

}  // namespace datetimelib::platform
