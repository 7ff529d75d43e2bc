#!/usr/bin/env bash
# Builds and runs the whole test suite three ways, each from scratch in its own build directory:
#   linux     native g++ Release; also builds the benchmarks and smoke-runs each one, checks that
#             liboesdk.so exports only OE_API symbols, and installs the tree and builds two tiny
#             consumers against the installation (find_package and pkg-config)
#   sanitize  native clang debug build (-O1, assertions on) with AddressSanitizer +
#             UndefinedBehaviorSanitizer, every report fatal, leak detection on
#   windows   the x86-64 DLL cross-built with MinGW-w64 (posix threads, static runtime); every test
#             executable runs under wine through ctest; checks the DLL's imports and exports
# All three build with -DOESDK_WERROR=ON. Missing Debian packages are installed first
# (scripts/setup-debian.sh).
#
# usage: scripts/test-all.sh [linux] [sanitize] [windows]     (no argument: all three)
# environment: OESDK_TEST_DIR  where the build trees go (default: build-all/ in the checkout)
#              JOBS            parallel compile and test jobs (default: number of cores)
#              OESDK_SKIP_SETUP=1   do not check the Debian packages
#
# The last line of the output is "N passed, N failed": the ctest results of all legs together. A step
# that fails outside ctest (configure, build, a check) counts as one failed test, so "0 failed" means
# everything ran and passed. The exit status is 0 exactly when nothing failed.
set -uo pipefail

root=$(cd "$(dirname "${BASH_SOURCE[0]}")/.." && pwd)
cd "$root" || exit 2
out=${OESDK_TEST_DIR:-$root/build-all}
jobs=${JOBS:-$(nproc)}
logs=$out/logs
t0=$SECONDS
passed=0
failed=0
timings=()
results=()

legs=("$@")
[ ${#legs[@]} -gt 0 ] || legs=(linux sanitize windows)
for leg in "${legs[@]}"; do
  case $leg in
  linux | sanitize | windows) ;;
  *)
    echo "usage: scripts/test-all.sh [linux] [sanitize] [windows]" >&2
    exit 2
    ;;
  esac
done

say() { printf '== [%4ds] %s\n' "$((SECONDS - t0))" "$*"; }

