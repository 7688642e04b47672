// AdDateTime.h: calendar date-times for host applications.
//
// An `AdDateTime` is a value with three parts:
//
//   * a seconds count: a signed 32-bit number of seconds since
//     1970-01-01 00:00:00 UTC (`AdTime`);
//   * a status (`AdDateTime::AdDateTimeStatus`): `valid` when the count holds a
//     point in time, `null` when none was ever given, `invalid` when text could not
//     be read, `outOfRange` when the fields given lie outside what a value holds;
//   * a kept text: empty, except where input could not be represented or read;
//     there it keeps that input, and formatting hands it back for `outOfRange`.
//
// Failure never throws and is never logged: it is the status of the value, the 0
// of a truth result, or the empty text from formatting.
//
// Every calendar field going in or out is local time of the process's time zone,
// as the C library sees it when the call is made (`TZ`, else /etc/localtime), unless
// the member says GMT or UTC. A value holds 1970-01-01 through 2038-01-18.
//
// Values are plain objects with value semantics; the library keeps no reference to
// any of them, starts no threads and takes no locks. The only state it keeps
// between calls is each thread's own (its compiled zone and its last breakdown,
// the locales it opened, the reading forms of the locales it read in last), and
// none of it changes an answer. Any member may be called from many threads at
// once on distinct values.
//
// Example:
//
//   AdDateTime t(2003, 6, 18, 14, 30, 0);   // 2003-06-18 14:30:00 local time
//   if (t.IsValid()) {
//     AdDateTime next_week = t + AdDuration(7.0);
//     long weekday = next_week.GetDayOfWeek();  // 4: Wednesday
//   }

#ifndef DATETIMELIB_ADDATETIME_H_
#define DATETIMELIB_ADDATETIME_H_

#include <cstdint>
#include <ctime>
#include <string>

#if defined(__GNUC__) || defined(__clang__)
#define DATETIMELIB_API __attribute__((visibility("default")))
#else
#define DATETIMELIB_API
#endif

// AdTime
//
// A seconds count: signed 32-bit seconds since 1970-01-01 00:00:00 UTC. It is
// the point in time an `AdDateTime` holds, with no status and no zone.
class DATETIMELIB_API AdTime {
 public:
  // The count 0: 1970-01-01 00:00:00 UTC.
  AdTime() = default;
  explicit AdTime(std::int32_t seconds) : seconds_(seconds) {}

  std::int32_t GetTime() const { return seconds_; }

 private:
  std::int32_t seconds_ = 0;  // seconds since 1970-01-01 00:00:00 UTC
};

// AdDuration
//
// A signed span of whole seconds, held in 32 bits (about +/-68 years).
//
// A day is always 86 400 seconds: adding `AdDuration(1.0)` across a change
// between standard and daylight-saving time moves the local time of day by the
// size of the change, and 30 days are not a month.
//
// Every accessor divides with truncation toward zero, so each part of a negative
// span is zero or negative: -90 seconds are 0 days, 0 hours, -1 minute and -30
// seconds.
class DATETIMELIB_API AdDuration {
 public:
  // A span of `days` days: (days * 24.0) * 3600.0 seconds, truncated toward zero.
  // Example: AdDuration(0.5) is 43 200 s; AdDuration(-0.00001) is 0 s.
  // Note: spans beyond +/-2 147 483 647 s saturate at those bounds; NaN is 0 s.
  AdDuration(double days);  // NOLINT(google-explicit-constructor): spans read as days

  // ((days * 24 + hours) * 60 + minutes) * 60 + seconds. Any part may be negative
  // or beyond its usual range.
  // Note: a total outside 32 bits wraps modulo 2^32.
  AdDuration(std::int32_t days, std::int32_t hours, std::int32_t minutes,
             std::int32_t seconds);

  // A span of exactly `seconds` seconds. There is deliberately no constructor from
  // one integer: `AdDuration(1)` is one day (the `double` constructor), never one
  // second.
  static AdDuration FromSeconds(std::int32_t seconds);

  std::int32_t GetDays() const;          // count / 86400
  std::int32_t GetTotalHours() const;    // count / 3600
  std::int32_t GetHours() const;         // GetTotalHours() - GetDays() * 24
  std::int32_t GetTotalMinutes() const;  // count / 60
  std::int32_t GetMinutes() const;       // GetTotalMinutes() - GetTotalHours() * 60
  std::int32_t GetTotalSeconds() const;  // count
  std::int32_t GetSeconds() const;       // GetTotalSeconds() - GetTotalMinutes() * 60

