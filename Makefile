# The two entry points of the README, and the hardened run CI adds. Everything else is
# plain CMake.
BUILD ?= build
SANITIZE_BUILD ?= build-sanitize
FUZZ_SECONDS ?= 20
JOBS ?= $(shell nproc)
# The compiler cache (where installed) finds a file compiled in another checkout of the tree.
export CCACHE_BASEDIR ?= $(CURDIR)
export CCACHE_NOHASHDIR ?= 1

.PHONY: demo check check-deps check-sanitized deb deps build

demo: build
	scripts/run-demo $(BUILD)

# Every package declared first (a missing one is named before the build trips over it),
# then every test, then the packages: built, installed and used by the application
# template here, and installed alone into an empty Debian system.
check: check-deps build
	scripts/run-tests $(BUILD)
	scripts/check-package build-package
	scripts/check-clean-system build-package

check-deps: deps
	scripts/check-deps

# Every test again under AddressSanitizer and UndefinedBehaviorSanitizer, then each fuzz
# target for FUZZ_SECONDS; built with clang so that the fuzz targets use libFuzzer.
check-sanitized: deps
	CC=clang CXX=clang++ cmake -S . -B $(SANITIZE_BUILD) -DCMAKE_BUILD_TYPE=RelWithDebInfo \
		-DCMAKE_CXX_FLAGS_RELWITHDEBINFO="-O1 -gline-tables-only -DNDEBUG" -DPELKAN_SANITIZE=address,undefined -DPELKAN_BUILD_FUZZ=ON -DPELKAN_BUILD_DEMO=OFF
	cmake --build $(SANITIZE_BUILD) -j $(JOBS)
	scripts/run-tests $(SANITIZE_BUILD)
	scripts/run-fuzz $(SANITIZE_BUILD) $(FUZZ_SECONDS)

# The Debian packages (runtime modules, development files, gallery and tools) in build-deb/.
deb: deps
	scripts/build-deb build-deb

build: deps
	cmake -S . -B $(BUILD) -DCMAKE_BUILD_TYPE=RelWithDebInfo
	cmake --build $(BUILD) -j $(JOBS)

deps:
	scripts/install-deps
