# What ./run, ./test and ./bench/run share. Sourced from the project's folder.

project_packages="cmake g++ lld ninja-build pkg-config python3 qt6-base-dev qt6-svg-dev
    qt6-tools-dev qt6-l10n-tools qt6-tools-dev-tools qt6-translations-l10n
    libcpp-httplib-dev libsqlitecpp-dev libsqlite3-dev nlohmann-json3-dev libyaml-cpp-dev libssl-dev dbus-daemon
    fonts-inter fonts-symbola"
# For programs on a virtual display, and their pictures.
display_packages="xvfb openbox xdotool imagemagick x11-utils"

say() { printf '== %s\n' "$*"; }

# Installs those of the named packages that are missing; asks the package index only then.
install_packages() {
    local missing=() package
    for package in "$@"; do
        dpkg-query -W -f '${Status}' "$package" 2>/dev/null | grep -q 'ok installed' || missing+=("$package")
    done
    [ ${#missing[@]} -eq 0 ] && return 0
    say "installing ${missing[*]}"
    local as_root=()
    if [ "$(id -u)" -ne 0 ]; then
        command -v sudo >/dev/null || { echo "As another user than root, sudo is needed to install: ${missing[*]}" >&2; return 1; }
        as_root=(sudo)
    fi
    "${as_root[@]}" env DEBIAN_FRONTEND=noninteractive sh -c \
        'apt-get update -qq && apt-get install -y -qq --no-install-recommends "$@" >/dev/null' sh "${missing[@]}"
}

# Configures a preset once and builds it; the build tool finds out by itself what has changed.
build_preset() {
    local preset=$1
    shift
    [ -f "build/$preset/build.ninja" ] || { say "configuring $preset"; cmake --preset "$preset" >/dev/null; }
    say "building $preset"
    cmake --build --preset "$preset" "$@"
}