 private:
  std::int32_t seconds_ = 0;  // signed span in seconds
};

// AdDateTime
//
// See the top of this file for the value model.
class DATETIMELIB_API AdDateTime {
 public:
  // The state of a value. Any number may be stored with `SetStatus`; members
  // treat numbers outside these four as "not valid, keeps nothing to show".
  enum AdDateTimeStatus : int {
    valid = 0,       // the seconds count holds the point in time
    invalid = 1,     // text could not be read, or a week start/end had no date
    null = 2,        // default construction: no point in time was ever given
    outOfRange = 3,  // fields outside 1970-01-01..2038-01-18; kept text says which
  };

  // --- Construction -------------------------------------------------------------

  // Status `null`, empty kept text, seconds count 0.
  AdDateTime() = default;

  // Status `valid`, empty kept text, the given count. No range test is made.
  explicit AdDateTime(const AdTime& time);

  // The field constructor: local time, as `mktime` reads fields.
  //
  // * Fields that pass the range test (year 1970 to 2038, and in 2038 no later
  //   than 18 January; month and day are only tested in 2038, the time of day
  //   never) are composed into a count; status `valid`.
  //   Fields beyond their usual ranges carry into the next unit: month 13 of 2000
  //   is January 2001, day 0 of March the last day of February, hour 25 one
  //   o'clock next day.
  // * The date 1899-12-30, which locale readers give to a time of day alone,
  //   becomes that time of day on 1970-01-01; status `valid`.
  // * Anything else is `outOfRange`, with the kept text "%d/%d/%d %d:%d:%d" of
  //   the six fields in plain decimal (2040, 1, 5, 7, 3, 0 keep "2040/1/5 7:3:0"),
  //   and seconds count 0. So are fields that pass the range test but whose local
  //   time has no 32-bit count (the last hours of 2038-01-18 west of UTC-03:14).
  //
  // Example: AdDateTime(2038, 1, 19, 0, 0, 0).Format(...) gives "2038/1/19 0:0:0".
  //
  // Note: a local time that a change skips lands on the daylight side of the
  // change, as `mktime` puts it: forward by the size of the change where daylight
  // time is summer time (02:30 on a spring-forward day gives 03:30 daylight
  // time), back where a zone writes its winter as daylight time (Europe/Dublin:
  // 01:30 on 2019-03-31 gives 00:30 GMT). A local time that occurs twice gives the
  // first occurrence, the daylight reading in zones that move their clocks ahead
  // in summer. Unlike `mktime`, the answer never depends on earlier calls.
  AdDateTime(long year, long month, long day, long hour, long minute, long second);

  AdDateTime(const AdDateTime& other) = default;
  AdDateTime& operator=(const AdDateTime& other) = default;
  AdDateTime(AdDateTime&& other) noexcept = default;
  AdDateTime& operator=(AdDateTime&& other) noexcept = default;
  ~AdDateTime() = default;

  // The current time; status `valid`, empty kept text.
  static AdDateTime GetTickCount();

  // The seconds count, whatever the status (0 for `null` and refused values).
  AdTime GetCTime() const;

  // --- Status -----------------------------------------------------------------

  AdDateTimeStatus GetStatus() const { return status_; }
  // Sets the status alone: the seconds count and the kept text stay.
  void SetStatus(AdDateTimeStatus status) { status_ = status; }
  int IsNull() const { return status_ == null ? 1 : 0; }
  int IsValid() const { return status_ == valid ? 1 : 0; }

  // --- Setting from fields ------------------------------------------------------

  // Replaces the whole value (count, status, kept text) with
  // `AdDateTime(year, month, day, hour, minute, second)`. Returns 1 always, also
  // when the value becomes `outOfRange`: read the outcome from `GetStatus()`.
  int SetDateTime(int year, int month, int day, int hour, int minute, int second);
  // `SetDateTime(year, month, day, 0, 0, 0)`.
  int SetDate(int year, int month, int day);
  // `SetDateTime(1970, 1, 1, hour, minute, second)`: a time of day on 1970-01-01.
  // Example: SetTime(25, 0, 0) gives 1970-01-02 01:00:00 local time.
  int SetTime(int hour, int minute, int second);
  // `SetDateTime` with the fields of a broken-down time: tm_year + 1900,
  // tm_mon + 1, tm_mday, tm_hour, tm_min, tm_sec. tm_wday, tm_yday and tm_isdst
  // are not read.
  void SetOleDateTime(const std::tm& fields);

