#!/bin/sh
# A C++ compiler for musl as far as Debian has the parts. Files of the library, which are told by their module's name,
# see musl's headers only; everything else sees glibc's, which Debian's C++ run-time library is made for. All of it is
# linked with musl, statically.
set -eu
here=$(cd "$(dirname "$0")" && pwd)
musl=/usr/lib/x86_64-linux-musl
gcc=$(dirname "$(gcc -print-libgcc-file-name)")

case " $* " in
  *' -DEDID_COMPOSER_MODULE='*)
    version=$(basename "$gcc")
    exec g++ -specs "$musl/musl-gcc.specs" -isystem "/usr/include/c++/$version" \
      -isystem "/usr/include/x86_64-linux-gnu/c++/$version" -include "$here/musl_headers.h" "$@"
    ;;
  *' -c '* | *' -E '* | *' -v '* | *' --version '* | *' -x '*)
    exec g++ "$@"
    ;;
esac
runtime=$(mktemp --suffix=.o)
trap 'rm -f "$runtime"' EXIT
musl-gcc -O1 -c "$here/musl_runtime.c" -o "$runtime"
g++ -static -no-pie -nostdlib "$musl/crt1.o" "$musl/crti.o" "$gcc/crtbeginT.o" "$@" "$runtime" \
  -Wl,--start-group -lstdc++ -lgcc -lgcc_eh "$musl/libc.a" -Wl,--end-group "$gcc/crtend.o" "$musl/crtn.o"
