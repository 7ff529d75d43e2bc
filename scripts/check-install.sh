#!/usr/bin/env bash
# usage: scripts/check-install.sh BUILD_DIR WORK_DIR
# Installs a built tree into WORK_DIR/prefix and builds two tiny consumers against the installed
# copy only: a CMake project using find_package(OESDK) + OESDK::oesdk, and a plain g++ compile with
# the flags from pkg-config. Both programs are run. WORK_DIR is emptied first.
set -euo pipefail

build=$(cd "$1" && pwd)
work=$2
rm -rf "$work"
mkdir -p "$work/consumer"
work=$(cd "$work" && pwd)
prefix=$work/prefix

cmake --install "$build" --prefix "$prefix" >"$work/install.log"
echo "installed $(find "$prefix" -type f | wc -l) files into $prefix"

# The consumer looks a tag up through the installed headers and library.
cat >"$work/consumer/main.cpp" <<'EOF'
#include "oesdk.h"

#include <cstdio>

int main() {
    unsigned long thread = OEPlatform::CurrentThreadId();
    OEAttachThread(thread);
    OETagID id = OETAG_NONE;
    OETagDictionary* dictionary = OETagDictionary::TheOETagDictionary();
    bool found = dictionary && dictionary->GetTagID("STMTTRNRS", 9, &id, OECaseSensitive);
    OEDetachThread(thread);
    std::printf("consumer: STMTTRNRS = %u (library %s)\n", static_cast<unsigned>(id), OESDK_VERSION_STRING);
    return found && id == OETAG_STMTTRNRS ? 0 : 1;
}
EOF
cat >"$work/consumer/CMakeLists.txt" <<'EOF'
cmake_minimum_required(VERSION 3.16)
project(oesdk_consumer LANGUAGES CXX)
set(CMAKE_CXX_STANDARD 17)
find_package(OESDK 0.1 REQUIRED CONFIG)
add_executable(consumer main.cpp)
target_compile_options(consumer PRIVATE -Wall -Wextra -Werror)
target_link_libraries(consumer PRIVATE OESDK::oesdk)
EOF
if ! { cmake -S "$work/consumer" -B "$work/consumer-build" -G Ninja -DCMAKE_PREFIX_PATH="$prefix" \
  -DCMAKE_FIND_PACKAGE_NO_PACKAGE_REGISTRY=ON && cmake --build "$work/consumer-build"; } >"$work/consumer.log" 2>&1; then
  cat "$work/consumer.log"
  echo "check-install: the find_package consumer did not build" >&2
  exit 1
fi
"$work/consumer-build/consumer"

# pkg-config: a file that only includes the umbrella header must compile and link as it stands.
pcdir=$(dirname "$(find "$prefix" -name oesdk.pc -print -quit)")
flags=$(PKG_CONFIG_PATH=$pcdir pkg-config --cflags --libs oesdk)
printf '#include "oesdk.h"\nint main() { return 0; }\n' >"$work/include-only.cpp"
# shellcheck disable=SC2086 # the flags are a word list
g++ -std=c++17 -Wall -Wextra -Werror "$work/include-only.cpp" $flags -o "$work/include-only"
LD_LIBRARY_PATH=$(PKG_CONFIG_PATH=$pcdir pkg-config --variable=libdir oesdk) "$work/include-only"
echo "pkg-config consumer: g++ $flags: built and ran"

# The installed command-line tool runs from the installation as it stands.
tool=$prefix/bin/oesdk
if [ -x "$tool" ]; then
  id=$("$tool" tag STMTTRNRS)
  [[ $id =~ ^[0-9]+$ ]] || { echo "check-install: installed oesdk tag STMTTRNRS printed '$id'" >&2; exit 1; }
  echo "installed tool: oesdk tag STMTTRNRS = $id"
fi
