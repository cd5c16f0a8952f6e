# shellcheck shell=bash disable=SC2034  # used by the scripts that source this file
# Debian's packages, by what they are needed for.

# To build kvd-stage and kvremote, its screen included.
BUILD_PACKAGES=(g++ cmake ninja-build libncurses-dev)

# To build kvd itself and kvd-receiver.
DESKTOP_LIBRARIES=(pkgconf libevdev-dev libsystemd-dev libxcb1-dev libxcb-randr0-dev libxcb-res0-dev libpulse-dev
  libglib2.0-dev nlohmann-json3-dev libwayland-dev libwayland-bin libxkbcommon-dev
  plasma-wayland-protocols)

# To test kvd-receiver with devices that are not there.
DEVICE_TEST_PACKAGES=(umockdev gir1.2-umockdev-1.0 python3-gi python3-dbusmock)
