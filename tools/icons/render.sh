#!/usr/bin/env bash
# Builds the icon renderer (outside the main build) and regenerates the PNGs,
# images.qrc and the contact sheet from the SVG sources.
set -euo pipefail
here="$(cd "$(dirname "${BASH_SOURCE[0]}")" && pwd)"
root="$(cd "$here/../.." && pwd)"
build="${VEXA_ICON_BUILD_DIR:-${TMPDIR:-/tmp}/vexa-icon-render}"
cmake -S "$here" -B "$build" -DCMAKE_BUILD_TYPE=Release >/dev/null
cmake --build "$build" >/dev/null
"$build/vexa-icon-render" "$root" "$@"
