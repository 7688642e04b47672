// meeting_planner: a small host application of datetimelib. It reads a meeting
// time as a person types it and prints the week it falls in and the next four
// meetings one week apart.
//
//   meeting_planner "Fri.10:00"          this week's Friday at 10:00
//   meeting_planner "05-Jan-2003.14:30"  a fixed date
#include <AdDateTime.h>

#include <cstdio>

int main(int argc, char** argv) {
  const char* typed = argc > 1 ? argv[1] : "today.09:00";

  AdDateTime meeting;
  meeting.ParseTolvaneDateTime(typed);
  if (!meeting.IsValid()) {
    std::fprintf(stderr, "meeting_planner: cannot read \"%s\" as a date\n", typed);
    return 1;
  }

  const char* pattern = "%Y-%m-%d %H:%M";
  std::printf("meeting:  %s (%s)\n", meeting.Format("%a %Y-%m-%d %H:%M").c_str(),
              meeting.FormatTolvane().c_str());
  std::printf("week:     %s to %s\n",
              meeting.GetWeekStartDate().Format("%Y-%m-%d").c_str(),
              meeting.GetWeekEndDate().Format("%Y-%m-%d").c_str());

  // Each meeting is built from the local fields, seven days on: the day carries
  // into the next month. Adding AdDuration(7.0) instead would add 7 * 86 400
  // seconds, which moves the time of day across a daylight-saving change.
  for (long week = 1; week <= 4; ++week) {
    const AdDateTime next(meeting.GetYear(), meeting.GetMonth(),
                          meeting.GetDay() + 7 * week, meeting.GetHour(),
                          meeting.GetMinute(), meeting.GetSecond());
    std::printf("next %ld:   %s\n", week, next.Format(pattern).c_str());
  }
  return 0;
}
