# One-word entry points: `make test` installs what is missing, then builds and runs every
# test, native and sanitized, then as Windows code under Wine; `make windows` builds the
# shipping DLL; `make run` plays the guided tour.
JOBS ?= $(shell nproc)

.PHONY: deps fuzz bench run test native sanitize windows windows-test screenshots clean

test: deps
	$(MAKE) native sanitize windows-test

# The Debian packages the builds and the tests need (nothing to do when they are there).
deps:
	bash .ci/install

native:
	cmake --preset native
	cmake --build --preset native -j $(JOBS)
	ctest --preset native -j $(JOBS)

sanitize:
	cmake --preset sanitize
	cmake --build --preset sanitize -j $(JOBS)
	ctest --preset sanitize -j $(JOBS)

# The shipping 32-bit DLL: build/win32/host/morvex.dll.
windows:
	cmake --preset win32
	cmake --build --preset win32 -j $(JOBS)

# Everything built for 64-bit Windows and run under Wine, and the checks of the shipping DLL.
windows-test: windows
	cmake --preset win64
	cmake --build --preset win64 -j $(JOBS)
	ctest --preset win64 -j $(JOBS); status=$$?; cmake/wine-run --stop; exit $$status

# The pictures of the setup and name dialogs in docs/, rendered by Wine on a virtual display.
screenshots:
	cmake --preset win64
	cmake --build --preset win64 -j $(JOBS) --target morvex_ext dialog_pictures
	tests/windows/take_screenshots build/win64 docs

# Benchmarks of the runtime's hot paths (native build).
bench: native
	build/native/bench/morvex_bench

# The main job: build everything (native) and play the guided tour with the host emulator.
run:
	cmake --preset native
	cmake --build --preset native -j $(JOBS)
	build/native/emulator/morvex play examples/tour.events

# libFuzzer targets, built with clang and the sanitizers, each run for FUZZ_SECONDS.
FUZZ_SECONDS ?= 60
fuzz:
	CXX=clang++ CC=clang cmake -S . -B build/fuzz -DCMAKE_BUILD_TYPE=Debug -DMORVEX_SANITIZE=ON \
	  -DMORVEX_FUZZ=ON -DMORVEX_BUILD_TESTS=OFF -DCMAKE_CXX_FLAGS=-fsanitize=fuzzer-no-link
	cmake --build build/fuzz -j $(JOBS) --target parameter_list_fuzz edit_structure_fuzz
	for f in parameter_list_fuzz edit_structure_fuzz; do \
	  mkdir -p build/fuzz/corpus/$$f && build/fuzz/fuzz/$$f -max_total_time=$(FUZZ_SECONDS) build/fuzz/corpus/$$f || exit 1; \
	done

clean:
	rm -rf build
