# One-command entry points. `make test` does everything on a fresh Debian 12 machine.
BUILD ?= build
JOBS ?= $(shell nproc)
CMAKE_FLAGS ?=

.PHONY: all deps configure build test bench fuzz run clean

all: build

deps:
	scripts/install-deps

configure: deps
	cmake -S . -B $(BUILD) -DCMAKE_BUILD_TYPE=Release $(CMAKE_FLAGS)

build: configure
	cmake --build $(BUILD) -j$(JOBS)

test: build
	cd $(BUILD) && ctest --output-on-failure -j$(JOBS)

bench: deps
	cmake -S . -B $(BUILD)-bench -DCMAKE_BUILD_TYPE=Release -DTOURLET_BUILD_BENCH=ON -DTOURLET_BUILD_TESTS=OFF
	cmake --build $(BUILD)-bench -j$(JOBS)
	bench/run-all $(BUILD)-bench

fuzz: deps
	CC=clang CXX=clang++ cmake -S . -B fuzz-build -DCMAKE_BUILD_TYPE=RelWithDebInfo -DTOURLET_BUILD_FUZZ=ON -DTOURLET_BUILD_TESTS=OFF
	cmake --build fuzz-build -j$(JOBS)
	fuzz/run-all fuzz-build $(FUZZ_SECONDS)

run: build
	$(BUILD)/bin/tourlet $(ARGS)

clean:
	rm -rf $(BUILD) $(BUILD)-bench fuzz-build
