# The two commands of the README: `make demo` and `make test`. Each installs
# what is missing (Debian packages), configures, builds and runs.
PYTHON   := /usr/bin/python3
BUILD    ?= build
# The same tree built with AddressSanitizer and UndefinedBehaviorSanitizer.
ASAN_BUILD ?= $(BUILD)-asan
PACKAGES := cmake ninja-build g++ python3-dev python3-pytest python3-clang-14 python3-numpy \
            python3-mypy
BENCH_PACKAGES := pybind11-dev

.PHONY: all deps build build-asan test test-plain test-asan demo bench clean

all: build

deps:
	@./.ci/apt-install $(PACKAGES)

$(BUILD)/build.ninja:
	cmake -S . -B $(BUILD) -G Ninja

build: deps $(BUILD)/build.ninja
	cmake --build $(BUILD)

$(ASAN_BUILD)/build.ninja:
	cmake -S . -B $(ASAN_BUILD) -G Ninja -DOPENVORLA_SANITIZE=ON

build-asan: deps $(ASAN_BUILD)/build.ninja
	cmake --build $(ASAN_BUILD)

# Python itself is not instrumented: the sanitizer runtimes are preloaded, the
# interpreter allocates through malloc so that its objects are checked too,
# and leaks are not reported (the interpreter keeps much until exit).
SANITIZED := LD_PRELOAD=$$(gcc -print-file-name=libasan.so):$$(gcc -print-file-name=libubsan.so) \
	ASAN_OPTIONS=detect_leaks=0:abort_on_error=1:allocator_may_return_null=1 UBSAN_OPTIONS=print_stacktrace=1 \
	PYTHONMALLOC=malloc

# Every test on the plain build, then on the sanitizer build with the demo.
test: test-plain test-asan

test-plain: build
	cmake --build $(BUILD) --target test-support
	$(BUILD)/bin/host_selftest
	OPENVORLA_BUILD=$(BUILD) $(PYTHON) -m pytest -q tests
	PYTHONPATH=$(BUILD)/python $(PYTHON) -m pytest -q examples/tests

test-asan: build-asan
	cmake --build $(ASAN_BUILD) --target test-support
	ASAN_OPTIONS=detect_leaks=0:abort_on_error=1 $(ASAN_BUILD)/bin/host_selftest
	$(SANITIZED) OPENVORLA_BUILD=$(ASAN_BUILD) $(PYTHON) -m pytest -q tests
	$(SANITIZED) PYTHONPATH=$(ASAN_BUILD)/python $(PYTHON) -m pytest -q examples/tests
	ASAN_OPTIONS=detect_leaks=0:abort_on_error=1 $(ASAN_BUILD)/bin/vorla \
	  $(foreach p,$(EXAMPLES),--plugin examples/plugins/$(p).py) examples/scenes/demo.py >/dev/null

EXAMPLES := sine_node offset_command vector_data text_translator wave_deformer \
            marker_locator snap_transform scatter_command point_cloud

demo: build
	$(BUILD)/bin/vorla $(foreach p,$(EXAMPLES),--plugin examples/plugins/$(p).py) \
	  examples/scenes/demo.py

# Configured again after the install: the bench modules need pybind11 found.
bench: build
	@./.ci/apt-install $(BENCH_PACKAGES)
	cmake -S . -B $(BUILD)
	cmake --build $(BUILD) --target bench-modules
	$(PYTHON) bench/bench_calls.py --build $(BUILD)
	$(PYTHON) bench/bench_app.py --build $(BUILD)
	$(PYTHON) bench/bench_values.py --build $(BUILD)

clean:
	rm -rf $(BUILD) $(ASAN_BUILD)
