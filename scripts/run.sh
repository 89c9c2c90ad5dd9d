#!/usr/bin/env bash
# Installs what is missing, builds the default preset and runs the tool with the given arguments.
# Build messages go to standard error, so that standard output holds only what the tool prints.
# Usage: scripts/run.sh demo | scripts/run.sh calc DRAWING | scripts/run.sh --help
set -euo pipefail
cd "$(dirname "$0")/.."
scripts/install-deps.sh
cmake --preset default >&2
cmake --build --preset default --target zyrarea >&2
exec build/default/bin/zyrarea "$@"
