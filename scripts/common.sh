# SPDX-License-Identifier: MIT
# Shared by run, test, bench and .ci/run. Sourced with the repository's root as working directory.

say() { printf '==> %s\n' "$*"; }

# What a fresh Debian 12 lacks to build; each script adds what it needs beside it.
BUILD_PACKAGES="g++ cmake ninja-build ccache qtbase5-dev libqt5svg5-dev qt5-image-formats-plugins \
qttools5-dev qttools5-dev-tools qttranslations5-l10n libtiff-dev fonts-open-sans fonts-dejavu-core fonts-noto-cjk"
# Videos and cameras of the Measuring Desk; a build without them has no such frame sources.
CAMERA_PACKAGES="pkg-config qtmultimedia5-dev libqt5multimedia5-plugins gstreamer1.0-plugins-base \
gstreamer1.0-plugins-good gstreamer1.0-plugins-bad libaravis-dev libusb-1.0-0-dev"
TEST_PACKAGES="poppler-utils qpdf xvfb xauth xdotool desktop-file-utils appstream shared-mime-info mandoc zsh fish"
BENCH_PACKAGES="libbenchmark-dev"

is_installed() {
  [ "$(dpkg-query -W -f '${db:Status-Status}' "$1" 2>/dev/null)" = installed ]
}

as_root() {
  if [ "$(id -u)" -eq 0 ]; then "$@"; else sudo "$@"; fi
}

# Installs the packages that are missing; says nothing when none is.
install_packages() {
  missing=""
  for package in "$@"; do
    is_installed "$package" || missing="$missing $package"
  done
  [ -n "$missing" ] || return 0
  if ! command -v apt-get >/dev/null 2>&1; then
    printf 'Please install these packages (or what your system calls them):%s\n' "$missing" >&2
    return 1
  fi
  say "Installing$missing"
  log=$(mktemp)
  # shellcheck disable=SC2086
  if ! { as_root apt-get update && as_root env DEBIAN_FRONTEND=noninteractive \
         apt-get install -y --no-install-recommends $missing; } >"$log" 2>&1; then
    tail -n 20 "$log" >&2
    rm -f "$log"
    return 1
  fi
  rm -f "$log"
}

# The same for packages that a build can do without.
install_optional_packages() {
  install_packages "$@" || say "Going on without them"
}

# build PRESET [TARGET ...]
build() {
  preset=$1
  shift
  if [ ! -f "build/$preset/build.ninja" ]; then
    say "Configuring build/$preset"
    cmake --preset "$preset" >"/tmp/statreport-configure.$$" 2>&1 || {
      cat "/tmp/statreport-configure.$$" >&2
      rm -f "/tmp/statreport-configure.$$"
      return 1
    }
    rm -f "/tmp/statreport-configure.$$"
  fi
  say "Building build/$preset"
  # CMakeFiles change rarely, yet then ninja configures anew by itself.
  if ! cmake --build --preset "$preset" ${1:+--target "$@"} >"build/$preset/build.log" 2>&1; then
    grep -vE '^\[[0-9]+/[0-9]+\]' "build/$preset/build.log" | tail -n 60 >&2
    return 1
  fi
}
