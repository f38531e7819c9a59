#!/usr/bin/env bash
# What the libraries show to others, compared with what is written down:
#   interface.sh check|renew names|abi FOLDER     FOLDER holds the built libraries
# names: the symbols of the module in module/exports.txt, of the network library in network/exports.txt. Inline members are left out: a compiler emits them or not.
# abi: classes, virtual tables and signatures in abi/, from debug information of g++ 12 on x86_64.
set -euo pipefail
action=$1 part=$2
folder=$(cd "$3" && pwd)
cd "$(dirname "$0")/../.."
export LC_ALL=C

fail() {
  echo "The interface of $1 has changed. If it was meant to: ./dev renew-interface" >&2
  exit 1
}

names() {
  nm -D --defined-only "$folder/lib$1.so" |
    awk '$2 !~ /[WVu]/ || $3 ~ /^_ZTV/ { print $3 }' | c++filt | sort -u
}

# Inline members and the classes of the standard library are not part of it.
suppress() {
  local kind
  for kind in function variable; do
    printf '[suppress_%s]\nsymbol_name_regexp = ^(%s)$\ndrop = yes\n' "$kind" \
      "$(nm -D --defined-only "$1" | awk '$2 ~ /[WVu]/ && $3 !~ /^_ZTV/ { print $3 }' | paste -sd '|')"
  done
  printf '[suppress_type]\nname_regexp = ^(std|__gnu_cxx)::\ndrop = yes\n'
}

check_names() { diff "$2/exports.txt" <(names "$1") || fail "$1"; }
renew_names() { names "$1" >"$2/exports.txt"; }

check_abi() { abidiff --no-unreferenced-symbols "${options[@]}" "abi/$1.abi" "$2" || fail "$1"; }
renew_abi() {
  abidw "${options[@]}" --type-id-style hash --no-corpus-path --no-comp-dir-path --no-show-locs --no-parameter-names \
    --no-write-default-sizes "$2" | sed "s|path='$PWD/|path='|" >"abi/$1.abi"
}

case "$part" in
  names)
    "${action}_names" ZORVadStrings module
    "${action}_names" ZORNetwork network
    ;;
  abi)
    command -v abidiff >/dev/null || exit 77
    scratch=$(mktemp)
    trap 'rm -f "$scratch"' EXIT
    options=(--exported-interfaces-only --suppressions "$scratch")
    for library in ZORHost ZORNetwork ZORVadStrings; do
      suppress "$folder/lib$library.so" >"$scratch"
      "${action}_abi" "$library" "$folder/lib$library.so"
    done
    ;;
esac
