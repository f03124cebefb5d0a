#!/usr/bin/env bash
# Installs the Debian packages that building, running and testing Redizor need.
# Idempotent: it asks apt only for what is missing, and does nothing when all is there.
set -euo pipefail

packages=(
  build-essential cmake pkg-config
  libsdl2-dev        # window, input and audio of the desktop backend
  libgtest-dev libgmock-dev libbenchmark-dev
  libstb-dev         # stb_truetype and stb_image_write for the data pack and text
  fonts-dejavu-core  # the face used for lettering and the window font
  xvfb xauth         # a virtual X server for the desktop backend's tests and screenshots
  xfonts-base        # the X fonts SDL's own message boxes are drawn with
  imagemagick        # screenshots of the real window under Xvfb
)

missing=()
for p in "${packages[@]}"; do
  dpkg-query -W -f='${Status}' "$p" 2>/dev/null | grep -q "install ok installed" || missing+=("$p")
done
[ ${#missing[@]} -eq 0 ] && exit 0

sudo=""
[ "$(id -u)" -ne 0 ] && sudo="sudo"
echo "Installing: ${missing[*]}"
$sudo apt-get update -qq
DEBIAN_FRONTEND=noninteractive $sudo apt-get install -y -qq --no-install-recommends "${missing[@]}"
