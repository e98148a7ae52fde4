#!/usr/bin/env bash
# try_package.sh BUILD: tries every way of using the library from outside, in BUILD and in empty folders that are removed
# afterwards. An installed copy is looked for by CMake and by pkg-config, the sources are taken in by add_subdirectory,
# each with GCC and Clang, C++20 and C++23, shared and static; and the Debian packages are checked, installed, used and
# removed. Only root can install packages; anybody else unpacks them into a folder.
set -euo pipefail
sources=$(cd "$(dirname "$0")/../.." && pwd)
mkdir -p "$1"
build=$(cd "$1" && pwd)
version=0.1
work=$(mktemp -d)
counted=0

clean_up() {
    rm -rf "$work"
    if [ -n "${installed_packages:-}" ]; then
        dpkg --purge libzarnmath-dev "libzarnmath$version" >/dev/null 2>&1 || true
    fi
}
trap clean_up EXIT

# quietly COMMAND...: shows what a command prints only if it fails.
quietly() {
    if ! "$@" >"$work/log" 2>&1; then
        cat "$work/log" >&2
        echo "package: failed: $*" >&2
        exit 1
    fi
}

# refused PATTERN COMMAND...: the command has to fail, and to say why.
refused() {
    local pattern=$1
    shift
    if "$@" >"$work/log" 2>&1; then
        echo "package: should have failed: $*" >&2
        exit 1
    elif ! grep -q "$pattern" "$work/log"; then
        cat "$work/log" >&2
        echo "package: failed for another reason than '$pattern': $*" >&2
        exit 1
    fi
}

passed() {
    counted=$((counted + 1))
    echo "package: $*"
}

# A caller that is compiled for a processor with fused multiply-add, where there is one to run it on.
newer_processor() {
    if [ "$(uname -m)" = x86_64 ] && grep -qw fma /proc/cpuinfo && grep -qw avx2 /proc/cpuinfo; then
        echo -march=x86-64-v3
    fi
}

c_compiler() {
    case $1 in
        g++) echo gcc ;;
        clang++) echo clang ;;
    esac
}

# A folder with nothing but somebody else's programs.
outside_folder() {
    local folder
    folder=$(mktemp -d "$work/outside.XXXX")
    mkdir -p "$folder/tests/library"
    cp "$sources/tests/package/outside/"* "$sources/tests/PlainCTest.c" "$folder"
    cp "$sources/tests/library/OutsideCaller."* "$folder/tests/library"
    echo "$folder"
}

# by_cmake COMPILER STANDARD "LINKAGE[;LINKAGE]" [OPTION...]
by_cmake() {
    local compiler=$1 standard=$2 linkage=$3 folder program
    shift 3
    folder=$(outside_folder)
    quietly cmake -S "$folder" -B "$folder/build" -G Ninja -DCMAKE_CXX_COMPILER="$compiler" \
        -DCMAKE_C_COMPILER="$(c_compiler "$compiler")" -DCMAKE_CXX_STANDARD="$standard" -DCMAKE_CXX_EXTENSIONS=OFF \
        -DCMAKE_CXX_FLAGS="-DSTANDARD=$standard" -DNEWER_PROCESSOR="$(newer_processor)" -DLINKAGE="$linkage" "$@"
    quietly cmake --build "$folder/build"
    for program in "$folder/build/"*-{caller,plain}; do
        quietly "$program"
    done
    rm -rf "$folder"
}

# by_pkgconfig COMPILER STANDARD LINKAGE: the modules have to be where pkg-config looks, the library where the loader does.
by_pkgconfig() {
    local compiler=$1 standard=$2 module=zarnmath folder flags
    # GCC 12 and Clang 14 know C++23 by the name of the draft.
    [ "$standard" = 20 ] || standard=2b
    [ "$3" = Shared ] || module=zarnmath-static
    folder=$(outside_folder)
    (
        cd "$folder"
        flags=$(pkg-config --cflags --libs "$module")
        # shellcheck disable=SC2046,SC2086 # one word for each flag is what is wanted
        quietly "$compiler" "-std=c++$standard" "-DSTANDARD=$2" -O2 $(newer_processor) -I. CallerMain.cpp \
            tests/library/OutsideCaller.cpp $flags -o caller
        # A program in C that the C compiler links needs the C++ library of the archive by name.
        flags=$(pkg-config --static --cflags --libs "$module")
        # shellcheck disable=SC2086
        quietly "$(c_compiler "$compiler")" -std=c99 -Wall -Wextra -Wpedantic -Werror PlainCTest.c $flags -o plain
        quietly ./caller
        quietly ./plain
    )
    rm -rf "$folder"
}

# headers_alone COMPILER STANDARD PREFIX: each installed header can come first, and be included twice.
headers_alone() {
    local compiler=$1 standard=$2 include=$3/include header
    [ "$standard" = 20 ] || standard=2b
    for header in $(cd "$include" && find . -name '*.h' | sort); do
        printf '#include "%s"\n#include "%s"\n' "${header#./}" "${header#./}" >"$work/alone.cpp"
        quietly "$compiler" "-std=c++$standard" -fsyntax-only -Wall -Wextra -Wpedantic -Wconversion -Wshadow \
            -Wold-style-cast -Werror -I"$include" "$work/alone.cpp"
    done
}

