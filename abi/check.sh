#!/usr/bin/env bash
# Holds the library's ABI to the baseline committed for its SONAME,
# abi/<SONAME>.abi, written by abigail-tools' abidw and compared with abidiff.
#
#   abi/check.sh [BUILD_DIR]            compare a build (default: build/default)
#   abi/check.sh --update [BUILD_DIR]   write the baseline anew from the build
#
# The build needs debug information (the default preset's RelWithDebInfo). Only
# the types of the public header count.
#
# The check fails when the build's ABI differs from the baseline, and, where the
# git history is at hand, when a baseline was changed without CHANGELOG.md in
# the same commit, or changed incompatibly under the same SONAME. --update
# refuses an incompatible change under the same SONAME: raise the version
# (before 1.0 the minor version, which the SONAME carries) first.
set -euo pipefail

root=$(cd "$(dirname "$0")/.." && pwd)
update=false
if [[ "${1:-}" == --update ]]; then
  update=true
  shift
fi
build=$(cd "${1:-$root/build/default}" && pwd)
cd "$root"
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

fail() {
  echo "abi check: $*" >&2
  exit 1
}

library=$build/libdatetimelib.so
[[ -e "$library" ]] || fail "no $library: build first"
soname=$(objdump -p "$library" | awk '$1 == "SONAME" { print $2 }')
baseline=abi/$soname.abi

# abidiff's exit status is a bit set: 1 an error, 2 a usage error, 4 an ABI
# change, 8 an incompatible one.
compare() {
  local status=0
  abidiff --no-show-locs "$1" "$2" >"$work/report" 2>&1 || status=$?
  ((status & 3)) && { cat "$work/report" >&2; fail "abidiff $1 $2 failed"; }
  return $status
}

abidw --headers-dir include --drop-private-types --no-corpus-path --no-comp-dir-path \
  --no-show-locs --out-file "$work/built.abi" "$library"

if $update; then
  if [[ -f "$baseline" ]]; then
    status=0
    compare "$baseline" "$work/built.abi" || status=$?
    cat "$work/report"
    ((status & 8)) && fail "an incompatible change needs a new SONAME, not a new $baseline"
  fi
  cp "$work/built.abi" "$baseline"
  echo "wrote $baseline: commit it with a CHANGELOG.md entry that names the change"
  exit 0
fi

[[ -f "$baseline" ]] ||
  fail "no baseline $baseline for the SONAME $soname: write it with 'abi/check.sh --update'"
status=0
compare "$baseline" "$work/built.abi" || status=$?
if ((status != 0)); then
  cat "$work/report" >&2
  if ((status & 8)); then
    fail "the ABI changed incompatibly: raise the version (a new SONAME), write its baseline with 'abi/check.sh --update' and record it in CHANGELOG.md"
  fi
  fail "the ABI changed: write the baseline anew with 'abi/check.sh --update' and record the change in CHANGELOG.md"
fi
echo "ok: the ABI of $soname matches $baseline"

# Each baseline's last change came with a CHANGELOG.md entry, and the SONAME's
# baseline only ever changed compatibly.
if git rev-parse --is-inside-work-tree >/dev/null 2>&1; then
  for file in abi/*.abi; do
    commit=$(git log -1 --format=%H -- "$file")
    [[ -n "$commit" ]] || continue  # not committed yet
    git show --name-only --format= "$commit" | grep -qx CHANGELOG.md ||
      fail "commit ${commit:0:12} changed $file without a CHANGELOG.md entry"
  done
  commit=$(git log -1 --format=%H -- "$baseline")
  if [[ -n "$commit" ]] && git cat-file -e "$commit^:$baseline" 2>/dev/null; then
    git show "$commit^:$baseline" >"$work/previous.abi"
    status=0
    compare "$work/previous.abi" "$baseline" || status=$?
    if ((status & 8)); then
      cat "$work/report" >&2
      fail "commit ${commit:0:12} changed $baseline incompatibly under the same SONAME"
    fi
  elif [[ -n "$commit" ]]; then
    grep -qF "$soname" CHANGELOG.md || fail "CHANGELOG.md does not name the SONAME $soname"
  fi
  echo "ok: every change of a baseline is recorded"
fi
