# The two entry points of the README. Everything else is plain CMake.
BUILD ?= build
JOBS ?= $(shell nproc)

.PHONY: demo check deps build

demo: build
	scripts/run-demo $(BUILD)

check: build
	scripts/run-tests $(BUILD)

build: deps
	cmake -S . -B $(BUILD) -DCMAKE_BUILD_TYPE=RelWithDebInfo
	cmake --build $(BUILD) -j $(JOBS)

deps:
	scripts/install-deps
