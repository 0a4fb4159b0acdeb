# The two everyday commands: `make demo` and `make test`.
BUILD_DIR ?= build
ASAN_BUILD_DIR ?= build-asan
CMAKE ?= cmake
GENERATOR := $(shell command -v ninja >/dev/null 2>&1 && echo "-G Ninja")
JOBS ?= $(shell nproc 2>/dev/null || echo 2)
ROBOTCFG = ./$(BUILD_DIR)/robotcfg

.PHONY: all configure build man demo test asan-test ci clean deps goldens coverage fuzz fuzz-build fuzz-long bench

all: build

# Installs what is missing on a Debian machine (apt-get, through sudo when not root).
deps:
	@./.ci/install-deps

configure: deps
	@$(CMAKE) -S . -B $(BUILD_DIR) $(GENERATOR) -DCMAKE_BUILD_TYPE=RelWithDebInfo $(CMAKE_ARGS) >/dev/null

build: configure
	$(CMAKE) --build $(BUILD_DIR) -j $(JOBS)

# Builds only the tool, then runs it on every bundled example program.
demo: configure
	$(CMAKE) --build $(BUILD_DIR) -j $(JOBS) --target robotcfg
	@set -e; for dir in examples/*/; do \
	  opts=$$(cat $$dir/options); \
	  echo "== robotcfg check $$opts $${dir}program.c"; \
	  $(ROBOTCFG) check $$opts $${dir}program.c || true; \
	  echo "== robotcfg generate $$opts $${dir}program.c"; \
	  $(ROBOTCFG) generate $$opts $${dir}program.c || true; \
	  echo; \
	done
	@echo "== robotcfg show --platform nxt --external-controllers"
	@$(ROBOTCFG) show --platform nxt --external-controllers

test: build
	cd $(BUILD_DIR) && ctest --output-on-failure -j $(JOBS)

# The whole suite again with the address and undefined-behaviour sanitizers.
asan-test:
	@$(CMAKE) -S . -B $(ASAN_BUILD_DIR) $(GENERATOR) -DCMAKE_BUILD_TYPE=Debug -DROBOTCONFIG_SANITIZE=ON -DROBOTCONFIG_WERROR=ON $(CMAKE_ARGS) >/dev/null
	$(CMAKE) --build $(ASAN_BUILD_DIR) -j $(JOBS)
	cd $(ASAN_BUILD_DIR) && ctest --output-on-failure -j $(JOBS)

# Line and branch coverage of the library from the test suite (gcovr).
COVERAGE_BUILD_DIR ?= build-coverage
coverage:
	@command -v gcovr >/dev/null 2>&1 || ./.ci/install-deps coverage
	@$(CMAKE) -S . -B $(COVERAGE_BUILD_DIR) $(GENERATOR) -DCMAKE_BUILD_TYPE=Debug -DROBOTCONFIG_COVERAGE=ON $(CMAKE_ARGS) >/dev/null
	$(CMAKE) --build $(COVERAGE_BUILD_DIR) -j $(JOBS)
	find $(COVERAGE_BUILD_DIR) -name '*.gcda' -delete
	cd $(COVERAGE_BUILD_DIR) && ctest >/dev/null || echo 'some tests failed; coverage is of the run as it went'
	gcovr --root . --object-directory $(COVERAGE_BUILD_DIR) --filter robotconfig/ \
	  --exclude-unreachable-branches --exclude-throw-branches --gcov-ignore-parse-errors \
	  --print-summary --txt $(COVERAGE_BUILD_DIR)/coverage.txt

# Runs every fuzz harness for FUZZ_SECONDS each (clang with libFuzzer and the sanitizers).
# Each run takes a fresh seed and prints it; `make fuzz FUZZ_SEED=N` repeats a run.
# A failing input is saved under $(FUZZ_BUILD_DIR) as HARNESS-crash-... and the
# reproducer command is printed.
FUZZ_BUILD_DIR ?= build-fuzz
FUZZ_SECONDS ?= 60
ifndef FUZZ_SEED
FUZZ_SEED := $(shell od -An -N4 -tu4 /dev/urandom | tr -d ' ')
endif
FUZZ_JOBS ?= 1
fuzz-build:
	@$(CMAKE) -S . -B $(FUZZ_BUILD_DIR) $(GENERATOR) -DCMAKE_CXX_COMPILER=clang++ -DROBOTCONFIG_SANITIZE=ON \
	  -DROBOTCONFIG_BUILD_FUZZERS=ON -DROBOTCONFIG_BUILD_TESTS=OFF >/dev/null
	$(CMAKE) --build $(FUZZ_BUILD_DIR) -j $(JOBS)

fuzz: fuzz-build
	@echo "fuzz seed $(FUZZ_SEED) (repeat with: make fuzz FUZZ_SEED=$(FUZZ_SEED))"
	@ls fuzz/fuzz_*.cpp | xargs -n 1 -P $(FUZZ_JOBS) sh fuzz/run_harness.sh $(FUZZ_BUILD_DIR) $(FUZZ_SECONDS) $(FUZZ_SEED)

# The harnesses for as long as asked (FUZZ_SECONDS each, default an hour), two at a time.
fuzz-long:
	@$(MAKE) --no-print-directory fuzz FUZZ_SECONDS=$${FUZZ_SECONDS:-3600} FUZZ_JOBS=2

# The benchmarks (Google Benchmark), then the 10,000-program corpus timed against grep.
BENCH_BUILD_DIR ?= build-bench
bench:
	@[ -e /usr/include/benchmark/benchmark.h ] || ./.ci/install-deps bench
	@$(CMAKE) -S . -B $(BENCH_BUILD_DIR) $(GENERATOR) -DCMAKE_BUILD_TYPE=RelWithDebInfo -DROBOTCONFIG_BUILD_BENCH=ON \
	  -DROBOTCONFIG_BUILD_TESTS=OFF $(CMAKE_ARGS) >/dev/null
	$(CMAKE) --build $(BENCH_BUILD_DIR) -j $(JOBS)
	$(BENCH_BUILD_DIR)/bench/robotconfig_bench $(BENCH_ARGS)
	bench/corpus_bench.sh $(BENCH_BUILD_DIR)/robotcfg

# Rewrites the manual page from the tool's help texts (a test compares them).
man: build
	$(ROBOTCFG) --man > docs/robotcfg.1

ci:
	./.ci/run

clean:
	rm -rf $(BUILD_DIR) $(ASAN_BUILD_DIR)

# Rewrites the expected outputs of the example programs from the current tool;
# review the diff before committing it.
goldens: build
	@for dir in examples/*/; do \
	  opts=$$(cat $$dir/options); \
	  $(ROBOTCFG) check $$opts $${dir}program.c 2> $${dir}expected-check.txt || true; \
	  $(ROBOTCFG) format $$opts $${dir}program.c > $${dir}expected-format.c 2>/dev/null || true; \
	done
	@for file in tests/mistakes/*.c; do \
	  opts=$$(sed -n '1s|^// options:||p' $$file); \
	  $(ROBOTCFG) check $$opts $$file 2> $${file%.c}.expected || true; \
	done
