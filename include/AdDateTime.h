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
// any of them, starts no threads and holds no state between calls. Any member may
// be called from many threads at once on distinct values.
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
  // Note: a local time that a change to daylight saving skips moves forward by
  // the size of the change (02:30 on a spring-forward day gives 03:30 daylight
  // time). A local time that occurs twice gives the first occurrence, the
  // daylight reading in zones that move their clocks ahead in summer. Unlike
  // `mktime`, the answer never depends on earlier calls.
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
  // not `valid` gives the fields of whatever count it holds.

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
  // A null pattern gives the empty text.
  std::string Format(const char* pattern) const;

  // The same in UTC: no zone, no daylight saving; %Z writes "GMT".
  // Example: AdDateTime(AdTime(1000000000)).FormatGMT("%Y-%m-%d %H:%M:%S") gives
  // "2001-09-09 01:46:40".
  std::string FormatGMT(const char* pattern) const;

  // --- Parsing ---------------------------------------------------------------------
  //
  // Both members read the whole text (trailing blanks aside) in the calling
  // thread's locale; every locale reads the canonical text "%Y-%m-%d %H:%M:%S".
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
