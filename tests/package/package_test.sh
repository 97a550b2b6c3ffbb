#!/usr/bin/env bash
# SPDX-License-Identifier: MIT
# One step of the package tests: package_test.sh STEP. The surroundings come from CMakeLists.txt beside this file.
set -euo pipefail

fail() {
    echo "FAILED: $*" >&2
    exit 1
}

# Compilers and generators of the surroundings, in a build of our own.
configure() { # configure SOURCE BINARY [OPTION...]
    local source=$1 binary=$2
    shift 2
    "$CMAKE" -S "$source" -B "$binary" -G "$CMAKE_GENERATOR" -DCMAKE_BUILD_TYPE=Debug "$@"
}

prefix_of() {
    echo "$ZELKOV_SCRATCH/$1"
}

# The folder for PKG_CONFIG_PATH. The file has to name the prefix it stands in, wherever it was configured for.
pkg_config_path() { # pkg_config_path shared | static
    local prefix folder libdir
    prefix=$(prefix_of "$1")
    folder=$(dirname "$(find "$prefix" -name zelkovwidgets.pc | head -n 1)")
    libdir=$(PKG_CONFIG_PATH=$folder pkg-config --variable=libdir zelkovwidgets)
    [ "$(realpath -m "$libdir")" = "$(dirname "$(realpath "$folder")")" ] || fail "pkg-config names $libdir"
    echo "$folder"
}

run_hello() { # run_hello PROGRAM [FOLDER-FOR-THE-LOADER]
    local output
    output=$(LD_LIBRARY_PATH=${2:-} timeout 30 "$1" --once 2>&1) || fail "$1 ended with $?: $output"
    # The offscreen plug-in says this of any window.
    output=$(echo "$output" | grep -v '^This plugin does not support ' || true)
    [ -z "$output" ] || fail "$1 printed: $output"
}

install_shared() {
    rm -rf "$(prefix_of shared)"
    "$CMAKE" --install "$ZELKOV_BUILD" --prefix "$(prefix_of shared)" > /dev/null
}

# Builds and installs a second copy of the library, as archives and without anything else.
install_static() {
    local binary=$ZELKOV_SCRATCH/build-static
    rm -rf "$(prefix_of static)"
    configure "$ZELKOV_SOURCE" "$binary" -DBUILD_SHARED_LIBS=OFF -DZELKOV_BUILD_TESTS=OFF \
        -DZELKOV_BUILD_GALLERY=OFF -DCMAKE_UNITY_BUILD=ON "-DCMAKE_INSTALL_PREFIX=$(prefix_of static)" > /dev/null
    "$CMAKE" --build "$binary" -j 2
    "$CMAKE" --install "$binary" > /dev/null
    [ -n "$(find "$(prefix_of static)" -name libZelkovWidgets.a)" ] || fail "no archive was installed"
    [ -z "$(find "$(prefix_of static)" -name '*.so*')" ] || fail "a shared object was installed"
}

find_package_step() { # shared | static
    local binary=$ZELKOV_SCRATCH/hello-cmake-$1
    rm -rf "$binary"
    configure "$ZELKOV_SOURCE/examples/hello" "$binary" "-DCMAKE_PREFIX_PATH=$(prefix_of "$1")"
    "$CMAKE" --build "$binary"
    run_hello "$binary/hello"
}

pkg_config_step() { # shared | static
    local binary=$ZELKOV_SCRATCH/hello-pkgconfig-$1
    local path flags
    rm -rf "$binary"
    mkdir -p "$binary"
    path=$(pkg_config_path "$1")
    flags=$(PKG_CONFIG_PATH=$path pkg-config --cflags --libs zelkovwidgets Qt5Widgets)
    # shellcheck disable=SC2086
    "$CXX" -std=c++17 -fPIC "$ZELKOV_SOURCE/examples/hello/main.cpp" -o "$binary/hello" $flags
    # The program names no folder, so the loader is told.
    run_hello "$binary/hello" "$(dirname "$(find "$(prefix_of "$1")" -name 'libZelkovWidgets.*' | head -n 1)")"
    [ "$(PKG_CONFIG_PATH=$path pkg-config --modversion zelkovwidgets)" = "$ZELKOV_VERSION" ] \
        || fail "pkg-config tells another version than $ZELKOV_VERSION"
}

accepts_version() { # accepts_version VERSION [COMPONENT]
    local project=$ZELKOV_SCRATCH/version
    rm -rf "$project"
    mkdir -p "$project"
    {
        echo 'cmake_minimum_required(VERSION 3.16)'
        echo 'project(asks LANGUAGES CXX)'
        echo "find_package(ZelkovWidgets $1 REQUIRED)"
        echo 'foreach(target Core CoreQt Utils Widgets)'
        echo '    if(NOT TARGET Zelkov::${target})'
        echo '        message(FATAL_ERROR "no Zelkov::${target}")'
        echo '    endif()'
        echo 'endforeach()'
    } > "$project/CMakeLists.txt"
    configure "$project" "$project/build" "-DCMAKE_PREFIX_PATH=$(prefix_of shared)" > "$project/log" 2>&1
}

