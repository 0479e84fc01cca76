#!/usr/bin/python3
"""Sampled mutation testing of src/ and plugins/ (scripts/mutants.sh is the entry point).

A mutant changes one comparison, arithmetic operator, boolean or constant in one tracked .cpp file of
src/ or plugins/. Every candidate place gets a rank from a hash of the seed and of the place itself
(file, the line's text, which of its equal lines, which match in the line, the change), so a seed picks
the same mutants while the rest of the code changes. The mutants are taken in rank order; each is
built incrementally in its own build folder and run against the suite (ctest, stopping at the first
failing test, with a time limit). A mutant that does not build counts neither as caught nor as
survived: it is listed apart and the next place in rank order is taken instead, until N have run.
The source is restored after every mutant, also on Ctrl-C or SIGTERM; a run killed outright leaves a
journal in the build folder from which the next run restores the file first.
"""

import hashlib
import os
import re
import signal
import subprocess
import sys
import time

ROOT = os.path.dirname(os.path.dirname(os.path.abspath(__file__)))

COMPARISONS = {"==": "!=", "!=": "==", "<": ">=", ">": "<=", "<=": ">", ">=": "<"}
ARITHMETIC = {"+": "-", "-": "+", "*": "/", "/": "*", "%": "*",
              "+=": "-=", "-=": "+=", "*=": "/=", "/=": "*="}
LOGICAL = {"&&": "||", "||": "&&"}

# Binary operators stand between spaces (clang-format), which tells them from template brackets,
# pointers, unary minus and stream operators.
BINARY = re.compile(r"(?<= )(==|!=|<=|>=|&&|\|\||[+\-*/]=|[<>+\-*/%])(?= )")
BOOLEAN = re.compile(r"\b(true|false)\b")
NEGATION = re.compile(r"(?<![\w)\]!=<>&|])!(?=[\w(])")
NUMBER = re.compile(r"(?<![\w.])(\d+\.\d+|\d+)([uUlLfF]*)(?![\w.])")
SKIPPED_LINES = re.compile(r"\b(static_assert|template|alignas|VYN_CLASS_ALLOCATOR)\b")


def code_mask(text):
    """The text with every character outside code (comments, literals, preprocessor lines) as '_'."""
    out = []
    i, n = 0, len(text)
    state = "code"
    raw_end = ""
    line_start = True
    while i < n:
        c = text[i]
        if state == "code":
            if line_start and c == "#":
                state = "preprocessor"
                continue
            if c == "\n":
                out.append(c)
                line_start = True
                i += 1
                continue
            if not c.isspace():
                line_start = False
            if text.startswith("//", i):
                state = "line_comment"
                continue
            if text.startswith("/*", i):
                state = "block_comment"
                out.append("__")
                i += 2
                continue
            raw = re.match(r'(?:u8|[uUL])?R"([^(\s]*)\(', text[i:])
            if raw:
                state = "raw"
                raw_end = ")" + raw.group(1) + '"'
                out.append("_" * raw.end())
                i += raw.end()
                continue
            if c in "\"'":
                quote = c
                out.append("_")
                i += 1
                while i < n and text[i] != quote and text[i] != "\n":
                    step = 2 if text[i] == "\\" else 1
                    out.append("_" * min(step, n - i))
                    i += step
                if i < n and text[i] == quote:
                    out.append("_")
                    i += 1
                continue
            out.append(c)
            i += 1
        elif state in ("line_comment", "preprocessor"):
            if c == "\n":
                continued = state == "preprocessor" and i > 0 and text[i - 1] == "\\"
                out.append(c)
                i += 1
                if not continued:
                    state = "code"
                    line_start = True
                continue
            out.append("_")
            i += 1
        elif state == "block_comment":
            if text.startswith("*/", i):
                out.append("__")
                i += 2
                state = "code"
                continue
            out.append("\n" if c == "\n" else "_")
            i += 1
        else:  # raw string
            if text.startswith(raw_end, i):
                out.append("_" * len(raw_end))
                i += len(raw_end)
                state = "code"
                continue
            out.append("\n" if c == "\n" else "_")
            i += 1
    return "".join(out)