# cpu_now: sets CPU_NOW to the CPU seconds (user + system) used so far by the processes this script
# has waited for. Next to the wall time it shows whether a slow step was busy or waiting for a loaded
# machine. `times` has to run in this shell, not in a $(...) subshell.
cpu_now() {
  local user sys um us sm ss
  times >"$logs/.times"
  { read -r _ && read -r user sys; } <"$logs/.times" # line 2: the children, as 1m2.345s 0m0.678s
  um=${user%%m*} us=${user#*m} sm=${sys%%m*} ss=${sys#*m}
  us=${us%%.*} ss=${ss%%.*}
  CPU_NOW=$((10#$um * 60 + 10#$us + 10#$sm * 60 + 10#$ss))
}

# record NAME START_SECONDS START_CPU: one line of the closing table of step times.
record() {
  cpu_now
  timings+=("$(printf '%6ds %6ds  %s' "$((SECONDS - $2))" "$((CPU_NOW - $3))" "$1")")
}

# step NAME LOG CMD...: runs CMD, its output into the file LOG ("-": straight through), and records
# how long it took. A failing step prints its log and counts as one failure.
step() {
  local name=$1 logfile=$2 start=$SECONDS cpu rc=0
  cpu_now
  cpu=$CPU_NOW
  shift 2
  say "$name"
  if [ "$logfile" = - ]; then
    "$@" || rc=$?
  else
    "$@" >"$logfile" 2>&1 </dev/null || rc=$?
  fi
  record "$name" "$start" "$cpu"
  if [ $rc -ne 0 ]; then
    # Ninja's progress lines ("[12/80] Building ...") say nothing about the failure.
    [ "$logfile" = - ] || grep -Ev '^\[[0-9]+/[0-9]+\] ' "$logfile"
    say "FAILED: $name (exit status $rc)"
    failed=$((failed + 1))
    results+=("FAILED: $name")
    return 1
  fi
  say "$name: ok in $((SECONDS - start))s"
}

# run_ctest LEG BUILD_DIR: runs the leg's tests with ctest's own output and adds its summary up.
run_ctest() {
  local leg=$1 dir=$2 start=$SECONDS cpu rc=0 summary
  cpu_now
  cpu=$CPU_NOW
  say "$leg: test"
  ctest --test-dir "$dir" --output-on-failure --timeout 300 -j"$jobs" </dev/null 2>&1 |
    tee "$logs/$leg-ctest.log" || rc=$?
  record "$leg: test" "$start" "$cpu"
  summary=$(grep -E '^[0-9]+% tests passed, [0-9]+ tests? failed out of [0-9]+' "$logs/$leg-ctest.log" | tail -n 1)
  if [ -n "$summary" ]; then
    local f t
    f=$(sed -E 's/.* ([0-9]+) tests? failed out of ([0-9]+).*/\1/' <<<"$summary")
    t=$(sed -E 's/.* failed out of ([0-9]+).*/\1/' <<<"$summary")
    passed=$((passed + t - f))
    failed=$((failed + f))
    results+=("$leg: $((t - f)) passed, $f failed")
  elif [ $rc -eq 0 ] && grep -q 'No tests were found' "$logs/$leg-ctest.log"; then
    results+=("$leg: no tests")
  else
    failed=$((failed + 1))
    results+=("FAILED: $leg: ctest ended without a summary (exit status $rc)")
  fi
  say "$leg: test: done in $((SECONDS - start))s"
}

# fresh DIR: the leg's build directory, emptied.
fresh() {
  rm -rf "$1"
  mkdir -p "$1"
}

bench_smoke() {
  local dir=$1 exe n=0 rc=0
  for exe in "$dir"/bench_*; do
    if [ ! -f "$exe" ] || [ ! -x "$exe" ]; then continue; fi
    n=$((n + 1))
    if "$exe" --benchmark_min_time=0.01 >"$logs/$(basename "$exe").log" 2>&1 </dev/null; then
      echo "  $(basename "$exe"): ran"
    else
      cat "$logs/$(basename "$exe").log"
      echo "  $(basename "$exe"): FAILED"
      rc=1
    fi
  done
  echo "  $n benchmark executables"
  return $rc
}

leg_linux() {
  local b=$out/linux
  fresh "$b"
  step "linux: configure" "$logs/linux-configure.log" \
    cmake -S . -B "$b" -G Ninja -DCMAKE_BUILD_TYPE=Release -DOESDK_WERROR=ON -DOESDK_BUILD_BENCH=ON || return
  step "linux: build (-j$jobs)" "$logs/linux-build.log" cmake --build "$b" -j"$jobs" || return
  run_ctest linux "$b"
  step "linux: benchmark smoke run" - bench_smoke "$b"
  step "linux: export check (nm -DC)" - python3 scripts/check-exports.py so "$b/liboesdk.so"
  step "linux: install check" - scripts/check-install.sh "$b" "$out/install"
}

leg_sanitize() {
  local b=$out/sanitize cxx=${OESDK_SANITIZE_CXX:-clang++} symbolizer
  fresh "$b"
  step "sanitize: configure ($cxx)" "$logs/sanitize-configure.log" \
    env CXX="$cxx" cmake -S . -B "$b" -G Ninja -DCMAKE_BUILD_TYPE=Debug -DCMAKE_CXX_FLAGS_DEBUG="-O1 -g" \
    -DOESDK_WERROR=ON -DOESDK_SANITIZE=ON -DOESDK_BUILD_BENCH=OFF || return
  step "sanitize: source layout (clang-format)" - scripts/check-format.sh
  step "sanitize: build (-j$jobs)" "$logs/sanitize-build.log" cmake --build "$b" -j"$jobs" || return
  symbolizer=$(command -v llvm-symbolizer-14 || command -v llvm-symbolizer || true)
  # Every report ends the test with a failure; leaks are reported at exit.
  export ASAN_OPTIONS="detect_leaks=1:halt_on_error=1:abort_on_error=0:detect_stack_use_after_return=1:check_initialization_order=1:strict_init_order=1:strict_string_checks=1${symbolizer:+:external_symbolizer_path=$symbolizer}"
  export UBSAN_OPTIONS="halt_on_error=1:print_stacktrace=1${symbolizer:+:external_symbolizer_path=$symbolizer}"
  export LSAN_OPTIONS="report_objects=1"
  run_ctest sanitize "$b"
  unset ASAN_OPTIONS UBSAN_OPTIONS LSAN_OPTIONS
}

# Wine's prefix is made before anything runs under ctest, in this order: wineboot creates it,
# wineserver -w waits until wineboot's server has gone, then one persistent server and wine's helper
# processes are started here with their stdio away from ctest's pipes. Otherwise every test executable
# starts the helpers itself and ctest waits for them (seconds per test, or for good).
wine_prefix() {
  wineboot -i >/dev/null 2>&1 </dev/null || return
  wineserver -w || return
  wineserver -p >/dev/null 2>&1 </dev/null || return
  wine cmd /c exit >/dev/null 2>&1 </dev/null
}

stop_wine() {
  [ -n "${WINEPREFIX:-}" ] && wineserver -k >/dev/null 2>&1
  return 0
}

leg_windows() {
  local b=$out/windows
  export WINEPREFIX=$out/wineprefix WINEDEBUG=-all WINEDLLOVERRIDES="mscoree,mshtml="
  export HOME=${HOME:-/root}
  # A server still running for an old prefix has to go before the prefix is deleted.
  [ -d "$WINEPREFIX" ] && stop_wine
  rm -rf "$WINEPREFIX"
  trap stop_wine EXIT
  getent hosts localhost >/dev/null ||
    say "warning: 'localhost' does not resolve here (no /etc/hosts line?): HTTPS tests under wine will fail"
  fresh "$b"
  step "windows: wine prefix" - wine_prefix || return
  step "windows: configure (MinGW-w64 posix)" "$logs/windows-configure.log" \
    cmake -S . -B "$b" -G Ninja -DCMAKE_TOOLCHAIN_FILE=cmake/mingw-w64-x86_64.cmake \
    -DCMAKE_BUILD_TYPE=Release -DOESDK_WERROR=ON -DOESDK_BUILD_BENCH=OFF || return
  step "windows: build (-j$jobs)" "$logs/windows-build.log" cmake --build "$b" -j"$jobs" || return
  run_ctest windows "$b"
  step "windows: DLL imports and exports (objdump -p)" - python3 scripts/check-exports.py dll "$b/oesdk.dll"
  stop_wine
}

mkdir -p "$logs"
say "OESDK test-all: ${legs[*]} in $out, $jobs jobs"
if [ "${OESDK_SKIP_SETUP:-0}" != 1 ]; then
  step "packages" - "$root/scripts/setup-debian.sh"
fi
for leg in "${legs[@]}"; do
  "leg_$leg"
done

echo
echo "step times (wall, cpu):"
printf '%s\n' "${timings[@]}"
cpu_now
printf '%6ds %6ds  total\n' "$((SECONDS - t0))" "$CPU_NOW"
printf '%s\n' "${results[@]}"
echo "$passed passed, $failed failed"
[ "$failed" -eq 0 ]
