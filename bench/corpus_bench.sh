#!/usr/bin/env bash
# Times `robotcfg format --check` and `robotcfg check` over 10,000 programs
# against `grep -c 'pragma config'` on the same files, in the same run, and
# prints the ratios and the tool's peak memory.
# Usage: bench/corpus_bench.sh ROBOTCFG [FILES] [ROUNDS]
set -euo pipefail
robotcfg=$(realpath "${1:?usage: corpus_bench.sh ROBOTCFG [FILES] [ROUNDS]}")
files=${2:-10000}
rounds=${3:-5}
here=$(cd "$(dirname "$0")" && pwd)
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

# Each program is the brick program with a line of its own, so no two files are alike.
for ((i = 0; i < files; ++i)); do
  { cat "$here/brick_program.c"; echo "// program $i"; } > "$work/p$i.c"
done
cd "$work"
opts=(--platform nxt --external-controllers)

# Best of `rounds` runs: "wall-seconds cpu-seconds peak-KiB" of one command.
best() {
  local best_wall="" best_cpu="" peak=0 wall user sys rss
  for ((r = 0; r < rounds; ++r)); do
    /usr/bin/time -o "$work/.time" -f '%e %U %S %M' "$@" >/dev/null 2>&1 || true
    read -r wall user sys rss < "$work/.time"
    local cpu; cpu=$(echo "$user + $sys" | bc)
    if [ -z "$best_wall" ] || (( $(echo "$wall < $best_wall" | bc) )); then best_wall=$wall; fi
    if [ -z "$best_cpu" ] || (( $(echo "$cpu < $best_cpu" | bc) )); then best_cpu=$cpu; fi
    if (( rss > peak )); then peak=$rss; fi
  done
  echo "$best_wall $best_cpu $peak"
}

# The tool must agree that every file is in generated form, or the timing means nothing.
"$robotcfg" format --check "${opts[@]}" p*.c || { echo "corpus_bench: format --check failed" >&2; exit 1; }

read -r grep_wall grep_cpu _ < <(best grep -c 'pragma config' p*.c)
read -r fmt_wall fmt_cpu fmt_peak < <(best "$robotcfg" format --check "${opts[@]}" p*.c)
read -r chk_wall chk_cpu chk_peak < <(best "$robotcfg" check "${opts[@]}" p*.c)
ratio() { echo "scale=1; $1 / ($2 + 0.001)" | bc; }
printf '%-32s %8s %8s %10s %10s %9s\n' "over $files programs (best of $rounds)" wall-s cpu-s "wall/grep" "cpu/grep" peak-KiB
printf '%-32s %8s %8s %10s %10s %9s\n' "grep -c 'pragma config'" "$grep_wall" "$grep_cpu" 1 1 -
printf '%-32s %8s %8s %10s %10s %9s\n' "robotcfg format --check" "$fmt_wall" "$fmt_cpu" "$(ratio "$fmt_wall" "$grep_wall")" \
  "$(ratio "$fmt_cpu" "$grep_cpu")" "$fmt_peak"
printf '%-32s %8s %8s %10s %10s %9s\n' "robotcfg check" "$chk_wall" "$chk_cpu" "$(ratio "$chk_wall" "$grep_wall")" \
  "$(ratio "$chk_cpu" "$grep_cpu")" "$chk_peak"
