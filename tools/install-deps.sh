#!/usr/bin/env bash
# Installs what building and testing quire needs on a Debian machine (run as root).
set -euo pipefail

packages=(
  build-essential cmake ninja-build ccache pkg-config
  libgtest-dev zlib1g-dev libbz2-dev libutfcpp-dev libfreetype-dev libfontconfig-dev fonts-liberation
  python3 python3-xlrd python3-openpyxl python3-xlwt python3-xlsxwriter python3-lxml
  zip unzip gnumeric libreoffice-calc-nogui "lib"xlsxwriter-dev
)

missing=()
for package in "${packages[@]}"; do
  dpkg-query -W -f='${Status}' "$package" 2>/dev/null | grep -q "install ok installed" || missing+=("$package")
done
if [ ${#missing[@]} -eq 0 ]; then
  exit 0
fi
echo "installing: ${missing[*]}"
export DEBIAN_FRONTEND=noninteractive
apt-get update -qq
apt-get install -y -qq --no-install-recommends "${missing[@]}" >/dev/null
