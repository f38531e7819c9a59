#!/usr/bin/env bash
# The installed tree as its users meet it: install_test.sh BUILD_FOLDER PART. The flags of the build are in CXXFLAGS.
# The part named tree comes first, and find_package before opening, gdb and packages.
set -euo pipefail
build=$1
here=$(cd "$(dirname "$0")" && pwd)
scratch=$build/install-test
tree=${ZOR_TREE:-$scratch/tree}  # what is installed, by the part named tree or elsewhere

fail() { echo "$*" >&2; exit 1; }
fresh() { rm -rf "$1" && mkdir -p "$1"; }
narrow() { (cd / && "$1/bin/zornet" "$1/share/doc/zorvadstrings/examples/hello.szn"); }
add_consumer() { cmake --install "$scratch/consumer" --prefix "$1" >>"$scratch/install.log"; }
try_linked() { [[ $("$1") == *'"abcabove thirty-one characters"'* ]] || fail "$1: no concatenation"; }

# Moved after it was installed, so that whatever holds on to its first place is missed.
tree() {
  fresh "$scratch/first" && rm -rf "$tree"
  cmake --install "$build" --prefix "$scratch/first" >"$scratch/install.log"
  mv "$scratch/first" "$tree"
  # shellcheck disable=SC2016  # the loader expands it
  ! readelf -d "$tree"/bin/zornet "$tree"/lib/*.so | grep -E 'R(UN)?PATH' | grep -vE '\[\$ORIGIN(/\.\./lib)?\]' ||
    fail "run paths that lead out of the tree"
}

# Each public header is enough in itself.
headers() {
  local header
  cd "$tree/include/zorvadstrings"
  for header in */*.h; do
    # shellcheck disable=SC2086  # flags are words
    echo "#include \"$header\"" | "$CXX" -std=c++20 $CXXFLAGS -I. -fsyntax-only -x c++ - || fail "$header"
  done
}

find_package() {
  fresh "$scratch/consumer"
  cmake -S "$here/consumer" -B "$scratch/consumer" -DCMAKE_PREFIX_PATH="$tree" -DCMAKE_BUILD_TYPE=Debug
  cmake --build "$scratch/consumer"
  try_linked "$scratch/consumer/linked"
  add_consumer "$tree"
  try_linked "$tree/bin/linked"
  "$tree/bin/sharing"
  diff "$here/consumer/network.txt" <("$tree/bin/network")
}

pkg_config() {
  local flags
  flags=$(PKG_CONFIG_PATH=$tree/lib/pkgconfig pkg-config --cflags --libs zorvadstrings)
  # shellcheck disable=SC2086  # flags are words
  "$CXX" -std=c++20 $CXXFLAGS "$here/consumer/linked.cpp" $flags -o "$scratch/linked"
  try_linked "$scratch/linked"
}

# What does not fit does not link, and the message says why.
mismatch() {
  local flags told
  flags=$(PKG_CONFIG_PATH=$tree/lib/pkgconfig pkg-config --cflags --libs zorvadstrings)
  # shellcheck disable=SC2086  # flags are words
  ! told=$("$CXX" -std=c++20 $CXXFLAGS -D_GLIBCXX_DEBUG "$here/consumer/linked.cpp" $flags -o "$scratch/other" 2>&1) ||
    fail "the debug mode of the standard library is linked"
  [[ $told == *ZorIsNotBuiltForDebugModeOfLibstdcxx* ]] || fail "$told"
}

opening() { "$scratch/consumer/opening" "$tree/lib/libZORVadStrings.so"; }

zornet() { narrow "$tree"; }

# The protections of cmake/Hardening.cmake, in each file that runs.
hardening() {
  local file symbols called=""
  for file in "$tree"/bin/zornet "$tree"/lib/*.so; do
    [[ $(readelf -hW "$file") == *" DYN "* ]] || fail "$file: not at any place"
    [[ $(readelf -lW "$file") == *GNU_RELRO* && $(readelf -dW "$file") == *BIND_NOW* ]] || fail "$file: tables writable"
    symbols=$(nm -D "$file")
    [[ $symbols == *__stack_chk_fail* ]] || fail "$file: stacks unchecked"
    called+=$symbols
    # The start-up code marks two places where a jump may land.
    [[ $(uname -m) != x86_64 || $(objdump -d "$file" | grep -c endbr64) -gt 2 ]] || fail "$file: jumps unchecked"
  done
  [[ $called == *cpy_chk* ]] || fail "copies unchecked"
}

# Whether gdb shows what a program prints: shown_by_gdb PROGRAM GDB_OPTION...
shown_by_gdb() {
  local program=$1
  shift
  command gdb -nx -batch "$@" -x "$here/consumer/values.gdb" "$program" >"$scratch/gdb.log" 2>&1 ||
    { cat "$scratch/gdb.log" >&2; exit 1; }
  diff <("$program") <(sed -n 's/^(const ZOR[A-Za-z]* &) //p' "$scratch/gdb.log")
}

# The printers are found beside the library.
gdb() { shown_by_gdb "$scratch/consumer/linked" -iex "add-auto-load-safe-path $tree"; }

# Programs of others, with each compiler, standard and kind of type information that they may use.
deriving() {
  local compiler standard flag flags
  flags=$(PKG_CONFIG_PATH=$tree/lib/pkgconfig pkg-config --cflags --libs zorvadstrings)
  for compiler in g++ clang++-14; do
    for standard in c++20 c++2b; do
      for flag in -frtti -fno-rtti -fsanitize=undefined; do
        # shellcheck disable=SC2086  # flags are words
        "$compiler" -std=$standard $flag "$here/consumer/deriving.cpp" $flags -Wl,-rpath,"$tree/lib" \
          -o "$scratch/deriving" && "$scratch/deriving" || fail "$compiler -std=$standard $flag"
      done
    done
  done
}

# Runs a program of a root folder there: nothing else is to be seen, no /proc either. Where nobody may change the root,
# nothing but the libraries comes from there.
in_root() {
  local root=$1 libraries
  shift
  if chroot / true 2>/dev/null; then
    chroot "$root" "$@"
  elif unshare --map-root-user chroot / true 2>/dev/null; then
    unshare --map-root-user chroot "$root" "$@"
  else
    libraries=$(find "$root" -name '*.so*' -printf '%h\n' | sort -u | paste -sd:)
    # shellcheck disable=SC2211  # one file
    "$root"/lib*/ld-linux*.so.* --library-path "$libraries" "${@/#\//$root/}"
  fi
}

