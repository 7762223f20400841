#!/bin/sh
# Measures what compositions cost and writes the figures and plots of docs/performance.md. With --strict it fails when a
# target is missed.
# usage: scripts/bench.sh [--no-install] [--strict]
# Needs a Debian 12 machine, and root or sudo if one of the packages below is missing.
set -eu
cd "$(dirname "$0")/.."
. scripts/install_packages.sh

echo 'Building and measuring. Figures are steadier on a machine that does nothing else.'
install_packages build-essential cmake ninja-build libbenchmark-dev libgtest-dev libgmock-dev libtomlplusplus-dev \
  libcli11-dev nlohmann-json3-dev libutfcpp-dev python3 valgrind

build=build/bench
cmake --preset release -B "$build" -DEDID_COMPOSER_BENCH=ON
cmake --build "$build" --target edid_composer edid_composer_bench edid_composer_cli cost_workloads
"$build"/bin/edid_composer_bench --benchmark_min_time=0.01 --benchmark_repetitions=9 \
  --benchmark_enable_random_interleaving=true \
  --benchmark_out="$build"/results.json --benchmark_out_format=json >"$build"/results.txt
strip -o "$build"/stripped.so "$build"/lib/libedid_composer.so
python3 -B bench/write_page.py --results "$build"/results.json --library "$build"/stripped.so --build "$build" \
  --page docs/performance.md "$@"
