# shellcheck shell=bash
# SPDX-License-Identifier: Apache-2.0
# What the checks of the Debian packages share. To be sourced at the top of the sources.
say() { printf '\n== %s\n' "$*"; }
fail() { echo "${0##*/}: $*" >&2; exit 1; }

version=$(sed -n '1s/.*(\(.*\)-.*/\1/p' debian/changelog)

# unpack_sources FOLDER: the committed ones, as dpkg-buildpackage wants them; they are in FOLDER/kelvasi-VERSION.
unpack_sources() {
  git archive --prefix="kelvasi-$version/" HEAD ':!debian' | xz -1 >"$1/kelvasi_$version.orig.tar.xz"
  git archive --prefix="kelvasi-$version/" HEAD | tar -x -C "$1"
}

# quietly LOG COMMAND...: what it says is shown only when it fails.
quietly() {
  local log=$1
  shift
  "$@" >>"$log" 2>&1 || { tail -n 40 "$log" >&2; fail "this failed: $*"; }
}

mirror() {
  awk '$1 == "URIs:" {print $2; exit} $1 == "deb" {print $(NF - 2); exit}' /etc/apt/sources.list.d/debian.sources \
    /etc/apt/sources.list 2>/dev/null
}

# make_root FOLDER LOG: a Debian 12 to change into, with this machine's settings of apt.
make_root() {
  root=$1
  quietly "$2" debootstrap --variant=minbase bookworm "$root" "$(mirror)"
  cp /etc/apt/apt.conf.d/* "$root/etc/apt/apt.conf.d/" 2>/dev/null || true
  trap 'umount "$root/proc" 2>/dev/null || true' EXIT
  mount -t proc proc "$root/proc"
  quietly "$2" inside apt-get update
}

inside() { chroot "$root" env DEBIAN_FRONTEND=noninteractive LC_ALL=C.UTF-8 PATH=/usr/sbin:/usr/bin:/sbin:/bin "$@"; }
