# shellcheck shell=bash
# Sourced by the scripts at the root: makes sure that what the build needs is there.

# Whether this system is a Debian release whose packages are known to do.
is_known_debian() (
  [[ -r /etc/os-release ]] || exit 1
  # shellcheck disable=SC1091
  . /etc/os-release
  [[ "${ID:-}" == debian && ("${VERSION_ID:-}" == 12 || "${VERSION_ID:-}" == 13) ]]
)

# Whether the distribution is Debian or made from it, so that its packages have Debian's names.
has_debian_names() (
  [[ -r /etc/os-release ]] && command -v dpkg-query >/dev/null || exit 1
  # shellcheck disable=SC1091
  . /etc/os-release
  [[ " ${ID:-} ${ID_LIKE:-} " == *" debian "* ]]
)

is_installed() {
  local package=$1 program
  if has_debian_names; then
    [[ "$(dpkg-query -W -f='${db:Status-Status}' "$package" 2>/dev/null)" == installed ]]
    return
  fi
  case $package in
    ninja-build) command -v ninja >/dev/null || command -v ninja-build >/dev/null ;;
    libgtest-dev)
      pkg-config --exists gtest 2>/dev/null || [[ -e /usr/include/gtest/gtest.h ]] ||
        [[ -e /usr/local/include/gtest/gtest.h ]]
      ;;
    libncurses-dev) [[ -e /usr/include/ncurses.h || -e /usr/include/curses.h ]] ;;
    libevdev-dev) pkg-config --exists libevdev ;;
    libsystemd-dev) pkg-config --exists libsystemd ;;
    libxcb*-dev) pkg-config --exists xcb xcb-randr xcb-res ;;
    libpulse-dev) pkg-config --exists libpulse ;;
    libglib2.0-dev) pkg-config --exists gio-unix-2.0 ;;
    libwayland-dev) pkg-config --exists wayland-client ;;
    libwayland-bin) pkg-config --exists wayland-scanner ;;
    libxkbcommon-dev) pkg-config --exists xkbcommon ;;
    plasma-wayland-protocols) [[ -d /usr/share/$package || -d /usr/local/share/$package ]] ;;
    nlohmann-json3-dev) pkg-config --exists nlohmann_json ;;
    umockdev) command -v umockdev-wrapper >/dev/null ;;
    gir1.2-umockdev-1.0) /usr/bin/python3 -c 'import gi; gi.require_version("UMockdev", "1.0")' 2>/dev/null ;;
    python3-gi | python3-dbusmock) /usr/bin/python3 -c "import ${package#python3-}" 2>/dev/null ;;
    *)
      program=$(awk -v package="$package" '$1 == package { print $2 }' tests/desktop/packages)
      command -v "${program:-$package}" >/dev/null || [[ -e "${program:-$package}" ]]
      ;;
  esac
}

# require_packages PACKAGE...: installs those that are missing, by their Debian names. Ends the script with
# status 1 where that cannot be done.
require_packages() {
  local package missing=() as_root=()
  for package in "$@"; do
    is_installed "$package" || missing+=("$package")
  done
  ((${#missing[@]})) || return 0

  if ! is_known_debian; then
    echo "Missing: ${missing[*]} (Debian's names). Please install these, then try again." >&2
    exit 1
  fi
  if ((EUID != 0)); then
    if ! command -v sudo >/dev/null; then
      echo "Missing: ${missing[*]}. Installing them takes root or sudo, and here is neither." >&2
      exit 1
    fi
    as_root=(sudo)
    # Without a terminal nobody can type a password.
    [[ -t 0 ]] || as_root+=(-n)
  fi

  echo "Installing ${missing[*]}" >&2
  local apt=("${as_root[@]}" env DEBIAN_FRONTEND=noninteractive apt-get -qq -o DPkg::Lock::Timeout=300
    -o Dpkg::Use-Pty=0)
  if ! {
    "${apt[@]}" update &&
      "${apt[@]}" install -y --no-install-recommends "${missing[@]}"
  } >&2; then
    echo "Could not install ${missing[*]}." >&2
    exit 1
  fi
}
