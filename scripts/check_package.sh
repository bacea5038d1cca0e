#!/usr/bin/env bash
# check_package.sh PACKAGE.deb: installs it into an empty root, describes a movie and builds a module
# with what lies there, removes it, and looks for what is left. Its dependencies are those of this machine.
set -euo pipefail
package=$(realpath "$1")
root=$(mktemp -d)
export XDG_CONFIG_HOME=$root/none
trap 'rm -rf "$root"' EXIT
fail() { printf 'check_package: %s\n' "$*" >&2; exit 1; }

mkdir -p "$root/var/lib/dpkg/"{info,updates,triggers}
touch "$root/var/lib/dpkg/"{status,available}
packages() {
  dpkg --root="$root" --force-not-root --force-depends --log=/dev/null "$@" >"$root.log" 2>&1 \
    || { cat "$root.log" >&2; fail "dpkg $* failed"; }
  rm -f "$root.log"
}
things() { (cd "$root" && find . -path ./var/lib/dpkg -prune -o -print | sort); }
before=$(things)
packages --install "$package"

program=$root/usr/bin/cliphost
"$program" --version >/dev/null || fail "the program does not start"
ffmpeg -v error -f lavfi -i testsrc2=size=64x48:rate=25 -frames:v 5 -c:v mjpeg "$root/clip.mov"
"$program" describe -q "$root/clip.mov" --aaf "$root/clip.aaf" >/dev/null || fail "describe failed"
"$program" dump "$root/clip.aaf" | grep 'mob 3: SourceMob' >/dev/null || fail "the description is not whole"
rm "$root/clip.mov" "$root/clip.aaf"

for file in usr/share/man/man1/cliphost.1 usr/share/man/man1/cliphost-describe.1 \
            usr/share/bash-completion/completions/cliphost \
            usr/share/zsh/vendor-completions/_cliphost \
            usr/share/fish/vendor_completions.d/cliphost.fish \
            usr/share/doc/cliphost/docs/cliphost.toml usr/share/doc/cliphost/copyright; do
  [ -s "$root/$file" ] || fail "$file is missing"
done
bash -n "$root/usr/share/bash-completion/completions/cliphost" || fail "bash does not read its completion"
if command -v groff >/dev/null; then
  for page in "$root"/usr/share/man/man1/*.1; do
    said=$(groff -man -Tutf8 -ww "$page" 2>&1 >/dev/null)
    [ -z "$said" ] || fail "groff of ${page##*/}: $said"
  done
fi

unit='lib/systemd/system/cliphost-watch@.service'
[ -s "$root/usr/$unit" ] || fail "$unit is missing"
if command -v systemd-analyze >/dev/null; then
  # With the program of the empty root, and without a folder that is to be mounted.
  sed "s#/usr/bin/cliphost#$program#; /^RequiresMountsFor/d" "$root/usr/$unit" >"$root/cliphost-watch@in.service"
  said=$(systemd-analyze verify --man=no "$root/cliphost-watch@in.service" 2>&1) || fail "systemd: $said"
  [ -z "$said" ] || fail "systemd: $said"
  rm "$root/cliphost-watch@in.service"
fi

# A header alone, as a module of another maker would have it.
flags=$(PKG_CONFIG_PATH=$root/usr/share/pkgconfig pkg-config --cflags host_interfaces)
cd "$root"  # where no other headers are
printf '#include "host_interfaces/framework/PluginEntry.h"\n' \
  | g++ -std=c++17 -fsyntax-only $flags -x c++ - || fail "the headers do not compile"

# The module to begin with, as whoever has the package alone builds and checks it.
example=$root/usr/share/doc/cliphost/examples/minimal_module
[ "$(wc -l <"$example/MinimalModule.cpp")" -lt 200 ] || fail "the minimal module has 200 lines or more"
cp -r "$example" "$root/mine"
{ PKG_CONFIG_PATH=$root/usr/share/pkgconfig cmake -S "$root/mine" -B "$root/mine/build" \
    && cmake --build "$root/mine/build"; } >"$root/mine/log" 2>&1 \
  || { cat "$root/mine/log" >&2; fail "the minimal module can't be built"; }
"$program" validate "$root/mine/build/examples/MinimalModule.nvx" --seed 1 >"$root/mine/log" \
  || { grep -vE '^(passed|skipped)|^ +because ' "$root/mine/log" >&2; fail "the minimal module is not right"; }
rm -r "$root/mine"

packages --purge cliphost
left=$(comm -13 <(printf '%s\n' "$before") <(things))
[ -z "$left" ] || fail "the package leaves $left"
printf 'the package installs, describes a movie, builds a module, and leaves nothing when removed\n'
