#!/usr/bin/env python3
"""Mutation testing of src/: how many small seeded faults the quick suite finds.

Each mutant changes one site of one file under src/ (recursively): a swapped
operator (< <=, > >=, + -, == !=, && ||), an integer constant off by one, or a
simple statement line dropped. The suite is the quick one: the gtest binary, the
CLI tests and the replayed fuzz corpora (everything but the zone sweep).

  tools/mutate.py --seed 12 --count 320 --list     # the chosen mutants
  tools/mutate.py --seed 12 --count 320            # build and test each

A mutant that does not compile is "not built"; a timeout counts as killed. The
file is restored byte for byte after each mutant, also on Ctrl-C or error.
"""
import argparse
import json
import random
import re
import shutil
import signal
import subprocess
import sys
import time
from pathlib import Path

# Operators are swapped only with a space on both sides: clang-format spaces
# binary operators, so this leaves templates, "->", "<<" and unary signs alone.
SWAPS = {"<": "<=", "<=": "<", ">": ">=", ">=": ">", "+": "-", "-": "+",
         "==": "!=", "!=": "==", "&&": "||", "||": "&&"}
OPERATOR = re.compile(r"(?<= )(<=|>=|==|!=|&&|\|\||<|>|\+|-)(?= )")
INTEGER = re.compile(r"(?<![\w.'])(\d+)([uUlL]*)(?![\w.'])")
# A statement we can drop without breaking later code: an assignment to an
# lvalue without a type before it, an increment, or a call whose result is unused.
LVALUE = r"[\w.\[\]>*()-]+"
DROPPABLE = re.compile(
    rf"^(?:{LVALUE}\s*(?:[-+*/%|&^]|<<|>>)?=[^=].*"
    rf"|(?:\+\+|--){LVALUE}|{LVALUE}(?:\+\+|--)"
    rf"|[\w:.>-]+(?:<[\w:, ]*>)?\(.*\));$")
NOT_STATEMENTS = re.compile(
    r"^(return|break|continue|case|default|using|typedef|namespace|template|struct"
    r"|class|enum|friend|goto|static_assert|else|do|public|private|protected)\b")
STATEMENT_BEFORE = (";", "{", "}", ":", ")", "else")


def mask(lines):
    """Each line with comments and string/char literals blanked to spaces, so
    that columns still match the source."""
    out, in_block = [], False
    for line in lines:
        chars, i, quote = list(line), 0, None
        while i < len(chars):
            pair = line[i:i + 2]
            if in_block:
                if pair == "*/":
                    chars[i:i + 2], in_block, i = "  ", False, i + 2
                    continue
                chars[i] = " "
            elif quote:
                if line[i] == "\\":
                    chars[i:i + 2] = " " * len(chars[i:i + 2])
                    i += 2
                    continue
                if line[i] == quote:
                    quote = None
                chars[i] = " "
            elif pair == "//":
                chars[i:] = " " * (len(chars) - i)
                break
            elif pair == "/*":
                chars[i:i + 2], in_block, i = "  ", True, i + 2
                continue
            elif line[i] in "\"'" and not (line[i] == "'" and i and line[i - 1].isalnum()):
                quote, chars[i] = line[i], " "
            i += 1
        out.append("".join(chars))
    return out


def sites_of(path, rel):
    lines = path.read_text().split("\n")
    masked = mask(lines)
    sites, previous, preprocessor, in_assert = [], ";", False, False
    for number, code in enumerate(masked, 1):
        stripped = code.strip()
        if preprocessor or stripped.startswith("#"):
            preprocessor = code.rstrip().endswith("\\")
            continue
        if not stripped:
            continue
        if "static_assert" in code or in_assert:
            in_assert = not stripped.endswith(";")
            previous = stripped
            continue
        for m in OPERATOR.finditer(code):
            sites.append((rel, number, m.start() + 1, m.group(1), SWAPS[m.group(1)]))
        for m in INTEGER.finditer(code):
            value = int(m.group(1))
            for other in (value + 1, value - 1):
                if other >= 0:
                    sites.append((rel, number, m.start() + 1, m.group(0),
                                  f"{other}{m.group(2)}"))
        if (previous.endswith(STATEMENT_BEFORE) and DROPPABLE.match(stripped)
                and not NOT_STATEMENTS.match(stripped)):
            column = len(code) - len(code.lstrip()) + 1
            sites.append((rel, number, column, lines[number - 1].strip(), ";"))
        previous = stripped
    return sites


def all_sites(root):
    files = sorted(p for p in (root / "src").rglob("*") if p.suffix in (".cc", ".h"))
    return [s for p in files for s in sites_of(p, str(p.relative_to(root)))]


def choose(root, seed, count):
    sites = all_sites(root)
    picked = random.Random(seed).sample(range(len(sites)), min(count, len(sites)))
    # In file order, so that consecutive mutants mostly recompile one source.
    return len(sites), [sites[i] for i in sorted(picked)]


def apply(text, site):
    _, line, column, original, replacement = site
    lines = text.split("\n")
    target = lines[line - 1]
    start = column - 1
    assert target[start:start + len(original)] == original, site
    lines[line - 1] = target[:start] + replacement + target[start + len(original):]
    return "\n".join(lines)


