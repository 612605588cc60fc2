# The libraries of a build for Windows, made from the distribution's source packages. Sourced by packaging/windows/build.
#
#   $cache/sources   the unpacked source packages
#   $cache/sysroot   what they install: the folder that the toolchain file is told of
#   $cache/made      a file a library with what it was made from; remove one to make that library again

apt_in_cache() {
    local command=$1
    shift
    "$command" -q -o Dir::Etc::sourcelist="$cache/apt/sources.list" -o Dir::Etc::sourceparts=/dev/null \
        -o Dir::State::lists="$cache/apt/lists" -o Dir::Cache="$cache/apt/cache" -o APT::Sandbox::User= "$@"
}

# An index of source packages of its own: the machine's package lists stay as they are.
index_source_packages() {
    [ -f "$cache/apt/indexed" ] && return 0
    say "reading the index of source packages"
    mkdir -p "$cache/apt/lists/partial" "$cache/apt/cache/archives/partial"
    local key='[signed-by=/usr/share/keyrings/debian-archive-keyring.gpg]'
    printf 'deb-src %s http://deb.debian.org/%s main\n' \
        "$key" 'debian bookworm' "$key" 'debian-security bookworm-security' >"$cache/apt/sources.list"
    apt_in_cache apt-get update >/dev/null
    touch "$cache/apt/indexed"
}

# Unpacks the newest version of a source package that can be had into $cache/sources/NAME. A mirror may lack the
# newest one. False when it has none.
unpack_source() {
    local name=$1 version
    [ -d "$cache/sources/$name" ] && return 0
    index_source_packages
    mkdir -p "$cache/sources" "$cache/downloads"
    for version in $(apt_in_cache apt-cache showsrc "$name" | sed -n 's/^Version: //p' | sort -Vru); do
        say "fetching the source of $name $version"
        (cd "$cache/downloads" && apt_in_cache apt-get source --download-only "$name=$version" >/dev/null 2>&1) || continue
        rm -rf "$cache/sources/$name.part"
        dpkg-source -x "$cache/downloads/${name}_${version#*:}.dsc" "$cache/sources/$name.part" >/dev/null 2>&1 || continue
        mv "$cache/sources/$name.part" "$cache/sources/$name"
        return 0
    done
    return 1
}

source_version() { dpkg-parsechangelog -l "$cache/sources/$1/debian/changelog" -S Version; }

# True when the library was made before, from this version and with these options.
is_made() {
    local name=$1
    shift
    [ "$(cat "$cache/made/$name" 2>/dev/null)" = "$(source_version "$name") $*" ]
}

note_made() {
    local name=$1
    shift
    mkdir -p "$cache/made" "$sysroot/licences"
    cp "$cache/sources/$name/debian/copyright" "$sysroot/licences/$name.txt"
    echo "$(source_version "$name") $*" >"$cache/made/$name"
}

# make_with_cmake NAME OPTION… — a library whose source package is built by CMake.
make_with_cmake() {
    local name=$1
    shift
    unpack_source "$name" || { echo "The source package $name cannot be had." >&2; return 1; }
    is_made "$name" "$@" && return 0
    say "making $name for Windows"
    # What an interrupted run has configured may name another tree's toolchain file; its objects are still good.
    cmake --fresh -S "$cache/sources/$name" -B "$cache/build/$name" -G Ninja -DCMAKE_BUILD_TYPE=Release \
        -DCMAKE_TOOLCHAIN_FILE="$toolchain" -DNVLDM_WINDOWS_SYSROOT="$sysroot" \
        -DCMAKE_INSTALL_PREFIX="$sysroot" -DCMAKE_INSTALL_LIBDIR=lib "$@" >"$cache/$name.log" 2>&1 &&
        cmake --build "$cache/build/$name" >>"$cache/$name.log" 2>&1 &&
        cmake --install "$cache/build/$name" >>"$cache/$name.log" 2>&1 || {
        tail -n 40 "$cache/$name.log" >&2
        echo "$name could not be made; all of it stands in $cache/$name.log" >&2
        return 1
    }
    note_made "$name" "$@"
    # Only what was installed is needed again.
    rm -rf "${cache:?}/build/$name"
}

