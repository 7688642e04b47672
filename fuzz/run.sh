#!/usr/bin/env bash
# Runs every fuzz target for a while from its seeds: fuzz/run.sh BUILD_DIR [SECONDS]
# A target that finds a failing input exits non-zero and leaves the input in the
# work folder.
set -euo pipefail
build=${1:?build folder (for example build/fuzz)}
seconds=${2:-30}
here=$(cd "$(dirname "$0")" && pwd)
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

for target in compact_parse locale_parse posix_rule tzif; do
  corpus="$work/$target"
  mkdir -p "$corpus"
  if [[ $target == tzif ]]; then
    for zone in America/New_York Europe/Dublin Australia/Lord_Howe Asia/Kolkata UTC; do
      cp "/usr/share/zoneinfo/$zone" "$corpus/${zone//\//_}"
    done
  else
    n=0
    while IFS= read -r seed; do
      printf '%s' "$seed" > "$corpus/seed$((n++))"
    done < "$here/seeds/$target.txt"
  fi
  echo "fuzzing $target for ${seconds}s"
  (cd "$work" && "$build/fuzz/${target}_fuzz" -max_total_time="$seconds" -max_len=4096 \
      -print_final_stats=0 "$corpus" 2>&1 | tail -n 2)
done
