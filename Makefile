# Thin wrapper over CMake. The README's quick start is `make demo` and `make test`.
BUILD_DIR    ?= build
SANITIZE_DIR ?= build-sanitize
TSAN_DIR     ?= build-tsan
FUZZ_DIR     ?= build-fuzz
COVERAGE_DIR ?= build-coverage
MUTANTS_DIR  ?= build-mutants
PREFIX       ?= /usr/local
JOBS         ?= 2
FUZZ_SECONDS ?= 60
FUZZ_TARGETS ?=
CMAKE_ARGS   ?=

DEXCHANGE := $(BUILD_DIR)/tools/dexchange/dexchange

.PHONY: all deps configure build demo test sanitize tsan coverage mutants test-ratio install bench fuzz \
	locale-test format tidy clean

all: build

deps:
	@scripts/deps.sh

$(BUILD_DIR)/CMakeCache.txt: | deps
	cmake -S . -B $(BUILD_DIR) -DCMAKE_BUILD_TYPE=RelWithDebInfo $(CMAKE_ARGS)

configure: $(BUILD_DIR)/CMakeCache.txt

build: configure
	cmake --build $(BUILD_DIR) -j$(JOBS)

demo: build
	scripts/demo.sh $(DEXCHANGE)

test: build
	ctest --test-dir $(BUILD_DIR) --output-on-failure -j$(JOBS)

sanitize: deps
	cmake -S . -B $(SANITIZE_DIR) -DCMAKE_BUILD_TYPE=Debug -DDEXCHANGE_SANITIZE=ON $(CMAKE_ARGS)
	cmake --build $(SANITIZE_DIR) -j$(JOBS)
	ASAN_OPTIONS=detect_leaks=1:abort_on_error=1 UBSAN_OPTIONS=print_stacktrace=1:halt_on_error=1 \
		ctest --test-dir $(SANITIZE_DIR) --output-on-failure -j$(JOBS)

# The runs in worker threads under ThreadSanitizer: the loader's and the run functions' tests and the
# real plug-ins run through the loader.
TSAN_TESTS ?= ParsersLoader|ImporterExporter|RunProgress|MultipleFilesRoad|PointFiles\.
tsan: deps
	cmake -S . -B $(TSAN_DIR) -DCMAKE_BUILD_TYPE=Debug -DDEXCHANGE_TSAN=ON $(CMAKE_ARGS)
	cmake --build $(TSAN_DIR) -j$(JOBS) --target dexchange_ieUtils_tests dexchange_tools_tests
	TSAN_OPTIONS=halt_on_error=1:second_deadlock_stack=1 \
		ctest --test-dir $(TSAN_DIR) --output-on-failure -j$(JOBS) -R '$(TSAN_TESTS)'

# The suite built with gcc's coverage counters and run; gcovr sums up the lines and branches of the
# library, the plug-ins and the tool (branches the compiler adds for exceptions are left out). The
# report per file is in $(COVERAGE_DIR)/coverage.txt, the per-line data in coverage.json.
COVERAGE_FLAGS := --coverage
coverage: deps
	cmake -S . -B $(COVERAGE_DIR) -DCMAKE_BUILD_TYPE=Debug -DCMAKE_CXX_FLAGS=$(COVERAGE_FLAGS) \
		-DCMAKE_EXE_LINKER_FLAGS=$(COVERAGE_FLAGS) -DCMAKE_SHARED_LINKER_FLAGS=$(COVERAGE_FLAGS) \
		-DCMAKE_MODULE_LINKER_FLAGS=$(COVERAGE_FLAGS) $(CMAKE_ARGS)
	cmake --build $(COVERAGE_DIR) -j$(JOBS)
	find $(COVERAGE_DIR) -name '*.gcda' -delete
	ctest --test-dir $(COVERAGE_DIR) --output-on-failure -j$(JOBS)
	scripts/coverage-report.sh $(COVERAGE_DIR) $(JOBS)

# Sampled mutation testing (scripts/mutants.sh): make mutants SEED=1 N=40.
SEED ?= 1
N    ?= 40
mutants: deps
	scripts/mutants.sh $(SEED) $(N) $(MUTANTS_DIR)

# Lines of tests/ against those of src/, plugins/ and tools/ (at most 40%).
test-ratio:
	@scripts/test-ratio.sh 40

install: build
	cmake --install $(BUILD_DIR) --prefix $(PREFIX)

bench: deps
	cmake -S . -B $(BUILD_DIR) -DDEXCHANGE_BENCH=ON $(CMAKE_ARGS)
	cmake --build $(BUILD_DIR) -j$(JOBS)

# The libFuzzer programs (clang), each run for FUZZ_SECONDS; FUZZ_TARGETS picks some (default: all).
fuzz:
	@DEXCHANGE_FUZZ=ON scripts/deps.sh
	cmake -S . -B $(FUZZ_DIR) -DCMAKE_BUILD_TYPE=RelWithDebInfo -DCMAKE_CXX_COMPILER=clang++ \
		-DDEXCHANGE_FUZZ=ON -DDEXCHANGE_TESTS=OFF $(CMAKE_ARGS)
	cmake --build $(FUZZ_DIR) -j$(JOBS) --target dexchange_fuzzers
	scripts/fuzz.sh $(FUZZ_DIR) $(FUZZ_SECONDS) $(FUZZ_TARGETS)

# The whole suite once more under a locale whose decimal separator is a comma.
locale-test: build
	scripts/locale-test.sh $(BUILD_DIR) $(JOBS)

format:
	git ls-files '*.h' '*.cpp' | xargs clang-format -i

tidy: configure
	git ls-files 'src/*.cpp' 'tools/*.cpp' 'plugins/*.cpp' | xargs clang-tidy -p $(BUILD_DIR) --quiet

clean:
	rm -rf $(BUILD_DIR) $(SANITIZE_DIR) $(TSAN_DIR) $(FUZZ_DIR) $(COVERAGE_DIR) $(MUTANTS_DIR)
