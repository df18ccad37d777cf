# One-word entry points: `make test` builds and runs every test, native and sanitized.
JOBS ?= $(shell nproc)

.PHONY: test native sanitize clean

test: native sanitize

native:
	cmake --preset native
	cmake --build --preset native -j $(JOBS)
	ctest --preset native -j $(JOBS)

sanitize:
	cmake --preset sanitize
	cmake --build --preset sanitize -j $(JOBS)
	ctest --preset sanitize -j $(JOBS)

clean:
	rm -rf build
