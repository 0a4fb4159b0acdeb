#!/bin/sh
# Runs one fuzz harness: run_harness.sh BUILD_DIR SECONDS SEED fuzz/fuzz_NAME.cpp
# Fails, with the command that repeats the run, when the harness finds an input.
build=$1 seconds=$2 seed=$3
name=$(basename "$4" .cpp)
work=$build/corpus/$name
mkdir -p "$work"
echo "== $name for $seconds s, seed $seed"
"$build/fuzz/$name" -seed="$seed" -max_total_time="$seconds" -max_len=4096 -print_final_stats=1 \
  -artifact_prefix="$build/$name-" "$work" "fuzz/corpus/$name" >"$build/$name.log" 2>&1
grep -E '^(stat::number_of_executed_units|stat::average_exec_per_sec|==[0-9]+==|SUMMARY|invariant broken)' "$build/$name.log"
if ls "$build/$name"-* >/dev/null 2>&1; then
  echo "$name found a failing input: $(ls "$build/$name"-*)"
  echo "repeat with: make fuzz FUZZ_SEED=$seed FUZZ_SECONDS=$seconds, or replay: $build/fuzz/$name $(ls "$build/$name"-* | head -1)"
  exit 1
fi
