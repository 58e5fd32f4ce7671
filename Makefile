# ARBOLEX — build, run and test. `make run` and `make test` do all the set-up
# on a fresh Debian 12 machine (missing packages are installed with apt-get).

BUILD   ?= build
JOBS    ?= $(shell nproc)
CMAKE_FLAGS ?=
GEN     := -G Ninja

.PHONY: all deps build run test bench test-asan test-noqt fuzz format format-check tidy ci clean

all: build

deps:
	@scripts/install-deps.sh

$(BUILD)/build.ninja: | deps
	@cmake -S . -B $(BUILD) $(GEN) -DCMAKE_BUILD_TYPE=Release -DARBOLEX_WERROR=ON $(CMAKE_FLAGS) >/dev/null

build: deps $(BUILD)/build.ninja
	@cmake --build $(BUILD) -j $(JOBS)

run: build
	@scripts/run.sh $(BUILD)/bin

test: build
	@cd $(BUILD) && ctest --output-on-failure -j $(JOBS)

bench: build
	@scripts/bench.sh $(BUILD)/bin

# Engine, application and command-line tests under AddressSanitizer and
# UndefinedBehaviorSanitizer (the windows are left out of this build).
test-asan: deps
	@cmake -S . -B build-asan $(GEN) -DCMAKE_BUILD_TYPE=RelWithDebInfo -DARBOLEX_WERROR=ON \
	    -DARBOLEX_SANITIZE=ON -DARBOLEX_WITH_GUI=OFF -DARBOLEX_BENCH=OFF >/dev/null
	@cmake --build build-asan -j $(JOBS)
	@cd build-asan && ctest --output-on-failure -j $(JOBS)

# The engine alone, without Qt: proves it depends on the standard library only.
test-noqt:
	@scripts/install-deps.sh --no-gui
	@cmake -S . -B build-noqt $(GEN) -DCMAKE_BUILD_TYPE=Debug -DARBOLEX_WERROR=ON \
	    -DARBOLEX_WITH_QT=OFF -DARBOLEX_BENCH=OFF >/dev/null
	@cmake --build build-noqt -j $(JOBS)
	@cd build-noqt && ctest --output-on-failure -j $(JOBS)

# The libFuzzer harnesses of the file readers (tests/fuzz/), built with clang,
# AddressSanitizer and UndefinedBehaviorSanitizer in build-fuzz, each run for
# FUZZ_TIME seconds, or FUZZ_RUNS executions when given
# (make fuzz FUZZ_RUNS=1000000); FUZZERS="NAME..." runs only those.
FUZZ_TIME ?= 20
FUZZ_RUNS ?=
FUZZERS ?=

fuzz:
	@scripts/install-deps.sh --fuzz
	@CC=clang CXX=clang++ cmake -S . -B build-fuzz $(GEN) -DCMAKE_BUILD_TYPE=RelWithDebInfo \
	    -DARBOLEX_WERROR=ON -DARBOLEX_FUZZ=ON -DARBOLEX_WITH_GUI=OFF -DARBOLEX_BENCH=OFF >/dev/null
	@cmake --build build-fuzz -j $(JOBS) --target arbolex_fuzzers
	@FUZZERS="$(FUZZERS)" scripts/fuzz.sh build-fuzz $(if $(FUZZ_RUNS),-runs=$(FUZZ_RUNS),-max_total_time=$(FUZZ_TIME))

format:
	@git ls-files '*.cpp' '*.hpp' | xargs clang-format -i

format-check: deps
	@git ls-files '*.cpp' '*.hpp' | xargs clang-format --dry-run --Werror

# clang-tidy over every source file, with the compile commands of the build.
tidy: build
	@git ls-files 'src/*.cpp' | xargs -n 1 -P $(JOBS) clang-tidy -p $(BUILD) --quiet 2>/dev/null

ci: format-check test test-noqt test-asan fuzz

clean:
	@rm -rf $(BUILD) build-asan build-noqt build-fuzz