# What find_package has to refuse: another version, a component that there is not.
refusals() {
    local folder=$work/refused request
    mkdir -p "$folder"
    for request in "1.0" "0.2" "0.0" "0.1.1" "0.1 COMPONENTS Framework" "0.1 COMPONENTS Shared Other"; do
        printf 'cmake_minimum_required(VERSION 3.25)\nproject(Refused LANGUAGES NONE)\nfind_package(ZarnMath %s REQUIRED)\n' \
            "$request" >"$folder/CMakeLists.txt"
        refused 'compatible with requested version\|no component' cmake -S "$folder" -B "$folder/build" -DCMAKE_PREFIX_PATH="$1"
    done
    passed "find_package refuses other versions and unknown components"
}

try_installed() {
    local compiler=$1 copy=$build/$1/copy standard linkage
    rm -rf "$copy"
    quietly cmake -S "$sources" -B "$build/$compiler" -G Ninja -DCMAKE_BUILD_TYPE=Release -DZARNMATH_BUILD_TESTS=OFF \
        -DZARNMATH_BUILD_EXAMPLES=OFF -DCMAKE_CXX_COMPILER="$compiler"
    quietly cmake --build "$build/$compiler"
    quietly cmake --install "$build/$compiler" --prefix "$work/first"
    # What is installed can be moved.
    mv "$work/first" "$copy"
    if find "$copy" -name '*Internal.h' -o -name 'RootFinder.h' -o -name 'SmallMatrix.h' | grep .; then
        echo "package: what is inside the library was installed" >&2
        exit 1
    fi
    for standard in 20 23; do
        headers_alone "$compiler" "$standard" "$copy"
        passed "$compiler, C++$standard: each header alone"
        for linkage in Shared Static; do
            by_cmake "$compiler" "$standard" "$linkage" -DCMAKE_PREFIX_PATH="$copy"
            passed "$compiler, C++$standard, $linkage: find_package"
            PKG_CONFIG_PATH=$copy/lib/pkgconfig LD_LIBRARY_PATH=$copy/lib by_pkgconfig "$compiler" "$standard" "$linkage"
            passed "$compiler, C++$standard, $linkage: pkg-config"
        done
        by_cmake "$compiler" "$standard" "Shared;Static" -DSOURCES="$sources"
        passed "$compiler, C++$standard, both: add_subdirectory"
    done
    echo '#include <ZarnMath/ZarnMath.h>' >"$work/old.cpp"
    refused 'are C++20' "$compiler" -std=c++17 -fsyntax-only -I"$copy/include" "$work/old.cpp"
    passed "$compiler: C++17 is told what is missing"
}

try_packages() {
    local copy
    quietly cmake --preset deb -S "$sources" -B "$build/deb"
    quietly cmake --build "$build/deb"
    rm -f "$build/deb/"*.deb
    quietly cpack --config "$build/deb/CPackConfig.cmake" -B "$build/deb"
    lintian --fail-on error,warning --allow-root "$build/deb/"*.deb
    passed "lintian has nothing to say"

    if [ "$(id -u)" = 0 ] && ! dpkg-query -W | grep -q '^libzarnmath'; then
        installed_packages=yes
        quietly dpkg --install "$build/deb/"*.deb
        local folder
        folder=$(outside_folder)
        by_pkgconfig g++ 20 Shared
        by_pkgconfig clang++ 23 Static
        by_cmake g++ 23 Static
        by_cmake clang++ 20 Shared
        passed "programs use the installed packages"
        # A program needs no more than the library to run.
        # shellcheck disable=SC2046
        quietly gcc -std=c99 "$folder/PlainCTest.c" $(pkg-config --cflags --libs zarnmath) -o "$folder/plain"
        quietly dpkg --purge libzarnmath-dev
        quietly "$folder/plain"
        quietly dpkg --purge "libzarnmath$version"
        installed_packages=
        refused libZarnMath "$folder/plain"
        passed "the packages are gone again"
    else
        copy=$build/deb/copy
        rm -rf "$copy"
        for package in "$build/deb/"*.deb; do
            quietly dpkg --extract "$package" "$copy"
        done
        local libraries
        libraries=$(dirname "$(find "$copy" -name 'libZarnMath.so')")
        PKG_CONFIG_PATH=$libraries/pkgconfig LD_LIBRARY_PATH=$libraries by_pkgconfig g++ 20 Shared
        by_cmake clang++ 23 Static -DCMAKE_PREFIX_PATH="$copy/usr"
        passed "programs use the unpacked packages"
    fi
}

for compiler in g++ clang++; do
    try_installed "$compiler"
done
refusals "$build/g++/copy"
try_packages
echo "package: $counted ways passed; the packages are in $build/deb"
