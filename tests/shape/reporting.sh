# For the scripts beside it: they test one property of the library file each and are run by CTest with the properties of
# the build in the environment.
set -u
export LC_ALL=C

# Ends the test as skipped: SANITIZE says whether the library is built with the sanitizers' run-time library.
skip_with_sanitizers() {
  if [ "${SANITIZE:-0}" = 1 ]; then
    echo "Skipped: $1"
    exit 77
  fi
}

fail() {
  echo "FAILED: $1" >&2
  exit 1
}
