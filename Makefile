# make run   installs what is missing, builds, and starts the host application
# make test  builds and runs every test, in the normal and the sanitizer build
MAKEFLAGS += --no-print-directory
BUILD      ?= build
ASAN_BUILD ?= build-asan
JOBS       ?= $(shell nproc)
CMAKE_FLAGS ?=

.PHONY: all run test deps build build-asan test-normal test-asan test-long bench clean

all: build

deps:
	@scripts/install-deps

$(BUILD)/CMakeCache.txt:
	@cmake -S . -B $(BUILD) -DCMAKE_BUILD_TYPE=RelWithDebInfo $(CMAKE_FLAGS) >/dev/null

$(ASAN_BUILD)/CMakeCache.txt:
	@cmake -S . -B $(ASAN_BUILD) -DCMAKE_BUILD_TYPE=Debug -DCT_SANITIZE=ON -DCT_BUILD_BENCH=OFF \
		-DCMAKE_CXX_FLAGS_DEBUG="-O1 -g" -DCMAKE_C_FLAGS_DEBUG="-O1 -g" $(CMAKE_FLAGS) >/dev/null

build: $(BUILD)/CMakeCache.txt
	@cmake --build $(BUILD) -j$(JOBS)

build-asan: $(ASAN_BUILD)/CMakeCache.txt
	@cmake --build $(ASAN_BUILD) -j$(JOBS)

test-normal: build
	@cd $(BUILD) && ctest --output-on-failure -j$(JOBS)

test-asan: build-asan
	@cd $(ASAN_BUILD) && ctest --output-on-failure -j$(JOBS)

test: test-normal test-asan

# The long versions of the reliability tests (kills, soak, writers, factory fuzz).
test-long: build
	@cd $(BUILD) && CONTACTS_TEST_LONG=1 CONTACTS_FUZZ_RUNS=20000 ctest -L long --output-on-failure -j$(JOBS)

run: deps build
	@scripts/run-demo $(BUILD)

bench: build
	@scripts/run-benchmarks $(BUILD)

clean:
	rm -rf $(BUILD) $(ASAN_BUILD)
