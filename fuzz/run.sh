#!/usr/bin/env bash
# Builds every fuzz target with clang (preset "fuzz") and fuzzes each for SECONDS
# from its corpus in fuzz/corpus/<target>, two or more side by side:
#
#   fuzz/run.sh SECONDS [TARGET...]
#
# Prints each target's executions and corpus size, and exits non-zero when any
# target finds a crash, a leak, a timeout or a broken property; the input that
# did it is kept in the work folder and named in the output. New inputs go to
# the work folder too, never into fuzz/corpus. Environment:
#   FUZZ_WORK  the work folder (default: a new temporary one, removed after a
#              clean run); kept inputs there are fuzzed again on the next run
#   FUZZ_JOBS  targets fuzzed at once (default: the number of processors)
set -euo pipefail
seconds=${1:?usage: fuzz/run.sh SECONDS [TARGET...]}
shift
root=$(cd "$(dirname "$0")/.." && pwd)
targets=("$@")
if ((${#targets[@]} == 0)); then
  targets=(tolvane_parse locale_parse format round_trip zone_rule tzif dst_table)
fi
jobs=${FUZZ_JOBS:-$(nproc)}
work=${FUZZ_WORK:-}
if [[ -z $work ]]; then
  work=$(mktemp -d)
  remove_work=1
fi
mkdir -p "$work"

cd "$root"
cmake --preset fuzz >/dev/null
cmake --build --preset fuzz >/dev/null

fuzz_one() {
  local target=$1
  local grown="$work/$target/corpus" log="$work/$target/log"
  mkdir -p "$grown"
  # libFuzzer adds what it finds to the first folder and only reads the second.
  # Leaks are looked for once, when the target exits: a check after each input
  # that allocates more than it frees (as the zone and locale caches do) would
  # cost most of the run.
  if "$root/build/fuzz/fuzz/${target}_fuzz" "$grown" "$root/fuzz/corpus/$target" \
      -max_total_time="$seconds" -max_len=4096 -timeout=10 -rss_limit_mb=2048 \
      -detect_leaks=0 -print_final_stats=1 -artifact_prefix="$work/$target/" >"$log" 2>&1; then
    local executions
    executions=$(sed -n 's/^stat::number_of_executed_units: *//p' "$log")
    printf '%-14s ok      %10s executions, corpus %s inputs\n' "$target" "$executions" \
      "$(($(ls "$grown" | wc -l) + $(ls "$root/fuzz/corpus/$target" | wc -l)))"
  else
    printf '%-14s FAILED  see %s\n' "$target" "$log"
    grep -E '^(==[0-9]+==ERROR|SUMMARY|property broken|artifact_prefix|Test unit written)' "$log" |
      sed 's/^/    /' | head -n 8
    return 1
  fi
}

failed=0
running=0
for target in "${targets[@]}"; do
  if ((running >= jobs)); then
    wait -n || failed=1
    running=$((running - 1))
  fi
  fuzz_one "$target" &
  running=$((running + 1))
done
while ((running > 0)); do
  wait -n || failed=1
  running=$((running - 1))
done

if ((failed)); then
  echo "fuzzing found failures; the work folder $work keeps the inputs"
  exit 1
fi
if [[ -n ${remove_work:-} ]]; then rm -rf "$work"; fi
