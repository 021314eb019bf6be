#!/usr/bin/env bash
# Rebuilds the spectrum renderer in the project's build folder and rewrites the committed
# background image of the spectral view.
#
#   tools/spectrum/render.sh [BUILD_DIR]     (default: build)
set -euo pipefail
root="$(cd "$(dirname "${BASH_SOURCE[0]}")/../.." && pwd)"
build="${1:-$root/build}"
cmake --build "$build" --target vexa-spectrum-image >/dev/null
"$build/tools/spectrum/vexa-spectrum-image" "$root/vexa/resources/graph/Spectrum.png"