make_openssl() {
    # A library that loads a configuration by itself would take it from a place that others may write to.
    local options="mingw64 shared no-tests no-engine no-module no-autoload-config"
    local settings='C:/Program Files/Common Files/SSL'
    unpack_source openssl || { echo "The source package openssl cannot be had." >&2; return 1; }
    # shellcheck disable=SC2086
    is_made openssl $options && return 0
    say "making openssl for Windows"
    # shellcheck disable=SC2086
    (
        rm -rf "$cache/build/openssl" && mkdir -p "$cache/build/openssl" && cd "$cache/build/openssl" &&
            "$cache/sources/openssl/Configure" $options --cross-compile-prefix=x86_64-w64-mingw32- \
                --prefix="$sysroot" --libdir=lib &&
            make -j"$(nproc)" OPENSSLDIR="$settings" MODULESDIR="$settings/modules" ENGINESDIR="$settings/engines" \
                build_libs && make install_dev
    ) >"$cache/openssl.log" 2>&1 || {
        tail -n 40 "$cache/openssl.log" >&2
        echo "openssl could not be made; all of it stands in $cache/openssl.log" >&2
        return 1
    }
    # shellcheck disable=SC2086
    note_made openssl $options
    rm -rf "${cache:?}/build/openssl"
}

# The modules Core, Gui, Widgets, Network and Test. What is off is either not used or lacks headers in the compiler's
# own set; the bundled copies of picture and text libraries are used, as the distribution has none for Windows.
make_qt() {
    local off=OFF
    make_with_cmake qt6-base -DBUILD_SHARED_LIBS=ON -DQT_BUILD_EXAMPLES=OFF -DQT_BUILD_TESTS=OFF \
        -DQT_HOST_PATH=/usr -DQT_HOST_PATH_CMAKE_DIR=/usr/lib/x86_64-linux-gnu/cmake \
        -DINPUT_opengl=no -DFEATURE_opengl_dynamic=$off -DFEATURE_vulkan=$off \
        -DFEATURE_tabletevent=$off -DFEATURE_direct2d=$off -DFEATURE_direct2d1_1=$off \
        -DFEATURE_directwrite=$off -DFEATURE_directwrite3=$off \
        -DFEATURE_dbus=$off -DFEATURE_sql=$off -DFEATURE_printsupport=$off -DFEATURE_xml=$off \
        -DFEATURE_androiddeployqt=$off -DFEATURE_pkg_config=$off -DFEATURE_openssl=$off -DFEATURE_icu=$off \
        -DFEATURE_zstd=$off -DFEATURE_brotli=$off -DFEATURE_system_zlib=$off -DFEATURE_system_pcre2=$off \
        -DFEATURE_system_png=$off -DFEATURE_system_jpeg=$off -DFEATURE_system_freetype=$off \
        -DFEATURE_system_harfbuzz=$off -DFEATURE_system_doubleconversion=$off
}

# False when its source package cannot be had: the program's pictures are then drawn by the build.
make_qt_svg() {
    unpack_source qt6-svg || return 1
    make_with_cmake qt6-svg -DQT_HOST_PATH=/usr -DQT_HOST_PATH_CMAKE_DIR=/usr/lib/x86_64-linux-gnu/cmake \
        -DQT_BUILD_EXAMPLES=OFF -DQT_BUILD_TESTS=OFF
}

make_libraries() {
    make_openssl
    make_with_cmake nlohmann-json3 -DJSON_BuildTests=OFF
    make_with_cmake sqlitecpp -DSQLITECPP_INTERNAL_SQLITE=ON -DSQLITECPP_RUN_CPPLINT=OFF -DSQLITECPP_RUN_CPPCHECK=OFF \
        -DSQLITECPP_USE_STACK_PROTECTION=OFF
    make_with_cmake yaml-cpp -DYAML_CPP_BUILD_TESTS=OFF -DYAML_CPP_BUILD_TOOLS=OFF -DYAML_CPP_BUILD_CONTRIB=OFF
    make_with_cmake cpp-httplib -DHTTPLIB_COMPILE=ON -DHTTPLIB_REQUIRE_OPENSSL=ON \
        -DHTTPLIB_USE_ZLIB_IF_AVAILABLE=OFF -DHTTPLIB_USE_BROTLI_IF_AVAILABLE=OFF \
        -DOPENSSL_ROOT_DIR="$sysroot"
    make_qt
}
