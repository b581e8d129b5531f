#!/usr/bin/env bash
# The test command: installs what is missing, builds the Debug configuration with AddressSanitizer
# and UndefinedBehaviorSanitizer into build/asan, and runs every test through CTest.
set -euo pipefail
cd "$(dirname "$0")/.."

bash scripts/deps.sh
cmake --preset asan
cmake --build --preset asan
ctest --preset asan "$@"
