#!/usr/bin/env bash
# Lines of the tests against lines of the code they test: tracked .cpp and .h files, counting the
# lines that are neither blank nor only a comment. Fails when the tests exceed the limit (per cent).
# Usage: scripts/test-ratio.sh [limit, default 40] [-v: the test files, largest first]
set -euo pipefail
cd "$(dirname "$0")/.."

limit=${1:-40}
verbose=${2:-}

# Reads file names on stdin; prints "<lines> <file>" per file.
count_lines() {
  xargs -r awk '
    FNR == 1 { if (NR > 1) print lines, name; name = FILENAME; lines = 0; inblock = 0 }
    {
      line = $0
      if (inblock) {
        if (index(line, "*/") == 0) next
        line = substr(line, index(line, "*/") + 2); inblock = 0
      }
      gsub(/^[ \t]+|[ \t\r]+$/, "", line)
      if (line == "" || line ~ /^\/\//) next
      if (line ~ /^\/\*/) {
        rest = substr(line, 3)
        if (index(rest, "*/") == 0) { inblock = 1; next }
        rest = substr(rest, index(rest, "*/") + 2); gsub(/^[ \t]+/, "", rest)
        if (rest == "" || rest ~ /^\/\//) next
      }
      ++lines
    }
    END { if (NR > 0) print lines, name }'
}

total() { awk '{ sum += $1 } END { print sum + 0 }'; }

# --deduplicate: a file in conflict during a merge is listed once, not once per side.
tested=$(git ls-files --deduplicate 'src/*.cpp' 'src/*.h' 'plugins/*.cpp' 'plugins/*.h' 'tools/*.cpp' 'tools/*.h' |
  count_lines | total)
tests_per_file=$(git ls-files --deduplicate 'tests/*.cpp' 'tests/*.h' | count_lines)
tests=$(total <<<"$tests_per_file")

if [[ $verbose == -v ]]; then sort -rn <<<"$tests_per_file"; fi
ratio=$(awk -v a="$tests" -v b="$tested" 'BEGIN { printf "%.1f", 100 * a / b }')
echo "test-ratio: tests/ $tests lines, src/ plugins/ tools/ $tested lines: $ratio% (limit $limit%)"
awk -v r="$ratio" -v l="$limit" 'BEGIN { exit !(r <= l) }'