version() {
    local major=${ZELKOV_VERSION%%.*}
    for wanted in "$major" "$major.0" "$ZELKOV_VERSION"; do
        accepts_version "$wanted" || { cat "$ZELKOV_SCRATCH/version/log"; fail "version $wanted was turned down"; }
    done
    for wanted in "$((major + 1))" "$((major - 1))" "$major.999"; do
        if accepts_version "$wanted"; then
            fail "version $wanted was accepted by $ZELKOV_VERSION"
        fi
        grep -q 'ZelkovWidgets' "$ZELKOV_SCRATCH/version/log" || fail "the refusal of $wanted does not say why"
    done
}

# SONAME is the major version alone, and only our own names are visible.
libraries() {
    local major=${ZELKOV_VERSION%%.*} library name
    for name in ZelkovCore ZelkovCoreQt ZelkovUtils ZelkovWidgets; do
        library=$(find "$(prefix_of shared)" -name "lib$name.so" | head -n 1)
        [ -n "$library" ] || fail "lib$name.so was not installed"
        readelf -d "$library" | grep -q "SONAME.*\[lib$name\.so\.$major\]" || fail "SONAME of $library"
    done
    # Weak names of templates stay visible whatever is asked; what is strong must be ours.
    local foreign
    foreign=$(nm -DC --defined-only "$library" | awk '$2 == "T"' | cut -d' ' -f3- \
        | grep -Ev '^(non-virtual thunk to )?(vx::|zelkov_|_init|_fini|[A-Za-z]+(View|Controller|Animation|Thing|Area|CheckBox|ScrollBar|Slideshow|ToolBar|Edit|Label|Button|Widget|Icon)::)' || true)
    [ -z "$foreign" ] || fail "visible names that are not ours: $foreign"
}

# Every installed header compiles alone, with warnings as errors.
headers() {
    local path flags
    path=$(pkg_config_path shared)
    flags=$(PKG_CONFIG_PATH=$path pkg-config --cflags zelkovwidgets)
    # What comes from Qt is not ours to judge.
    flags=$(echo "$flags" | sed -E 's#-I([^ ]*/qt5)#-isystem \1#g')
    local include
    include=$(prefix_of shared)/include/zelkov
    [ -d "$include" ] || fail "no headers in $include"
    local list
    list=$(cd "$include" && find . -name '*.h' | sed 's#^\./##' | sort)
    [ "$(echo "$list" | wc -l)" -ge 4 ] || fail "too few headers in $include"
    local probes=$ZELKOV_SCRATCH/headers header launcher
    rm -rf "$probes"
    mkdir -p "$probes"
    for header in $list; do
        printf '#include "%s"\n#include "%s"\n' "$header" "$header" > "$probes/${header//\//_}.cpp"
    done
    launcher=$(command -v ccache || true)
    export CXX flags launcher
    # shellcheck disable=SC2016
    find "$probes" -name '*.cpp' | sort | xargs -P 2 -I '{}' sh -c '
        $launcher "$CXX" -std=c++17 -fPIC -Wall -Wextra -Wshadow -Wconversion -Werror \
            -DQT_NO_KEYWORDS -DQT_NO_CAST_FROM_ASCII $flags -c "{}" -o "{}.o" || exit 255' \
        || fail "a header does not compile alone"
    echo "$(echo "$list" | wc -l) headers compile alone"
}

# As a part of another project: no tests, no gallery.
subproject() {
    local project=$ZELKOV_SCRATCH/subproject
    rm -rf "$project"
    mkdir -p "$project"
    {
        echo 'cmake_minimum_required(VERSION 3.16)'
        echo 'project(outer LANGUAGES CXX)'
        echo "add_subdirectory($ZELKOV_SOURCE zelkov)"
        echo 'foreach(target zelkov_tests zelkov-gallery)'
        echo '    if(TARGET ${target})'
        echo '        message(FATAL_ERROR "${target} came along")'
        echo '    endif()'
        echo 'endforeach()'
        echo 'if(NOT TARGET Zelkov::Widgets)'
        echo '    message(FATAL_ERROR "no Zelkov::Widgets")'
        echo 'endif()'
    } > "$project/CMakeLists.txt"
    configure "$project" "$project/build"
}

mkdir -p "$ZELKOV_SCRATCH"
case "${1:-}" in
    install_shared | install_static | version | libraries | headers | subproject) "$1" ;;
    find_package_shared) find_package_step shared ;;
    find_package_static) find_package_step static ;;
    pkg_config_shared) pkg_config_step shared ;;
    pkg_config_static) pkg_config_step static ;;
    *) fail "no step '${1:-}'" ;;
esac
