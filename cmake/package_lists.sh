# shellcheck shell=bash disable=SC2034  # used by the scripts that source this file
# Debian's packages, by what they are needed for.

# To build kvd-stage and kvremote, its screen included.
BUILD_PACKAGES=(g++ cmake ninja-build libncurses-dev)

# To build kvd itself.
DESKTOP_LIBRARIES=(pkgconf libsystemd-dev libxcb1-dev libxcb-randr0-dev libxcb-res0-dev libpulse-dev libglib2.0-dev
  nlohmann-json3-dev)