def run(command, cwd, timeout, log):
    try:
        done = subprocess.run(command, cwd=cwd, timeout=timeout, stdout=log,
                              stderr=subprocess.STDOUT)
        return done.returncode
    except subprocess.TimeoutExpired:
        return None


def configure(root, build):
    if (build / "CMakeCache.txt").exists():
        return
    generator = ["-G", "Ninja"] if shutil.which("ninja") else []
    if shutil.which("ld.lld"):
        generator += [f"-DCMAKE_{kind}_LINKER_FLAGS=-fuse-ld=lld" for kind in ("EXE", "SHARED")]
    # -O1 rather than -O0: one source compiles a little slower, but the suite,
    # which every mutant runs, takes half the CPU. Tests are listed at test time
    # rather than at every link.
    subprocess.run(["cmake", "-S", str(root), "-B", str(build), *generator,
                    "-DCMAKE_BUILD_TYPE=Debug", "-DCMAKE_CXX_FLAGS=-O1 -g0",
                    "-DDATETIMELIB_WERROR=OFF",
                    "-DCMAKE_GTEST_DISCOVER_TESTS_DISCOVERY_MODE=PRE_TEST"],
                   check=True, stdout=subprocess.DEVNULL)


def targets(root):
    """What the quick suite runs: not the zone sweep, whose link costs time."""
    replays = sorted(p.name[:-len("_fuzz.cc")] + "_replay"
                     for p in (root / "fuzz").glob("*_fuzz.cc"))
    return ["adtime", "datetimelib_tests", "adtime_cli_tests", *replays]


def test_mutant(root, build, timeout, log):
    """The suite's verdict on the tree as it stands, or 'not built'."""
    if run(["cmake", "--build", str(build), "-j2", "--target", *targets(root)],
           None, 900, log) != 0:
        return "not built"
    code = run(["ctest", "--test-dir", str(build), "-LE", "sweep", "-j2",
                "--stop-on-failure", "--timeout", str(timeout)], None, 20 * timeout, log)
    if code is None:
        return "timed out"
    return "survived" if code == 0 else "killed"


def main():
    parser = argparse.ArgumentParser(description=__doc__.split("\n")[0])
    parser.add_argument("--root", type=Path, default=Path(__file__).resolve().parents[1])
    parser.add_argument("--seed", type=int, default=1)
    parser.add_argument("--count", type=int, default=100)
    parser.add_argument("--list", action="store_true", help="print the mutants only")
    parser.add_argument("--build", type=Path, help="default: ROOT/build/mutate")
    parser.add_argument("--results", type=Path, help="default: BUILD/mutants.jsonl")
    parser.add_argument("--timeout", type=int, default=60, help="seconds per test")
    parser.add_argument("--only", help="comma-separated ids of the chosen mutants to run")
    args = parser.parse_args()
    root = args.root.resolve()
    total, mutants = choose(root, args.seed, args.count)
    if args.list:
        for i, (rel, line, column, original, replacement) in enumerate(mutants):
            print(f"{i}\t{rel}:{line}:{column}\t{original} -> {replacement}")
        print(f"{len(mutants)} of {total} sites", file=sys.stderr)
        return 0

    build = (args.build or root / "build" / "mutate").resolve()
    results_path = args.results or build / "mutants.jsonl"
    configure(root, build)
    # A plain kill must restore the file too: make it unwind like Ctrl-C.
    signal.signal(signal.SIGTERM, lambda *_: sys.exit("terminated"))
    log_path = build / "mutate.log"
    with open(log_path, "w") as log:
        if test_mutant(root, build, args.timeout, log) != "survived":
            sys.exit(f"the unmutated tree does not pass; see {log_path}")
    chosen = range(len(mutants))
    if args.only:
        chosen = [int(i) for i in args.only.split(",")]
    counts, survivors = {}, []
    with open(results_path, "w") as results:
        for i in chosen:
            site = mutants[i]
            path = root / site[0]
            original = path.read_bytes()
            started = time.monotonic()
            try:
                path.write_text(apply(original.decode(), site))
                with open(log_path, "w") as log:
                    verdict = test_mutant(root, build, args.timeout, log)
            finally:
                path.write_bytes(original)
            seconds = round(time.monotonic() - started, 1)
            counts[verdict] = counts.get(verdict, 0) + 1
            rel, line, column, before, after = site
            results.write(json.dumps({"id": i, "file": rel, "line": line, "column": column,
                                      "original": before, "replacement": after,
                                      "result": verdict, "seconds": seconds}) + "\n")
            results.flush()
            if verdict == "survived":
                survivors.append(f"{rel}:{line}:{column}\t{before} -> {after}")
            print(f"[{i}/{len(mutants)}] {verdict:9} {seconds:6}s "
                  f"{rel}:{line}:{column} {before} -> {after}", flush=True)
    built = len(chosen) - counts.get("not built", 0)
    killed = counts.get("killed", 0) + counts.get("timed out", 0)
    print(f"\nbuilt {built}, killed {killed} (timed out {counts.get('timed out', 0)}), "
          f"survived {len(survivors)}, not built {counts.get('not built', 0)}")
    print(f"kill rate {killed / built:.1%}" if built else "kill rate n/a")
    print("survivors:", *survivors, sep="\n  ")
    print(f"results: {results_path}")
    return 0


if __name__ == "__main__":
    sys.exit(main())
