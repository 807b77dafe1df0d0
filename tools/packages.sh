#!/usr/bin/env bash
# Sees to it that the Debian packages Marlowbeck is built with are installed.
#
#   tools/packages.sh          what the program needs
#   tools/packages.sh check    that, and what its tests and checks need
#
# Does nothing, and needs no network, when nothing is missing.
set -euo pipefail

build_packages=(
  g++ cmake ninja-build ccache
  qt6-base-dev qt6-svg-dev qt6-multimedia-dev libgl1-mesa-dev
  nlohmann-json3-dev libcli11-dev
  fonts-liberation fonts-dejavu-core
)
check_packages=(
  libgtest-dev libgmock-dev libbenchmark-dev libsqlite3-dev
  clang-format clang-tidy poppler-utils python3 git xvfb xauth
)

is_installed() {
  [[ "$(dpkg-query --show --showformat='${db:Status-Status}' "$1" 2>/dev/null)" == installed ]]
}

wanted=("${build_packages[@]}")
if [[ "${1:-}" == check ]]; then wanted+=("${check_packages[@]}"); fi

if ! command -v dpkg-query >/dev/null; then
  echo "This is not a Debian system; what is needed has to be there already: ${wanted[*]}"
  exit 0
fi

missing=()
for package in "${wanted[@]}"; do
  is_installed "$package" || missing+=("$package")
done
if ((${#missing[@]} == 0)); then exit 0; fi

echo "Installing from Debian: ${missing[*]}"
as_root=()
if ((EUID != 0)); then
  if ! command -v sudo >/dev/null; then
    echo "Please install these as root, then start again: apt-get install ${missing[*]}" >&2
    exit 1
  fi
  as_root=(sudo)
fi
# A package list that cannot be renewed may still do.
"${as_root[@]}" env DEBIAN_FRONTEND=noninteractive apt-get update -qq || true
"${as_root[@]}" env DEBIAN_FRONTEND=noninteractive \
  apt-get install -qq --yes --no-install-recommends "${missing[@]}"
