# Entry points for building, testing, benchmarking and fuzzing Beamweaver.
# Every build directory is configured once; later runs only rebuild what changed.
# `make clean` forgets the configurations (needed after changing the options below).

BUILD_DIR := build
NPROC := $(shell nproc 2>/dev/null || echo 2)
FUZZ_SECONDS ?= 60
FORMAT_DIRS := src include tools tests bench fuzz examples

RELEASE_ARGS := -DCMAKE_BUILD_TYPE=Release "-DCMAKE_CXX_FLAGS_RELEASE=-O2 -DNDEBUG" -DBW_WERROR=ON
SANITIZED_ARGS := -DCMAKE_BUILD_TYPE=Debug "-DCMAKE_CXX_FLAGS_DEBUG=-O1 -g" -DBW_WERROR=ON -DBW_BUILD_TESTS=ON

# Steps must run in the order given even under `make -j`; each step builds in parallel itself.
.NOTPARALLEL:
.PHONY: all deps build run test test-asan test-tsan build-bench bench fuzz format clean

all: build

deps:
	scripts/install-deps.sh

# $(1): build directory, $(2): CMake arguments.
define configure_and_build
	scripts/configure.sh $(1) $(2)
	cmake --build $(1) -j$(NPROC)
endef

build: deps
	$(call configure_and_build,$(BUILD_DIR),$(RELEASE_ARGS) -DBW_BUILD_TESTS=OFF -DBW_BUILD_BENCH=OFF)

run: build
	@if [ -x $(BUILD_DIR)/bin/beamweaver ]; then \
		echo "$(BUILD_DIR)/bin/beamweaver render --preview $(BUILD_DIR)/preview.png"; \
		$(BUILD_DIR)/bin/beamweaver render --preview $(BUILD_DIR)/preview.png; \
	elif [ -x $(BUILD_DIR)/bin/beamweaver-example ]; then \
		echo "$(BUILD_DIR)/bin/beamweaver-example"; \
		$(BUILD_DIR)/bin/beamweaver-example; \
	else \
		echo "run: neither $(BUILD_DIR)/bin/beamweaver nor $(BUILD_DIR)/bin/beamweaver-example was built" >&2; \
		exit 1; \
	fi

# The release build with benchmarks proves that programs and benchmarks compile warning-free at -O2.
test: test-asan test-tsan build-bench

test-asan: deps
	$(call configure_and_build,$(BUILD_DIR)/asan,$(SANITIZED_ARGS) -DBW_SANITIZE=address)
	ctest --test-dir $(BUILD_DIR)/asan --output-on-failure --no-tests=ignore -j2

test-tsan: deps
	$(call configure_and_build,$(BUILD_DIR)/tsan,$(SANITIZED_ARGS) -DBW_SANITIZE=thread)
	ctest --test-dir $(BUILD_DIR)/tsan -L threads --output-on-failure --no-tests=ignore -j2

build-bench: deps
	$(call configure_and_build,$(BUILD_DIR)/bench,$(RELEASE_ARGS) -DBW_BUILD_TESTS=OFF -DBW_BUILD_BENCH=ON)

bench: build-bench
	scripts/run-benchmarks.sh $(BUILD_DIR)/bench/bin

fuzz: deps
	CC=clang CXX=clang++ scripts/configure.sh $(BUILD_DIR)/fuzz -DCMAKE_BUILD_TYPE=Debug \
		"-DCMAKE_CXX_FLAGS_DEBUG=-O1 -g" -DBW_FUZZ=ON -DBW_BUILD_TESTS=OFF
	cmake --build $(BUILD_DIR)/fuzz -j$(NPROC)
	scripts/run-fuzzers.sh $(BUILD_DIR)/fuzz $(FUZZ_SECONDS)

format:
	$(if $(wildcard $(FORMAT_DIRS)),find $(wildcard $(FORMAT_DIRS)) -path fuzz/corpus -prune -o \
		-type f \( -name '*.h' -o -name '*.cpp' \) -print0 | xargs -0 -r clang-format -i)

clean:
	rm -rf $(BUILD_DIR)
