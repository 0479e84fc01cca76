# Thin wrapper over CMake. The README's quick start is `make demo` and `make test`.
BUILD_DIR    ?= build
SANITIZE_DIR ?= build-sanitize
TSAN_DIR     ?= build-tsan
FUZZ_DIR     ?= build-fuzz
PREFIX       ?= /usr/local
JOBS         ?= 2
FUZZ_SECONDS ?= 60
FUZZ_TARGETS ?=
CMAKE_ARGS   ?=

DEXCHANGE := $(BUILD_DIR)/tools/dexchange/dexchange

.PHONY: all deps configure build demo test sanitize tsan install bench fuzz locale-test format tidy clean

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
	rm -rf $(BUILD_DIR) $(SANITIZE_DIR) $(TSAN_DIR) $(FUZZ_DIR)