def changed_number(digits):
    if "." in digits:
        whole, fraction = digits.split(".")
        return str(int(whole) + 1) + "." + fraction
    value = int(digits)
    return {0: "1", 1: "0"}.get(value, str(value + 1))


def line_mutations(masked):
    """(column, original, replacement, kind) of every mutation of one masked line."""
    if SKIPPED_LINES.search(masked):
        return []
    found = []
    for match in BINARY.finditer(masked):
        op = match.group(1)
        if op in COMPARISONS:
            found.append((match.start(), op, COMPARISONS[op], "comparison"))
        elif op in LOGICAL:
            found.append((match.start(), op, LOGICAL[op], "boolean"))
        else:
            found.append((match.start(), op, ARITHMETIC[op], "arithmetic"))
    for match in BOOLEAN.finditer(masked):
        word = match.group(1)
        found.append((match.start(), word, "false" if word == "true" else "true", "boolean"))
    for match in NEGATION.finditer(masked):
        found.append((match.start(), "!", "", "boolean"))
    for match in NUMBER.finditer(masked):
        digits = match.group(1)
        found.append((match.start(1), digits, changed_number(digits), "constant"))
    return sorted(found)


def sites(seed):
    """Every mutation of the tracked sources, in the seed's rank order."""
    files = subprocess.run(["git", "ls-files", "src/*.cpp", "plugins/*.cpp"], cwd=ROOT, check=True,
                           capture_output=True, text=True).stdout.split()
    ranked = []
    for path in sorted(files):
        with open(os.path.join(ROOT, path), encoding="utf-8") as source:
            lines = source.read().split("\n")
        masked_lines = code_mask("\n".join(lines)).split("\n")
        seen = {}
        for number, (line, masked) in enumerate(zip(lines, masked_lines), start=1):
            key = line.strip()
            repeat = seen.get(key, 0)
            seen[key] = repeat + 1
            for index, (column, original, replacement, kind) in enumerate(line_mutations(masked)):
                identity = "\0".join([str(seed), path, key, str(repeat), str(index), original, replacement])
                rank = hashlib.sha256(identity.encode()).hexdigest()
                ranked.append((rank, path, number, column, original, replacement, kind))
    ranked.sort()
    return ranked


def describe(site):
    _, path, number, column, original, replacement, kind = site
    return f"{path}:{number}:{column + 1}: {kind} `{original}` -> `{replacement or '(removed)'}`"


class Source:
    """One source file changed in place, put back by restore() and, after a hard kill, from the journal."""

    def __init__(self, journal):
        self.journal = journal
        self.path = None
        self.original = None

    def recover(self):
        if not os.path.exists(self.journal):
            return
        with open(self.journal, encoding="utf-8") as journal:
            path = journal.readline().rstrip("\n")
            original = journal.read()
        self._write(path, original)
        os.remove(self.journal)
        print(f"mutants: restored {os.path.relpath(path, ROOT)} left changed by an interrupted run")

    def mutate(self, site):
        _, path, number, column, original, replacement, _ = site
        self.path = os.path.join(ROOT, path)
        with open(self.path, encoding="utf-8") as source:
            self.original = source.read()
        with open(self.journal, "w", encoding="utf-8") as journal:
            journal.write(self.path + "\n" + self.original)
        lines = self.original.split("\n")
        line = lines[number - 1]
        assert line[column:column + len(original)] == original, describe(site)
        lines[number - 1] = line[:column] + replacement + line[column + len(original):]
        self._write(self.path, "\n".join(lines))

    def restore(self):
        if self.path is None:
            return
        self._write(self.path, self.original)
        os.remove(self.journal)
        self.path = None

    @staticmethod
    def _write(path, text):
        # A fresh modification time, so that the next build compiles the file again.
        with open(path, "w", encoding="utf-8") as source:
            source.write(text)


