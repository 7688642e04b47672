#!/usr/bin/env python3
"""Runs the benchmark binary and prints the ratio table.

For each operation: datetimelib's median time, the fastest peer's median in the
same run, their ratio (datetimelib / fastest peer), the ratio to the peer the
target names, the ratio to glibc, and the throughput of two threads over one for
datetimelib (target 1.8) and for glibc. Operations without a peer are held to a
time.

Usage: ratio_table.py BENCHMARK_BINARY [--zones America/New_York,UTC]
                      [--repetitions 12] [--min-time 0.1] [--tz-last]
"""
import argparse
import json
import os
import statistics
import subprocess
import sys

# Operation -> (title, target ratio, glibc peer name)
OPERATIONS = {
    "SixGetters": ("six getters on one value", 1.0, "LocaltimeR"),
    "Breakdown": ("breakdown (a getter)", 1.0, "LocaltimeR"),
    "Compose": ("field constructor", 0.8, "Mktime"),
    "FormatLocal": ("Format canonical, local", 0.4, "LocaltimeStrftime"),
    "FormatCompact": ("FormatTolvane", 0.4, "LocaltimeStrftime"),
    "FormatGmt": ("FormatGMT canonical", 0.3, "GmtimeStrftime"),
    "ParseLocal": ("ParseDateTime canonical", 0.3, "StrptimeMktime"),
    "ParseGmt": ("ParseDateTimeGMT canonical", 0.2, "StrptimeTimegm"),
    "ParseCompact": ("ParseTolvaneDateTime", 1.0, "StrptimeMktime"),
    "GmtOffset": ("GetGMTOffset", 2.0, "TzsetTimezone"),
    "UsesDst": ("UsesDST", 2.0, "TzsetDaylight"),
}
# Targets that name one peer rather than the fastest of them.
TARGET_PEER = {"SixGetters": "Date", "Compose": "Abseil", "Breakdown": "Date",
               "FormatLocal": "LocaltimeStrftime", "FormatCompact": "LocaltimeStrftime",
               "FormatGmt": "GmtimeStrftime", "ParseLocal": "StrptimeMktime",
               "ParseGmt": "StrptimeTimegm", "ParseCompact": "StrptimeMktime",
               "GmtOffset": "TzsetTimezone", "UsesDst": "TzsetDaylight"}
# Operations without a peer, held to a time: operation -> (title, nanoseconds).
ABSOLUTE = {
    "GetterAgain": ("a getter after another on the same value", 5.0),
    "DstDates": ("GenerateDSTDates", 300.0),
    "DstDatesNoTable": ("GetDSTDates(nullptr, ...)", 300.0),
}
# Two threads must give this much more than one.
SCALING_TARGET = 1.8


def run(binary, zone, repetitions, min_time, tz_last):
    # datetimelib checks on every call that TZ still reads as it did, walking
    # the environment up to TZ's entry. A shell's "TZ=zone command" puts TZ
    # first; --tz-last measures the other end.
    others = {k: v for k, v in os.environ.items() if k != "TZ"}
    env = dict(others, TZ=zone) if tz_last else dict({"TZ": zone}, **others)
    out = subprocess.run(
        [binary, f"--benchmark_repetitions={repetitions}",
         f"--benchmark_min_time={min_time}", "--benchmark_format=json",
         # Repetitions of all benchmarks in random order, so that a slow spell
         # of a shared machine falls on the library and its peers alike.
         "--benchmark_enable_random_interleaving=true"],
        env=env, check=True, capture_output=True, text=True).stdout
    medians = {}   # (area, library, threads) -> (ns per item, items per second)
    samples = {}
    for row in json.loads(out)["benchmarks"]:
        if row.get("run_type") != "iteration":
            continue
        name = row["run_name"] if "run_name" in row else row["name"]
        # BM_<Area>_<Who>/real_time/threads:N
        head, _, tail = name.partition("/")
        _, area, who = head.split("_", 2)
        threads = int(tail.rsplit("threads:", 1)[1])
        samples.setdefault((area, who, threads), []).append(
            (row["real_time"], row.get("items_per_second", 0.0)))
    for key, rows in samples.items():
        medians[key] = (statistics.median(r[0] for r in rows),
                        statistics.median(r[1] for r in rows))
    return medians


def scaling(medians, area, who):
    one = medians.get((area, who, 1))
    two = medians.get((area, who, 2))
    return two[1] / one[1] if one and two and one[1] else None


def scaling_text(value):
    if value is None:
        return "n/a"
    return f"{value:.2f}" + ("" if value >= SCALING_TARGET else " (MISSED)")


def table(zone, medians):
    lines = [f"TZ={zone}", "",
             "| Operation | datetimelib | fastest peer | ratio | target (vs) | vs glibc | "
             "2 threads / 1: datetimelib | glibc |",
             "|---|---|---|---|---|---|---|---|"]
    for area, (title, target, glibc) in OPERATIONS.items():
        ours = medians.get((area, "Datetimelib", 1))
        if ours is None:
            continue
        peers = {who: v for (a, who, t), v in medians.items()
                 if a == area and t == 1 and who != "Datetimelib"}
        if not peers:
            continue
        fastest = min(peers, key=lambda who: peers[who][0])
        ratio = ours[0] / peers[fastest][0]
        target_peer = TARGET_PEER[area]
        target_ratio = (ours[0] / peers[target_peer][0]
                        if target_peer in peers else float("nan"))
        met = "met" if target_ratio <= target else "MISSED"
        versus_glibc = (f"{ours[0] / peers[glibc][0]:.2f}" if glibc in peers else "n/a")
        glibc_scaling = scaling(medians, area, glibc)
        lines.append(
            f"| {title} | {ours[0]:.1f} ns | {fastest} {peers[fastest][0]:.1f} ns | "
            f"{ratio:.2f} | {target_ratio:.2f} <= {target} {target_peer}, {met} | "
            f"{versus_glibc} | {scaling_text(scaling(medians, area, 'Datetimelib'))} | "
            f"{'n/a' if glibc_scaling is None else f'{glibc_scaling:.2f}'} |")
    for area, (title, limit) in ABSOLUTE.items():
        ours = medians.get((area, "Datetimelib", 1))
        if ours is None:
            continue
        met = "met" if ours[0] <= limit else "MISSED"
        lines.append(
            f"| {title} | {ours[0]:.1f} ns | - | - | <= {limit:.0f} ns, {met} | - | "
            f"{scaling_text(scaling(medians, area, 'Datetimelib'))} | - |")
    return "\n".join(lines)


def main():
    parser = argparse.ArgumentParser()
    parser.add_argument("binary")
    parser.add_argument("--zones", default="America/New_York,UTC")
    parser.add_argument("--repetitions", type=int, default=12)
    parser.add_argument("--min-time", default="0.1")
    parser.add_argument("--tz-last", action="store_true",
                        help="put TZ last in the environment instead of first")
    args = parser.parse_args()
    for zone in args.zones.split(","):
        print(table(zone, run(args.binary, zone, args.repetitions, args.min_time, args.tz_last)))
        print()


if __name__ == "__main__":
    sys.exit(main())
