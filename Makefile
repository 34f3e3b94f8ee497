# The two commands of the README: `make demo` and `make test`. Each installs
# what is missing (Debian packages), configures, builds and runs.
PYTHON   := /usr/bin/python3
BUILD    ?= build
PACKAGES := cmake ninja-build g++ python3-dev python3-pytest python3-clang-14
BENCH_PACKAGES := pybind11-dev

.PHONY: all deps build test demo bench clean

all: build

deps:
	@./.ci/apt-install $(PACKAGES)

$(BUILD)/build.ninja:
	cmake -S . -B $(BUILD) -G Ninja

build: deps $(BUILD)/build.ninja
	cmake --build $(BUILD)

test: build
	cmake --build $(BUILD) --target test-support
	$(BUILD)/bin/host_selftest
	OPENVORLA_BUILD=$(BUILD) $(PYTHON) -m pytest -q tests

EXAMPLES := sine_node offset_command vector_data text_translator

demo: build
	$(BUILD)/bin/vorla $(foreach p,$(EXAMPLES),--plugin examples/plugins/$(p).py) \
	  examples/scenes/demo.py

# Configured again after the install: the bench modules need pybind11 found.
bench: build
	@./.ci/apt-install $(BENCH_PACKAGES)
	cmake -S . -B $(BUILD)
	cmake --build $(BUILD) --target bench-modules
	$(PYTHON) bench/bench_calls.py --build $(BUILD)

clean:
	rm -rf $(BUILD)
