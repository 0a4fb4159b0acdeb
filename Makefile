# The two everyday commands: `make demo` and `make test`.
BUILD_DIR ?= build
ASAN_BUILD_DIR ?= build-asan
CMAKE ?= cmake
GENERATOR := $(shell command -v ninja >/dev/null 2>&1 && echo "-G Ninja")
JOBS ?= $(shell nproc 2>/dev/null || echo 2)
ROBOTCFG = ./$(BUILD_DIR)/robotcfg

.PHONY: all build demo test asan-test ci clean deps goldens

all: build

deps:
	@./.ci/install-deps

build:
	@$(CMAKE) -S . -B $(BUILD_DIR) $(GENERATOR) -DCMAKE_BUILD_TYPE=RelWithDebInfo $(CMAKE_ARGS) >/dev/null
	$(CMAKE) --build $(BUILD_DIR) -j $(JOBS)

# Runs the tool on every bundled example program.
demo: build
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
