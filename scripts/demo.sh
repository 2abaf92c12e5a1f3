#!/usr/bin/env bash
# Builds the dev preset and runs the demo: the embedded broker loads the
# provider library named by the registration and shows every served class,
# association and indication. Extra arguments are tvxcim options.
set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."

scripts/setup.sh
cmake --preset dev
cmake --build --preset dev -j2
# Until the product's own providers exist, the demo serves the test provider.
exec build/dev/broker/tvxcim \
  --provider-dir build/dev/tests/testprovider \
  --registration tests/testprovider/testprovider.reg \
  --mof tests/testprovider/testprovider.mof \
  "$@" demo