  // --- Calendar fields, local time ---------------------------------------------
  //
  // Each getter breaks the seconds count down into local time at the moment of
  // the call and returns one field. The status is not looked at: a value that is
  // not `valid` gives the fields of whatever count it holds. Each thread keeps
  // its last breakdown, so reading several fields of one value costs about one
  // breakdown; a change of `TZ` or of the zone file is still seen by the next
  // getter.

  long GetYear() const;       // 1970 to 2038 for a valid value
  long GetMonth() const;      // 1 to 12
  long GetDay() const;        // 1 to 31
  long GetHour() const;       // 0 to 23
  long GetMinute() const;     // 0 to 59
  long GetSecond() const;     // 0 to 59
  long GetDayOfWeek() const;  // 1 = Sunday, 2 = Monday, ..., 7 = Saturday
  long GetDayOfYear() const;  // 1 = 1 January, up to 366

  // --- Arithmetic and comparison ------------------------------------------------
  //
  // All of these read the seconds counts alone; statuses and kept texts play no
  // part, so two values with equal counts are equal whatever their status.
  //
  // Note: no range test is made on a result, and keeping counts within 32 bits is
  // the caller's limit: a sum or difference beyond it wraps modulo 2^32.

  // A new `valid` value with an empty kept text, whatever this value's status.
  AdDateTime operator+(const AdDuration& span) const;
  AdDateTime operator-(const AdDuration& span) const;
  // The span from `other` to this value.
  AdDuration operator-(const AdDateTime& other) const;
  // Shift this count; status and kept text stay (a `null` value stays `null`).
  const AdDateTime& operator+=(const AdDuration& span);
  const AdDateTime& operator-=(const AdDuration& span);

  int operator==(const AdDateTime& other) const;
  int operator!=(const AdDateTime& other) const;
  int operator<(const AdDateTime& other) const;
  int operator<=(const AdDateTime& other) const;
  int operator>(const AdDateTime& other) const;
  int operator>=(const AdDateTime& other) const;

  // --- Formatting ----------------------------------------------------------------
  //
  // The status rule of every formatter: a `valid` value is written; an
  // `outOfRange` value gives back its kept text unchanged, whatever the pattern;
  // every other value gives the empty text. Formatting never changes the value.

  // The value in local time, in a strftime pattern (the calling thread's locale
  // writes names such as %a and %b). The canonical pattern "%Y-%m-%d %H:%M:%S"
  // gives exactly 19 characters for every count from 0 to 2 147 483 647.
  // Example: Format("%Y-%m-%d %H:%M:%S") gives "2003-05-17 14:03:09".
  // A null pattern gives the empty text. A field width above 1024 ("%2000d") is
  // not applied: that conversion is written as it stands in the pattern.
  std::string Format(const char* pattern) const;

  // The same in UTC: no zone, no daylight saving; %Z writes "GMT".
  // Example: AdDateTime(AdTime(1000000000)).FormatGMT("%Y-%m-%d %H:%M:%S") gives
  // "2001-09-09 01:46:40".
  std::string FormatGMT(const char* pattern) const;

  // Bulk forms of `Format`, `FormatGMT` and `FormatTolvane`: the same text, put
  // into `out` in place of what it held. A caller that writes many values reuses
  // one string's capacity instead of allocating each text (a 19- or 20-byte
  // text does not fit in a std::string's inline buffer).
  // Example: std::string line; for (...) { v.FormatInto(line, "%F %T"); ... }
  void FormatInto(std::string& out, const char* pattern) const;
  void FormatGMTInto(std::string& out, const char* pattern) const;
  void FormatTolvaneInto(std::string& out) const;

  // Flag words of `Format(flags, locale)`: what of the value the locale writes.
  enum AdFormatFlags : std::uint32_t {
    dateAndTime = 0,  // the locale's date, a blank, its time of day: "%x %X"
    timeOnly = 1,     // the locale's time of day: "%X"
    dateOnly = 2,     // the locale's date: "%x"
  };

