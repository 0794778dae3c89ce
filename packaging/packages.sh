# The Debian packages that building, playing and testing need; for ./play and ./check.

PLAY_PACKAGES=(cmake ninja-build g++ pkgconf qt6-base-dev libcanberra-dev libcanberra-pulse
    sound-theme-freedesktop fonts-liberation scowl)

CHECK_PACKAGES=("${PLAY_PACKAGES[@]}" clang-format libgtest-dev libbenchmark-dev libmarisa-dev
    dpkg-dev file lintian appstream desktop-file-utils mandoc
    xvfb xauth openbox xdotool dbus-daemon at-spi2-core python3-pyatspi)

# Installs those of the named packages that are missing, with sudo where that is needed.
require_packages() {
    command -v dpkg-query >/dev/null || { echo "No Debian system: taking $* as installed."; return; }
    local installed missing=() package
    installed=$(dpkg-query -W -f '${db:Status-Status} ${Package}\n' "$@" 2>/dev/null || true)
    for package in "$@"; do
        grep -qxF "installed $package" <<<"$installed" || missing+=("$package")
    done
    [ ${#missing[@]} -gt 0 ] || return 0

    # The word lists ask questions, and sudo drops the caller's environment.
    local as_root=() apt=(env DEBIAN_FRONTEND=noninteractive apt-get)
    [ "$(id -u)" -eq 0 ] || as_root=(sudo)
    echo "Missing packages: ${missing[*]}"
    if [ "$(id -u)" -ne 0 ] && ! command -v sudo >/dev/null; then
        echo "Neither root nor sudo; have them installed by:" >&2
        echo "  apt-get update && apt-get install --no-install-recommends ${missing[*]}" >&2
        return 1
    fi
    (set -x
     "${as_root[@]}" "${apt[@]}" update -q
     "${as_root[@]}" "${apt[@]}" install -yq --no-install-recommends "${missing[@]}")
}
