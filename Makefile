# make run   installs what is missing, builds, and starts the host application
# make test  installs what is missing, builds and runs every test, in the
#            normal and the sanitizer build
MAKEFLAGS += --no-print-directory
BUILD      ?= build
ASAN_BUILD ?= build-asan
JOBS       ?= $(shell nproc)
CMAKE_FLAGS ?=

.PHONY: all run test test-long deps configure configure-asan build build-asan \
	test-normal test-asan bench clean

all: build

deps:
	@scripts/install-deps

# A build folder counts as configured only once CMake has written its
# Makefile; a failed configure removes its cache so the next run starts over.
configure: deps
	@scripts/configure $(BUILD) -DCMAKE_BUILD_TYPE=RelWithDebInfo $(CMAKE_FLAGS)

configure-asan: deps
	@scripts/configure $(ASAN_BUILD) -DCMAKE_BUILD_TYPE=Debug -DCT_SANITIZE=ON -DCT_BUILD_BENCH=OFF \
		-DCMAKE_CXX_FLAGS_DEBUG="-O1 -g" -DCMAKE_C_FLAGS_DEBUG="-O1 -g" $(CMAKE_FLAGS)

build: configure
	@cmake --build $(BUILD) -j$(JOBS)

build-asan: configure-asan
	@cmake --build $(ASAN_BUILD) -j$(JOBS)

test-normal: build
	@cd $(BUILD) && ctest --output-on-failure -j$(JOBS)

test-asan: build-asan
	@cd $(ASAN_BUILD) && ctest --output-on-failure -j$(JOBS)

test: test-normal test-asan

# The long versions of the reliability tests (kills, soak, writers, factory fuzz).
test-long: build
	@cd $(BUILD) && CONTACTS_TEST_LONG=1 CONTACTS_FUZZ_RUNS=20000 ctest -L long --output-on-failure -j$(JOBS)

run: build
	@scripts/run-demo $(BUILD)

bench: build
	@scripts/run-benchmarks $(BUILD)

clean:
	rm -rf $(BUILD) $(ASAN_BUILD)
