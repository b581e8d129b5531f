#!/usr/bin/env bash
# The demo command: installs what is missing, builds the Release configuration's demo into
# build/release and runs it. Arguments go to the demo (for example --script FILE or --out FOLDER).
set -euo pipefail
cd "$(dirname "$0")/.."

bash scripts/deps.sh
cmake --preset release
cmake --build --preset release --target orvdemo
exec build/release/apps/demo/orvdemo "$@"
