# The commands of this repository. Each works alone on a fresh Debian 12 machine that has only git and make:
# it installs the packages that it needs (with sudo when not root), configures, builds and runs.
#
#   make demo        install one customer of the example package on a bench phone and show the result
#   make test        build everything and run all tests
#   make check       formatting, lint, layers, symbols, documents, device build, C headers
#   make check-asan  all tests under AddressSanitizer and UBSan
#   make check-page  the page of zel verify, in a headless Chromium
#   make bench       the benchmarks, as a table
#   make fuzz SECONDS=60         every fuzz target for that long
#   make install PREFIX=/usr/local
#   make deps        only install the packages of a build with tests

SECONDS = 60
PREFIX = /usr/local
CHECKS = format layers tidy symbols docs device headers

.PHONY: demo test deps check check-asan check-page bench fuzz install clean $(CHECKS:%=check-%)

demo:
	@scripts/install-deps build
	@scripts/demo

test:
	@scripts/install-deps build test
	@scripts/test dev

deps:
	@scripts/install-deps build test

check: $(CHECKS:%=check-%)

check-asan:
	@scripts/install-deps build test
	@scripts/test asan

check-page:
	@scripts/install-deps build page
	@scripts/check-page

bench:
	@scripts/install-deps build bench
	@scripts/bench

fuzz:
	@scripts/install-deps build check
	@scripts/fuzz $(SECONDS)

install:
	@scripts/install-deps build
	@cmake -S . -B build/install -DCMAKE_BUILD_TYPE=Release
	@cmake --build build/install -j "$$(nproc)"
	@cmake --install build/install --prefix "$(PREFIX)"

$(CHECKS:%=check-%):
	@scripts/install-deps build test check
	@scripts/$@

clean:
	rm -rf build
