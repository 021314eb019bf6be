#!/usr/bin/env bash
# The main job: builds the project (installing what is missing) and runs it.
# Until the host application exists this runs the console tool on the built-in
# colorimetric conditions and geometries.
set -euo pipefail
ROOT="$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)"
"$ROOT/scripts/setup.sh" --build-dir "$ROOT/build"
TOOL="$ROOT/build/apps/vexa-tool/vexa-tool"
echo "== vexa-tool version"; "$TOOL" version
echo "== vexa-tool conditions"; "$TOOL" conditions
echo "== vexa-tool geometries"; "$TOOL" geometries
