#!/usr/bin/env bash
# Python stage: installs the redavudeva Python package the way the README says
# (pip, no build isolation, Debian's packages only) into a fresh virtual
# environment that sees Debian's NumPy and pytest, and runs the Python tests
# against the installed package from outside the source tree. (The presets
# that test already run the same tests against the module in their build.)
set -euo pipefail
cd "$(dirname "$0")/../.."
source scripts/lib/common.sh

ensure_packages "${PYTHON_PACKAGES[@]}"
venv="$PWD/build/python-venv"
rm -rf "$venv" python/build python/redavudeva.egg-info
/usr/bin/python3 -m venv --system-site-packages "$venv"
# --no-index: everything comes from Debian's packages; nothing is downloaded.
"$venv/bin/pip" install --quiet --no-build-isolation --no-index ./python

# The tests compare with the tool of the dev build where there is one.
repo="$PWD"
tool="$repo/build/dev/tools/swatchlog/swatchlog"
[ -x "$tool" ] || tool=""
work="$(mktemp -d)"
trap 'rm -rf "$work"' EXIT
cd "$work"
"$venv/bin/python" -c 'import redavudeva, sys; sys.exit(0 if "/build/python-venv/" in redavudeva.__file__ else 1)'
REDAVUDEVA_EXAMPLES="$repo/examples" SWATCHLOG="$tool" PYTHONDONTWRITEBYTECODE=1 \
    "$venv/bin/python" -m pytest -q -p no:cacheprovider "$repo/python/tests"
