# shellcheck shell=sh
# Sourced by the scripts beside it: installs the Debian packages that they need.
#
# With --no-install as first argument of a script, a missing package ends it.
no_install=''
if [ "${1:-}" = --no-install ]; then
  no_install=--no-install
  shift
fi

# install_packages PACKAGE...: installs those that are missing, as root or through sudo; prints which and how before.
install_packages() {
  missing=''
  for package in "$@"; do
    if ! dpkg-query -W -f '${db:Status-Status}' "$package" 2>/dev/null | grep -qx installed; then
      missing="$missing $package"
    fi
  done
  if [ -z "$missing" ]; then
    return 0
  fi

  as_root=''
  if [ "$(id -u)" -ne 0 ]; then
    as_root='sudo '
  fi
  echo "Missing packages:$missing"
  echo "To install them: ${as_root}apt-get install --no-install-recommends$missing"
  if [ -n "$no_install" ]; then
    echo 'Nothing was installed, as --no-install was given.' >&2
    return 1
  fi
  if [ -n "$as_root" ] && ! command -v sudo >/dev/null; then
    echo 'Run that as root, or install sudo.' >&2
    return 1
  fi
  echo 'Installing them now.'
  # Word splitting is wanted: one word for each package.
  # shellcheck disable=SC2086
  $as_root apt-get update -qq &&
    $as_root env DEBIAN_FRONTEND=noninteractive apt-get install -y -qq --no-install-recommends $missing >/dev/null
}
