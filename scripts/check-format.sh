#!/usr/bin/env bash
# Every C++ source and header the project tracks is laid out as .clang-format says (the generated
# tag table excepted). Prints the files that are not, and exits 1 when there is any.
set -euo pipefail
cd "$(dirname "$0")/.."
fmt=$(command -v clang-format-14 || command -v clang-format || true)
if [ -z "$fmt" ]; then
  echo "clang-format not found (Debian package clang-format)" >&2
  exit 1
fi
bad=0
while IFS= read -r f; do
  if ! "$fmt" --dry-run -Werror "$f" >/dev/null 2>&1; then
    echo "  not formatted: $f (clang-format -i $f)"
    bad=$((bad + 1))
  fi
done < <(git ls-files '*.h' '*.cpp' | grep -v '^OESDK/tags/oetagtable.cpp$')
echo "  $bad file(s) not formatted"
[ "$bad" -eq 0 ]
