# shellcheck shell=sh
# Sourced by the scripts beside it: installs the Debian packages that they need.

# install_packages PACKAGE...: installs those that are missing, with apt-get, as root or through sudo.
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
    if ! command -v sudo >/dev/null; then
      echo "Missing packages:$missing. Install them as root, or install sudo." >&2
      return 1
    fi
    as_root='sudo'
  fi
  echo "Installing$missing; may take 3 minutes."
  # Word splitting is wanted: one word for each package.
  # shellcheck disable=SC2086
  $as_root apt-get update -qq &&
    $as_root env DEBIAN_FRONTEND=noninteractive apt-get install -y -qq --no-install-recommends $missing >/dev/null
}
