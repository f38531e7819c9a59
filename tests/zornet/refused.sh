#!/usr/bin/env bash
# Runs of zornet in which one allocation is refused: refused.sh BUILD_FOLDER EXAMPLES. Each either ends as if nothing had
# been, or says that memory, or a module for want of it, cannot be had. The first allocations are refused one by one, of
# the later ones a sample.
set -u
build=$1 examples=$2
folder=$(mktemp -d)
trap 'rm -rf "$folder"' EXIT
faults=0

run() {
  # In a shell of its own, which tells of a signal where nobody reads it.
  (
    export REFUSED=$1 LD_PRELOAD=$build/bin/libRefuse.so
    "$build/bin/zornet" "${@:2}" >"$folder/out" 2>"$folder/err" 9>"$folder/refused"
    exit $?
  ) 2>/dev/null
}
without_times() { sed -E 's/[0-9.e-]+ ms|"milliseconds":[0-9.e-]+//' "$1"; }

judge() {
  local number=$1 code=$2
  case $code in
    "$expected") without_times "$folder/out" | cmp -s - "$folder/expected" && return ;;
    7) grep -q 'out of memory' "$folder/out" "$folder/err" && return ;;
    134) [ "$number" -lt 20 ] && grep -q bad_alloc "$folder/err" && return ;;  # before the program itself begins
    2 | 4) grep -qiE 'memory|not found|cannot (create|open) shared object' "$folder/out" "$folder/err" && return ;;
  esac
  echo "allocation $number refused: exit $code" "$(head -3 "$folder/err")" >&2
  faults=1
}

for arguments in "$examples/hello.szn" "-q --explain found $examples/clash.szn" \
  "--json-stream --solutions 5 $examples/shelves.szn"; do
  # shellcheck disable=SC2086  # arguments are words
  run 0 $arguments
  expected=$?
  without_times "$folder/out" >"$folder/expected"
  number=1
  while run "$number" $arguments; code=$?; [ -s "$folder/refused" ]; do
    judge "$number" "$code"
    number=$((number < 50 ? number + 1 : number + 37))
  done
  [ "$number" -gt 500 ] || { echo "hardly anything was refused: $number" >&2; faults=1; }
done
exit "$faults"
