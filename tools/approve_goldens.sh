#!/usr/bin/env bash
# SPDX-FileCopyrightText: The Pelloric authors
# SPDX-License-Identifier: MIT

# Writes what the tests put out now into tests/golden; look at the difference before committing it.
#
#   tools/approve_goldens.sh [BUILD]      BUILD is a build folder, build/dev unless given

set -euo pipefail
cd "$(dirname "${BASH_SOURCE[0]}")/.."
build=${1:-build/dev}
cmake --build "$build" --target pelloric_core_tests
PELLORIC_APPROVE_GOLDENS=1 "$build/tests/pelloric_core_tests" --gtest_brief=1
git status --short -- tests/golden