  // Locale identifiers with a meaning of their own. Any other number names a
  // language and region: 1033 en_US, 2057 en_GB, 1031 de_DE, 1036 fr_FR, 1040
  // it_IT, 3082 es_ES, 1043 nl_NL, 1046 pt_BR, 1049 ru_RU, 1041 ja_JP, 2052
  // zh_CN, 1042 ko_KR, and some forty more.
  enum AdLocale : std::uint32_t {
    invariantLocale = 127,       // "C"
    userDefaultLocale = 1024,    // named by LC_ALL, else LC_TIME, else LANG
    systemDefaultLocale = 2048,  // the process-wide locale that setlocale set
  };

  // The value in local time as a locale writes it (strftime's %x and %X of that
  // locale, in its encoding). Bits other than `timeOnly` and `dateOnly` are
  // ignored; both together write the date and the time.
  // An unknown identifier, or a locale that is not installed, writes as "C".
  // Each thread keeps the last few locales it opened (a change of LOCPATH is
  // seen at the next call; locale files replaced while the process runs are
  // not, as the C library's own locale archive is not).
  // Example: 2003-05-17 14:03:09 gives "05/17/2003 02:03:09 PM" in 1033,
  // "17.05.2003" with `dateOnly` in 1031, and "14:03:09" with `timeOnly` in 127.
  // Note: `ParseDateTime` reads this text back on a thread whose locale is the
  // one that wrote it; other locales may read it differently or not at all.
  std::string Format(std::uint32_t flags, std::uint32_t locale) const;

  // --- Parsing ---------------------------------------------------------------------
  //
  // Both members read the whole text (trailing blanks aside) in the calling
  // thread's locale; every locale reads the canonical text "%Y-%m-%d %H:%M:%S".
  // Every locale also reads: that text with "T" for the blank; a date alone (at
  // 00:00:00); a time of day alone ("14:30", "14:30:00", "2:30 PM" where the
  // locale has AM/PM words; on 1970-01-01 by the field constructor's rule);
  // the locale's own date, time and date-time forms, so that what
  // `Format(flags, locale)` writes reads back in that locale; and dates with the
  // locale's month names, full or short, in any case ("17 MÄRZ 2003", "May 17,
  // 2003"). A two-digit year is read only where the locale writes one: 69..99
  // are 1969..1999, 00..68 are 2000..2068. Impossible fields (30 February, hour
  // 24, second 60) make the text unreadable.
  // A zone in the text (a form with %Z or %z) must be the current zone's at
  // those fields, or the text is unreadable; it picks the instant: in New York
  // "Sun 31 Oct 2004 01:30:00 AM EST" is the second 01:30 of that night, and
  // without a zone the first. A time of day alone takes any abbreviation or
  // offset of the zone's rule. ParseDateTimeGMT applies an offset, and takes
  // "GMT" and "UTC" alone of the abbreviations.
  // A text the thread's locale refuses whose 20th byte is "." (the canonical text
  // with a fraction of a second) is read once more, cut to its first 19 bytes, in
  // the user's default locale: "2003-05-17 14:03:09.250" reads as 14:03:09.
  //
  // Outcomes, whatever the value held before (a null text reads as ""):
  //
  //   text                      ParseDateTime            ParseDateTimeGMT
  //   unreadable                invalid, keeps text      invalid, keeps text
  //   outside 1970..2038-01-18  outOfRange, keeps text   outOfRange, keeps text
  //   a time of day alone       valid, on 1970-01-01     outOfRange, keeps text
  //   within the range          valid, as local time     valid, as UTC
  //
  // A refused text leaves the count unchanged (ParseDateTime's outOfRange: 0).
  // Both return 1 when the value is now `valid`, else 0.

  // Reads the text as local time, through the field constructor. `flags` is
  // reserved and ignored.
  // Example: ParseDateTime("2003-05-17 14:03:09") in New York gives 1053194589.
  int ParseDateTime(const char* text, std::uint32_t flags = 0);

  // Reads the text as UTC; no time zone enters.
  // Example: ParseDateTimeGMT("2001-09-09 01:46:40") gives 1000000000.
  int ParseDateTimeGMT(const char* text);

  // --- The compact form: what people type -----------------------------------------
  //
  // "05-Jan-2003.14:07:09": day, English month abbreviation and year, then the
  // time of day, in local time. The same text in every locale.

