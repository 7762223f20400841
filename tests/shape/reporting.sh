# For the scripts beside it: they test one property of the library file each and are run by CTest.
set -u
export LC_ALL=C

fail() {
  echo "FAILED: $1" >&2
  exit 1
}
