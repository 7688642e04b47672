// Local fields to a seconds count, shared by the value's constructors and helpers.
#ifndef DATETIMELIB_VALUE_LOCAL_COUNT_H_
#define DATETIMELIB_VALUE_LOCAL_COUNT_H_

#include <cstdint>
#include <optional>

namespace datetimelib {

// The 32-bit count of local fields, carried as mktime carries them; nothing when
// the local time has no 32-bit count. No range test is made.
std::optional<std::int32_t> LocalCount(long year, long month, long day, long hour,
                                       long minute, long second);

}  // namespace datetimelib

#endif  // DATETIMELIB_VALUE_LOCAL_COUNT_H_