  // The value's local time in the compact form "DD-Mon-YYYY.HH:MM:SS": day, hour,
  // minute and second with two digits, the year in full, "Jan" to "Dec". A
  // `valid` value always gives 20 characters.
  //
  // Unlike `Format`, it ignores the status and writes the count whatever the
  // value holds: an `invalid` value after a refused parse gives the time it held
  // before, an `outOfRange` value its count (0 when built from refused fields),
  // never its kept text. It never changes the value.
  //
  // Example: with TZ=UTC, AdDateTime(AdTime(1000000000)).FormatTolvane() gives
  // "09-Sep-2001.01:46:40"; in a zone one hour east, AdTime(0) gives
  // "01-Jan-1970.01:00:00".
  std::string FormatTolvane() const;

  // Sets this value from a date and time as a person types it: the compact form,
  // looser forms of it, keywords, or "now". Fields are local time unless "UTC"
  // follows the time. The status ends `valid` (empty kept text) or `invalid`,
  // never `outOfRange` or `null`; read it with `IsValid`. A null text reads as "".
  //
  // Forms, with now Wednesday 2003-01-08 10:00:00. Words match in any ASCII case
  // but must stand alone: " now" and "today " are refused.
  //
  //   text                          result
  //   "now", "NOW"                  the current time
  //   "today", "TODAY.12:30"        2003-01-08 00:00:00, 2003-01-08 12:30:00
  //   "10:30", "10:30:15"           today at 10:30:00, at 10:30:15
  //   "yesterday.23:59:59"          2003-01-07 23:59:59
  //   "Sunday", "mon", "Sat"        2003-01-05, 2003-01-06, 2003-01-11 (this week)
  //   "05-Jan-2003.14:07:09"        2003-01-05 14:07:09 (what FormatTolvane writes)
  //   "5-jan-2003", "05-JANUARY-2003.9:5"
  //                                 2003-01-05 00:00:00, 2003-01-05 09:05:00
  //   "05-Jan", "31-Dec"            2003-01-05, 2002-12-31 (no year: see the note)
  //   "31-Apr-2003", "00-Jan-2003"  2003-05-01, 2002-12-31 (carried)
  //   "05-Jan-2003.25:00"           2003-01-06 01:00:00 (carried)
  //   "05-Jan-2003.10:00:00.123"    2003-01-05 10:00:00 (the rest is ignored)
  //   "05-Jan-2003.10:00UTC"        2003-01-05 10:00:00 UTC
  //   "05-Jan-2003.10:00 UTC+2"     2003-01-05 12:00:00 UTC (see the note)
  //   "05-Jan-2003.10:00UTC-1:30"   2003-01-05 08:30:00 UTC
  //
  // The grammar:
  // * The first "." splits date from time. Without a ".", a text holding a ":"
  //   is a time today, any other text a date at 00:00:00.
  // * Date: "today", "yesterday", a weekday name (full or three letters), or
  //   day "-" month ["-" year]. The day has one or two characters and starts
  //   with a number up to 31 ("5x" reads 5; no lower bound, "00" is carried);
  //   the month is a name, full or three letters ("Sept" is none); the year has
  //   exactly four characters and starts with a number from 1969.
  // * Time: hour ":" minute [":" second], numbers after optional blanks and
  //   sign, anything after them ignored. No range test: hour 25 is carried.
  // * After the time, "UTC" (upper case: "utc" is ignored text and the time
  //   stays local), optionally with "+" or "-" and hours [":" minutes], at most
  //   13 hours and 59 minutes either way (a sign inside a number counts:
  //   "UTC+-2" is two hours back, "UTC+-14" is refused).
  //
  // Refused, leaving the count and the kept text as they were (status
  // `invalid`): a "." first or last ("05-Jan-2003.", ".10:00"); an unknown word
  // ("tomorrow", "yesterday 10:00"); a "-" first or last ("-05-Jan", "05-Jan-");
  // a bad day ("32-Jan", "2003-01-05"), month ("05-Sept") or year ("05-Jan-03");
  // an offset without sign or number, or too large ("UTC2", "UTC+", "UTC+14",
  // "UTC+5:60"); fewer than two time numbers ("05-Jan-2003.10",
  // "05-Jan-2003.UTC"); any number beyond 32 bits.
  //
  // Refused after reading (status `invalid`): a date outside 1970-01-01 to
  // 2038-01-18 ("05-Jan-1969", "05-Jan-2039"), and an empty text. The value
  // holds what `ParseDateTime` or `ParseDateTimeGMT` left when handed the
  // canonical text of the fields, or the text "%d/%d/%d %d:%d:%d" of fields the
  // field constructor refused ("2039/1/5 0:0:0", "0/0/0 0:0:0"). An offset that
  // would carry the count past 32 bits is refused too; the value then holds the
  // instant read without it.
  //
  // Note: "UTC+2" adds two hours to the time read: "10:00 UTC+2" is 12:00 UTC,
  //   not the 08:00 UTC that 10:00 in a zone two hours east of UTC would be.
  // Note: a day and month without a year that lie after now, time of day
  //   included, name the same day and time one year earlier: at 10:00 on
  //   2003-01-08, "08-Jan.11:00" is 2002-01-08 11:00:00. A 29 February typed in a
  //   year without one is carried to 1 March first ("29-Feb" early in 2005 is
  //   2004-02-29; early in 2004, 2003-03-01).
  // Note: a weekday name names its day in the Sunday-to-Saturday week of today,
  //   which may lie ahead: "friday" on a Wednesday is two days later.
  // Note: keywords count calendar days of local time: "yesterday" is the day
  //   before today, also just after a daylight-saving change.
  // Note: a local time that occurs twice when daylight saving ends gives its
  //   first occurrence, so the compact text of an instant in the repeated hour
  //   reads back one hour earlier; a local time skipped when it starts moves
  //   forward by the gap. With "UTC" neither happens.
  void ParseTolvaneDateTime(const char* text);

