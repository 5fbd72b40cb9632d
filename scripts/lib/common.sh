# Shared shell helpers for the project's scripts.

# Installs the named Debian packages that are missing (as root), or names them
# and stops (as any other user).
ensure_packages() {
    local missing=()
    local pkg
    for pkg in "$@"; do
        if ! dpkg-query -W -f='${Status}' "$pkg" 2>/dev/null | grep -q "install ok installed"; then
            missing+=("$pkg")
        fi
    done
    if [ ${#missing[@]} -eq 0 ]; then
        return 0
    fi
    if [ "$(id -u)" -ne 0 ]; then
        echo "missing Debian packages: ${missing[*]}" >&2
        echo "install them with: sudo apt-get install ${missing[*]}" >&2
        exit 1
    fi
    echo "installing Debian packages: ${missing[*]}"
    if [ -z "${REDAVUDEVA_APT_UPDATED:-}" ]; then
        apt-get update -qq
        export REDAVUDEVA_APT_UPDATED=1
    fi
    # REDAVUDEVA_APT_RECOMMENDS=1 takes the packages' recommendations too.
    local recommends=--no-install-recommends
    if [ -n "${REDAVUDEVA_APT_RECOMMENDS:-}" ]; then
        recommends=
    fi
    DEBIAN_FRONTEND=noninteractive apt-get install -y -qq $recommends "${missing[@]}" >/dev/null
}

# Packages every build needs (the presets that test build the Python module).
BUILD_PACKAGES=(cmake ninja-build g++ clang libgtest-dev libbenchmark-dev liblcms2-dev pkg-config jq python3 acl
    argyll-ref colord-data pybind11-dev python3-dev python3-numpy python3-pytest)

# Packages of installing the Python package with pip into a virtual environment.
PYTHON_PACKAGES=(cmake ninja-build g++ pybind11-dev python3-dev python3-numpy python3-pytest python3-pip
    python3-setuptools python3-venv python3-wheel)

section() {
    echo
    echo "==== $* ===="
}
