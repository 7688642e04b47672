#!/usr/bin/env bash
# Installs a build into a temporary prefix, moves the installed tree (it must not
# depend on where it was installed), then builds the example host application
# against it through find_package and through pkg-config, runs both, and runs
# the installed adtime and its manual page.
#
#   tests/install/install_and_consume.sh [BUILD_DIR]   (default: build/default)
#   tests/install/install_and_consume.sh --prefix DIR
#
# With --prefix, DIR is an installed tree taken as it is, such as the usr/ of
# unpacked Debian packages; its adtime has no run path, as a system's has none,
# and finds the library through LD_LIBRARY_PATH.
set -euo pipefail

root=$(cd "$(dirname "$0")/../.." && pwd)
prefix=""
if [[ "${1:-}" == --prefix ]]; then
  prefix=$(cd "$2" && pwd)
else
  build=${1:-$root/build/default}
fi
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

fail() {
  echo "install test: $*" >&2
  exit 1
}

# Compares a command's output with what it must print.
expect_output() {
  local what=$1 expected=$2 actual=$3
  if [[ "$actual" != "$expected" ]]; then
    printf 'install test: %s printed\n%s\ninstead of\n%s\n' "$what" "$actual" "$expected" >&2
    exit 1
  fi
  echo "ok: $what"
}

if [[ -z "$prefix" ]]; then
  cmake --install "$build" --prefix "$work/staged" >/dev/null
  mv "$work/staged" "$work/prefix"
  prefix=$work/prefix
  run_tool=("$prefix/bin/adtime")
fi

pc_file=$(find "$prefix" -name datetimelib.pc)
[[ -n "$pc_file" ]] || fail "no datetimelib.pc installed"
libdir=$(dirname "$(dirname "$pc_file")")
[[ -f "$prefix/include/AdDateTime.h" ]] || fail "no AdDateTime.h installed"
[[ -L "$libdir/libdatetimelib.so" ]] || fail "no libdatetimelib.so development link"
soname=$(objdump -p "$libdir/libdatetimelib.so" | awk '$1 == "SONAME" { print $2 }')
[[ -v run_tool ]] || run_tool=(env LD_LIBRARY_PATH="$libdir" "$prefix/bin/adtime")
[[ -L "$libdir/$soname" ]] || fail "no $soname link for the SONAME"
echo "ok: library, SONAME link $soname, header and package files installed"

# 2007-03-11 is the first day of daylight saving in New York: the meetings after
# it stay at 09:30 local time.
export TZ=America/New_York LC_ALL=C
expected="meeting:  Mon 2007-03-05 09:30 (05-Mar-2007.09:30:00)
week:     2007-03-04 to 2007-03-10
next 1:   2007-03-12 09:30
next 2:   2007-03-19 09:30
next 3:   2007-03-26 09:30
next 4:   2007-04-02 09:30"

cmake -S "$root/examples" -B "$work/with-cmake" -DCMAKE_PREFIX_PATH="$prefix" >/dev/null
cmake --build "$work/with-cmake" >/dev/null
expect_output "example built with find_package" "$expected" \
  "$("$work/with-cmake/meeting_planner" "05-Mar-2007.09:30")"

export PKG_CONFIG_PATH=$(dirname "$pc_file")
pkg-config --exists 'datetimelib >= 0.1.0' || fail "pkg-config does not find datetimelib 0.1.0"
# shellcheck disable=SC2046  # the flags are meant to split
c++ -std=c++17 "$root/examples/main.cc" -o "$work/with-pkg-config" \
  $(pkg-config --cflags --libs datetimelib) \
  -Wl,-rpath,"$(pkg-config --variable=libdir datetimelib)"
expect_output "example built with pkg-config" "$expected" \
  "$("$work/with-pkg-config" "05-Mar-2007.09:30")"

expect_output "installed adtime" \
  "05-Mar-2007.09:30:00" "$("${run_tool[@]}" compact 1173105000)"
real_library=$(readlink -f "$libdir/$soname")
expect_output "installed adtime --version" \
  "libdatetimelib.so ${real_library##*/libdatetimelib.so.} (SONAME $soname) from $real_library" \
  "$("${run_tool[@]}" --version | sed -n 2p)"

page=$prefix/share/man/man1/adtime.1.gz
[[ -f "$page" ]] || fail "no manual page $page"
if command -v man >/dev/null; then
  MANPATH=$prefix/share/man MANWIDTH=80 man adtime 2>"$work/man-warnings" >"$work/man-page" ||
    fail "man adtime failed: $(cat "$work/man-warnings")"
  [[ ! -s "$work/man-warnings" ]] || fail "man adtime warned: $(cat "$work/man-warnings")"
  grep -q "^EXIT STATUS" "$work/man-page" || fail "man adtime shows no EXIT STATUS section"
  echo "ok: man adtime"
fi
