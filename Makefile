# Entry points: `make demo`, `make test`, `make bench`; `make dev` is the fast incremental loop.
JOBS ?= $(shell nproc)
BUILD ?= build
ASAN_BUILD ?= build-asan
BENCH_BUILD ?= build-bench
CMAKE_FLAGS = -G Ninja -Wno-dev
# Let ccache share results between clones of the repository in other directories.
export CCACHE_BASEDIR := $(CURDIR)
export CCACHE_NOHASHDIR := 1

.PHONY: all bootstrap dev test test-plain test-asan bench demo format clean

all: dev

bootstrap:
	@tools/bootstrap

$(BUILD)/build.ninja:
	cmake -S . -B $(BUILD) $(CMAKE_FLAGS) -DCMAKE_BUILD_TYPE=RelWithDebInfo

$(ASAN_BUILD)/build.ninja:
	cmake -S . -B $(ASAN_BUILD) $(CMAKE_FLAGS) -DCMAKE_BUILD_TYPE=Debug -DGLOBKIT_SANITIZE=ON

$(BENCH_BUILD)/build.ninja:
	cmake -S . -B $(BENCH_BUILD) $(CMAKE_FLAGS) -DCMAKE_BUILD_TYPE=Release -DGLOBKIT_BENCH=ON

dev: $(BUILD)/build.ninja
	cmake --build $(BUILD) -j $(JOBS)

test: bootstrap
	$(MAKE) test-plain
	$(MAKE) test-asan

test-plain: $(BUILD)/build.ninja
	cmake --build $(BUILD) -j $(JOBS)
	cd $(BUILD) && ctest --output-on-failure -j $(JOBS)

test-asan: $(ASAN_BUILD)/build.ninja
	cmake --build $(ASAN_BUILD) -j $(JOBS)
	cd $(ASAN_BUILD) && ASAN_OPTIONS=detect_leaks=1 UBSAN_OPTIONS=print_stacktrace=1:halt_on_error=1 \
	  LSAN_OPTIONS=suppressions=$(CURDIR)/tools/lsan-suppressions.txt:print_suppressions=0 \
	  ctest --output-on-failure -j $(JOBS)

bench: bootstrap $(BENCH_BUILD)/build.ninja
	cmake --build $(BENCH_BUILD) -j $(JOBS)
	@for b in $(BENCH_BUILD)/bench_*; do [ -x "$$b" ] && "$$b" --benchmark_repetitions=5 --benchmark_report_aggregates_only=true || exit 1; done
	$(BENCH_BUILD)/scene sizes
	$(BENCH_BUILD)/scene main
	$(BENCH_BUILD)/scene w5
	$(BENCH_BUILD)/scene w6

demo: bootstrap $(BUILD)/build.ninja
	cmake --build $(BUILD) -j $(JOBS) --target globkit-gallery
	@tools/run-gallery $(BUILD)/globkit-gallery

format:
	find platform foundation buttons menus panels text values lists tests bench gallery -name '*.h' -o -name '*.cpp' | xargs clang-format -i

clean:
	rm -rf $(BUILD) $(ASAN_BUILD) $(BENCH_BUILD)
