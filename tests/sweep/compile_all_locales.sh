#!/bin/sh
# Compiles every locale source with a time category (LC_TIME) into OUT, UTF-8,
# two at a time; nothing is installed system-wide. A locale already compiled
# after its source changed last is kept, so a second run costs nothing. Sources
# that localedef cannot compile (no whole locale) are left for the sweep to
# skip.
#
# The sweep reads dates, never sorts text: each source's collation is replaced
# by POSIX's before compiling, which halves what localedef spends.
#   compile_all_locales.sh OUT [SOURCES]
set -eu
out=$1
sources=${2:-/usr/share/i18n/locales}
mkdir -p "$out/sources"
grep -l '^LC_TIME' "$sources"/* | while read -r source; do basename "$source"; done |
  OUT=$out SOURCES=$sources xargs -P2 -I{} sh -c '
    name={}
    case $name in  # the C library looks for ll_CC@euro as ll_CC.utf8@euro
      *@*) folder="$OUT/${name%%@*}.utf8@${name#*@}" ;;
      *) folder="$OUT/$name.utf8" ;;
    esac
    compiled="$folder/LC_TIME"
    if [ -e "$compiled" ] && [ "$compiled" -nt "$SOURCES/{}" ]; then exit 0; fi
    awk "/^LC_COLLATE[[:space:]]*\$/ { print \"LC_COLLATE\"; print \"copy \\\"POSIX\\\"\";
           print \"END LC_COLLATE\"; skip = 1; next }
         skip { if (/^END LC_COLLATE/) skip = 0; next }
         { print }" "$SOURCES/{}" > "$OUT/sources/{}"
    localedef --no-archive -i "$OUT/sources/{}" -f UTF-8 "$folder" >/dev/null 2>&1 || true'
