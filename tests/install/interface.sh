#!/usr/bin/env bash
# What the libraries show to others, compared with what is written down:
#   interface.sh check|renew names|abi FOLDER     FOLDER holds the built libraries
# names: the symbols of each library in exports.txt of its folder, those of inline members too.
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

# Left out is what a compiler keeps or not: the constants of classes, and the constructors, destructors and assignments
# that it makes by itself.
names() {
  nm -D --defined-only "$folder/lib$1.so" |
    awk '$2 ~ /[VRu]/ && $3 !~ /^_ZT/ { next }
         $2 == "W" && $3 ~ /([CD][0-2]E(v|OS[0-9_]*|RKS[0-9_]*)$|CI[12]|aSE)/ { next }
         { print $3 }' | c++filt | sort -u
}

# Type information is for others: the host and the module neither ask for it nor throw.
plain() {
  [[ $1 == ZORNetwork ]] || ! nm -D --undefined-only "$folder/lib$1.so" | grep -E '__dynamic_cast|__cxa_(throw|bad)'
}

check_names() { plain "$1" && diff "$2/exports.txt" <(names "$1") || fail "$1"; }
renew_names() { names "$1" >"$2/exports.txt"; }

check_abi() { abidiff --no-unreferenced-symbols "${options[@]}" "abi/$1.abi" "$2" || fail "$1"; }
renew_abi() {
  abidw "${options[@]}" --type-id-style hash --no-corpus-path --no-comp-dir-path --no-show-locs --no-parameter-names \
    --no-write-default-sizes "$2" | sed "s|path='$PWD/|path='|" >"abi/$1.abi"
}

case "$part" in
  names)
    "${action}_names" ZORHost host
    "${action}_names" ZORVadStrings module
    "${action}_names" ZORNetwork network
    ;;
  abi)
    command -v abidiff >/dev/null || exit 77
    options=(--exported-interfaces-only --suppressions tests/install/standard.abignore)
    for library in ZORHost ZORNetwork ZORVadStrings; do
      "${action}_abi" "$library" "$folder/lib$library.so"
    done
    ;;
esac
