#!/usr/bin/env bash
# Builds the dev preset and starts the demo; extra arguments go to tvxcim.
set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."

scripts/setup.sh
cmake --preset dev
cmake --build --preset dev -j2
exec build/dev/broker/tvxcim demo "$@"