  // --- Calendar questions on this value's local date ------------------------------
  //
  // The free functions of the same names, asked of GetYear(), GetMonth() and
  // GetDay(), whatever the status.

  int IsLeapYear() const;
  long GetDaysInMonth() const;
  AdDateTime GetWeekStartDate() const;
  AdDateTime GetWeekEndDate() const;

  // --- Time zone and daylight saving ------------------------------------------
  //
  // Questions about the process's time zone, read afresh at every call: a `TZ`
  // changed with setenv between two calls is seen by the second. The zone is the
  // one the C library uses (`TZ` as a zone name under `TZDIR` or
  // /usr/share/zoneinfo, or as a POSIX rule string; `/etc/localtime` when `TZ` is
  // unset). Its rule is the one in force today (for a zone file, the rule string
  // at the end of its data), applied to every year asked about: a zone that
  // changed its rule in 2007 gets the new rule for 2006 too.

  // The offset of the zone's standard time from GMT in minutes, truncated toward
  // zero, positive WEST of Greenwich. Daylight saving never enters, so the
  // result is the same in summer and in winter.
  // Example: 300.0 in New York (UTC-5), -60.0 in Berlin (UTC+1), -330.0 in
  // Kolkata (UTC+5:30), 205.0 for a standard time 12 345 s behind UTC.
  // Note: the sign is the opposite of "UTC+1". Europe/Dublin gives -60.0: its
  // rule takes Irish summer time as standard time and winter as the daylight part.
  static double GetGMTOffset();

  // 1 when the zone's current rule has daylight saving, else 0, whatever the
  // season. Zones that had it in the past only give 0 (Asia/Tokyo, Asia/Kolkata,
  // Europe/Moscow, America/Sao_Paulo).
  static int UsesDST();

  // The local date-times at which daylight saving starts and ends in `year` under
  // the zone's current rule, in the canonical pattern "%Y-%m-%d %H:%M:%S":
  //
  //   start  the last second before the change to daylight time: the rule's
  //          local time of the change minus one second;
  //   end    the local time of the change back, as the clock reads it just
  //          before the change.
  //
  // The days are the rule's own: its weekday in its week of the month (the
  // second Sunday of March, the last Sunday of October), or a day of the year.
  // A time of the change outside 00:00-24:00 carries into the neighbouring day.
  // Both days lie in `year`, so south of the equator the end comes first.
  //
  // Returns 1 always. In a zone without daylight saving both texts are emptied.
  // Where a date lies outside 1970-01-01..2038-01-18, its text is the one an
  // `outOfRange` value keeps for those fields ("2039/3/13 1:59:59").
  //
  // Example: New York (",M3.2.0,M11.1.0", changes at 02:00), 2007: start
  // "2007-03-11 01:59:59", end "2007-11-04 02:00:00". Sydney, 2010: start
  // "2010-10-03 01:59:59", end "2010-04-04 03:00:00".
  // Note: Europe/Dublin follows its rule as written, winter being the daylight
  // part: for 2008 the start is "2008-10-26 01:59:59" and the end, earlier in the
  // same year, "2008-03-30 01:00:00".
  static int GenerateDSTDates(int year, std::string& start, std::string& end);