# The .deb with what it depends on, and a program that was built elsewhere.
clean_root() {
  dpkg-deb -x ./*.deb bare
  add_consumer "$PWD/bare/opt/app"
  ldd bare/usr/bin/zornet bare/usr/lib/lib*.so | tr -s '\t ' '\n' | grep -E '^/(usr/)?lib' | sort -u |
    xargs cp -L --parents -t bare
  in_root bare /usr/bin/zornet /usr/share/doc/zorvadstrings/examples/hello.szn
  in_root bare /opt/app/bin/sharing
  diff "$here/consumer/network.txt" <(in_root bare /opt/app/bin/network)
}

# What each shell offers behind "zornet --" are the options of the help.
offered_by_bash() {
  # shellcheck disable=SC1091  # not there before it is installed
  source "$tree/share/bash-completion/completions/zornet"
  COMP_WORDS=(zornet --) COMP_CWORD=1 _zornet zornet -- zornet
  printf '%s\n' "${COMPREPLY[@]}"
}
offered_by_zsh() {
  # shellcheck disable=SC2016  # zsh expands it
  zsh -fc '_arguments() { print -rl -- $@ }; source $1' zsh "$(find "$tree/share/zsh" -name _zornet)" |
    grep -oE '^(\([^)]*\)|\*)*--[a-z-]+' | grep -oE -- '--[a-z-]+$'
}
offered_by_fish() {
  fish --no-config -c "source $tree/share/fish/vendor_completions.d/zornet.fish; complete -C 'zornet --'" | cut -f1
}
completions() {
  local shell options
  options=$("$tree/bin/zornet" --help | grep -oE '^ +(-.,)?--[a-z-]+' | grep -oE -- '--[a-z-]+' | sort)
  for shell in bash zsh fish; do
    diff <(echo "$options") <("offered_by_$shell" | sort) || fail "$shell"
  done
}

# ./dev with nothing left to build, from another folder.
dev() {
  local command=$scratch/dev/dev tool
  fresh "$scratch/dev" && mkdir -p "$scratch/dev/build/package/bin"
  cp "$here/../../dev" "$command"
  ln -s "$here/../../examples" "$scratch/dev"
  ln -s "$build/bin/zornet" "$scratch/dev/build/package/bin"
  cp "$here/../../examples/clash.szn" "$scratch/own.szn"
  for tool in cmake ninja; do
    printf '#!/bin/sh\necho "ninja: no work to do."\n' >"$scratch/dev/$tool"
    chmod +x "$scratch/dev/$tool"
  done
  PATH=$scratch/dev:$PATH
  cd "$scratch"
  [[ $("$command" run --solutions 1) == *----------* ]] || fail "no example when no model is named"
  [[ $("$command" run -q --explain found own.szn || true) == *"own.szn:10: "* ]] || fail "the caller's file is not found"
  [[ $("$command" --help) == "usage: ./dev"* ]] || fail "no help"
  ! "$command" nonsense 2>/dev/null || fail "no such command"
}

packages() {
  fresh "$scratch/packages"
  cpack --config "$build/CPackConfig.cmake" -B "$scratch/packages" >"$scratch/cpack.log"
  cd "$scratch/packages"
  clean_root
  dpkg-deb -x ./*.ddeb bare
  LD_LIBRARY_PATH=$PWD/bare/usr/lib shown_by_gdb bare/opt/app/bin/linked \
    -iex "set debug-file-directory $PWD/bare/usr/lib/debug" \
    -x bare/usr/share/gdb/auto-load/usr/lib/libZORHost.so.*-gdb.py
  [[ $(dpkg-deb -f ./*.deb Depends) == *libstdc++6* ]] || fail "the .deb does not tell what it needs"
  [[ $(zcat bare/usr/share/doc/zorvadstrings/changelog.gz) == "zorvadstrings ($(dpkg-deb -f ./*.deb Version))"* ]] ||
    fail "CHANGELOG.md does not begin with this version"
  mkdir archive && tar -C archive --strip-components=1 -xf ./*.tar.gz
  narrow "$PWD/archive"
}

lintian() { command lintian --allow-root --fail-on error,warning "$scratch"/packages/*.deb; }

"$2"