def run(command, log, limit):
    """Exit status of command (its output appended to log), or None when it ran past limit seconds."""
    with open(log, "a", encoding="utf-8") as out:
        out.write("$ " + " ".join(command) + "\n")
        out.flush()
        process = subprocess.Popen(command, cwd=ROOT, stdout=out, stderr=subprocess.STDOUT,
                                   start_new_session=True)
        try:
            return process.wait(timeout=limit)
        except subprocess.TimeoutExpired:
            return None
        finally:
            if process.poll() is None:
                os.killpg(process.pid, signal.SIGKILL)
                process.wait()


def first_failure(log):
    with open(log, encoding="utf-8", errors="replace") as out:
        for line in out:
            match = re.search(r"Test\s+#\d+: (\S+) \.+\**(Failed|Timeout|Exception|Subprocess|Not Run)", line)
            if match:
                return match.group(1)
    return "?"


def main():
    if len(sys.argv) < 3:
        sys.exit("usage: scripts/mutants.sh SEED N [build dir, default build-mutants]")
    seed, count = sys.argv[1], int(sys.argv[2])
    build = os.path.abspath(sys.argv[3] if len(sys.argv) > 3 else os.path.join(ROOT, "build-mutants"))
    jobs = os.environ.get("JOBS", "2")
    logs = os.path.join(build, "mutant-logs")
    os.makedirs(logs, exist_ok=True)
    source = Source(os.path.join(build, "mutant-journal"))
    source.recover()

    def stop(signum, _frame):
        raise KeyboardInterrupt(f"signal {signum}")

    signal.signal(signal.SIGTERM, stop)
    signal.signal(signal.SIGHUP, stop)

    build_command = ["cmake", "--build", build, f"-j{jobs}"]
    # The installed-package test rebuilds and installs everything; the unit tests see the same mutant.
    test_command = ["ctest", "--test-dir", build, "--stop-on-failure", f"-j{jobs}", "-E", r"^install\."]
    baseline_log = os.path.join(logs, "baseline.log")
    if os.path.exists(baseline_log):
        os.remove(baseline_log)
    if run(build_command, baseline_log, 7200) != 0:
        sys.exit(f"mutants: the unchanged sources do not build (see {baseline_log})")
    started = time.monotonic()
    if run(test_command, baseline_log, 7200) != 0:
        sys.exit(f"mutants: the suite fails without a mutant (see {baseline_log})")
    baseline = time.monotonic() - started
    limit = max(3 * baseline, baseline + 60)
    print(f"mutants: seed {seed}, {count} mutants; the suite takes {baseline:.0f} s, limit {limit:.0f} s",
          flush=True)

    killed, survived, unbuilt = [], [], []
    try:
        for site in sites(seed):
            if len(killed) + len(survived) == count:
                break
            log = os.path.join(logs, f"mutant-{len(killed) + len(survived) + len(unbuilt) + 1:03d}.log")
            if os.path.exists(log):
                os.remove(log)
            with open(log, "w", encoding="utf-8") as out:
                out.write(describe(site) + "\n")
            source.mutate(site)
            try:
                built = run(build_command, log, 1800) == 0
                status = run(test_command, log, limit) if built else None
            finally:
                source.restore()
            number = len(killed) + len(survived) + 1
            if not built:
                unbuilt.append(site)
                print(f"  did not build:  {describe(site)}", flush=True)
            elif status == 0:
                survived.append(site)
                print(f"  {number:3d} survived: {describe(site)}", flush=True)
            else:
                reason = "time limit" if status is None else first_failure(log)
                killed.append(site)
                print(f"  {number:3d} caught:   {describe(site)}  [{reason}]", flush=True)
    except KeyboardInterrupt:
        print("mutants: interrupted; the source is restored", file=sys.stderr)
        sys.exit(130)
    finally:
        source.restore()

    ran = len(killed) + len(survived)
    print(f"mutants: seed {seed}: {len(killed)} of {ran} caught, {len(survived)} survived, "
          f"{len(unbuilt)} did not build (replaced by the next in rank order)")
    for site in survived:
        print(f"  survived: {describe(site)}")


if __name__ == "__main__":
    main()
