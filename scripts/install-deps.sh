#!/usr/bin/env bash
# Installs the Debian packages the build needs, and only those that are missing.
# Usage: scripts/install-deps.sh [--bench] [--fuzz]
set -euo pipefail

packages=(cmake ninja-build g++ libgtest-dev libgmock-dev libcgal-dev libsqlite3-dev
          libcli11-dev nlohmann-json3-dev)
for arg in "$@"; do
    case "$arg" in
        --bench) packages+=(libbenchmark-dev) ;;
        --fuzz) packages+=(clang libclang-rt-14-dev) ;;
        *) echo "install-deps: unknown option '$arg' (known: --bench, --fuzz)" >&2; exit 2 ;;
    esac
done

missing=()
for p in "${packages[@]}"; do
    status=$(dpkg-query -W -f='${Status}' "$p" 2>/dev/null || true)
    [[ "$status" == "install ok installed" ]] || missing+=("$p")
done
[[ ${#missing[@]} -eq 0 ]] && exit 0

if [[ $(id -u) -ne 0 ]]; then
    echo "install-deps: these packages are missing: ${missing[*]}" >&2
    echo "install-deps: run as root:  sudo $0 $*" >&2
    exit 1
fi
echo "install-deps: installing ${missing[*]}"
export DEBIAN_FRONTEND=noninteractive
apt-get update -qq
apt-get install -y -qq --no-install-recommends "${missing[@]}"
