#!/usr/bin/env bash
# Builds the dev preset and runs the demo: the embedded broker loads the
# product library and shows every served class and association on the
# simulated host (TVX_HOST_PROFILE, or the built-in default). Extra
# arguments are tvxcim options, e.g. --json.
set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."

scripts/setup.sh
cmake --preset dev
cmake --build --preset dev -j2
# The simulated host's alternate boot bank, unless the caller chose one.
export TVX_ALTBOOTBANK_CFG="${TVX_ALTBOOTBANK_CFG:-$PWD/hostsim/altbootbank/boot.cfg}"
exec build/dev/broker/tvxcim "$@" demo
