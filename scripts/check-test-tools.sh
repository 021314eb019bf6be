#!/usr/bin/env bash
# Checks that every outside tool a test reads its results back with is there, and names the
# Debian package of each one that is not (scripts/setup.sh installs them all). Run by
# scripts/test.sh before the tests and as the CTest entry "test_tools", so that a missing
# package fails with its name instead of as a side effect deep inside a test.
set -uo pipefail

missing=()
python_module() { # module package
    /usr/bin/python3 -c "import $1" >/dev/null 2>&1 || missing+=("$2 (Python module $1 for /usr/bin/python3)")
}
command_tool() { # command package
    command -v "$1" >/dev/null 2>&1 || missing+=("$2 (command $1)")
}

# Workbooks are read back with openpyxl; openpyxl reads a sheet's images only through Pillow.
python_module openpyxl python3-openpyxl
python_module PIL python3-pil

if [[ ${#missing[@]} -gt 0 ]]; then
    echo "check-test-tools: missing Debian packages the tests need (scripts/setup.sh installs them):" >&2
    for m in "${missing[@]}"; do echo "  $m" >&2; done
    exit 1
fi
echo "check-test-tools: every tool the tests need is installed"