  // The start and end of daylight saving in `year`, from the table file
  // `directory` + "/dst_dates.dat" when it has an entry for the year, else as
  // GenerateDSTDates computes them. The result does not say which.
  //
  // Returns 0 with both texts emptied when the zone's current rule has no
  // daylight saving (no table is then read), else 1 with both texts written.
  //
  // The table is read afresh at every call, line by line, for example:
  //
  //   # Daylight saving as our region decided it
  //   2003-04-06 01:59:59;2003-10-26 02:00:00
  //   2004-04-04 01:59:59;2004-10-31 02:00:00
  //
  // * A line ends at "\n", and a "\r" before it is dropped; the last line needs
  //   no line end.
  // * A line whose very first character is "#" is a comment (" #" is not).
  // * Every other line is an entry: the start text before its first ";", the
  //   end text after it. Neither is trimmed. Each is read with ParseDateTime and
  //   must give a valid value; a line that does not is passed over, as is a line
  //   without ";" or starting with it.
  // * An entry belongs to the local year of its start; its end may lie later.
  //   The first entry of the year in file order is taken.
  // * The texts handed back are the two values written in the canonical pattern
  //   in local time, whatever form the entry used.
  // * No table: a null `directory`, no such file, or a name that is not a
  //   regular file (a directory, a FIFO or a device is never read, so a call
  //   never waits). Lines longer than 4096 bytes or holding a NUL byte are
  //   passed over like unreadable ones.
  static int GetDSTDates(const char* directory, int year, std::string& start,
                         std::string& end);

 private:
  // ----------------------------------------------------------------------------

  void WriteNotValid(std::string& out) const;

  // The range test: 1 when the fields name a date that a value can hold.
  static int Valid_Range(long year, long month, long day, long hour, long minute,
                         long second);

  std::int32_t seconds_ = 0;  // seconds since 1970-01-01 00:00:00 UTC
  AdDateTimeStatus status_ = null;
  std::string kept_text_;
};

// --- Calendar questions ----------------------------------------------------------

// 1 when `year` is a leap year of the Gregorian calendar, else 0. Applies to every
// year number, 0 and negative ones included: 1900 gives 0, 2000 gives 1, 0 gives 1.
DATETIMELIB_API int IsLeapYear(long year);

// The number of days of `month` in `year`: 28 or 29 for month 2, 31 for months 1,
// 3, 5, 7, 8, 10 and 12, and 30 for any other number (0, 13 and negative ones
// included).
DATETIMELIB_API long GetDaysInMonth(long year, long month);

// The start and end of the Sunday-to-Saturday week that holds a local date.
//
//         June 2003
//   Su Mo Tu We Th Fr Sa
//    1  2  3  4  5  6  7
//    8  9 10 11 12 13 14
//   15 16 17 18 19 20 21      GetWeekStartDate(2003, 6, 18) is 2003-06-15 00:00:00
//   22 23 24 25 26 27 28      GetWeekEndDate(2003, 6, 18)   is 2003-06-21 00:00:00
//   29 30
//
// Both give 00:00:00 local time of their day (the end is the start of Saturday,
// not its last second). The date is read as the field constructor reads it, so
// (2000, 13, 1) is 2001-01-01.
//
// A date the field constructor refuses gives a value with status `invalid` and
// the kept text of the refused fields at noon ("1969/12/31 12:0:0"). A week that
// leaves the range (the start of 1970-01-01..03, the end of 2038-01-17..18) gives
// `outOfRange` with the kept text of the day that could not be built
// ("1969/12/28 0:0:0", "2038/1/23 0:0:0").
DATETIMELIB_API AdDateTime GetWeekStartDate(long year, long month, long day);
DATETIMELIB_API AdDateTime GetWeekEndDate(long year, long month, long day);

#endif  // DATETIMELIB_ADDATETIME_H_
