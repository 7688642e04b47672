#!/usr/bin/env bash
# Builds the Debian packages and the tarball (the "package" workflow preset, with
# the compiler and linker flags Debian builds its packages with), checks the
# packages with lintian, unpacks them into a throwaway root with dpkg-deb -x and
# runs install_and_consume.sh against that root. Nothing is installed on the
# machine.
#
#   tests/install/package_and_consume.sh
#
# Needs dpkg-dev, lintian, file and binutils; man-db for the manual page check.
set -euo pipefail

root=$(cd "$(dirname "$0")/../.." && pwd)
build=$root/build/package
cd "$root"
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT

fail() {
  echo "package test: $*" >&2
  exit 1
}

# Hardened as Debian's own packages are (the hardening-* tags of lintian).
export DEB_BUILD_MAINT_OPTIONS=hardening=+all
CXXFLAGS="$(dpkg-buildflags --get CXXFLAGS) $(dpkg-buildflags --get CPPFLAGS)" \
  LDFLAGS="$(dpkg-buildflags --get LDFLAGS)" \
  cmake --workflow --preset package --fresh >"$work/workflow.log" 2>&1 ||
  { cat "$work/workflow.log" >&2; fail "the package workflow failed"; }

version=$(sed -n 's/^project(datetimelib VERSION \([0-9.]*\).*/\1/p' CMakeLists.txt)
arch=$(dpkg --print-architecture)
soname=$(objdump -p "$build"/libdatetimelib.so | awk '$1 == "SONAME" { print $2 }')
runtime=lib${soname#lib}
runtime=${runtime/.so./}  # libdatetimelib.so.0.1 -> libdatetimelib0.1
packages=("$runtime" libdatetimelib-dev adtime)
debs=()
for package in "${packages[@]}"; do
  deb=$build/${package}_${version}_${arch}.deb
  [[ -f "$deb" ]] || fail "no package $deb"
  debs+=("$deb")
done
tarball=$build/datetimelib-$version-Linux.tar.gz
tar -tzf "$tarball" >"$work/tarball-contents"
grep -q "/libdatetimelib\.so\.$version$" "$work/tarball-contents" || fail "$tarball holds no library"
echo "ok: packages ${packages[*]} and ${tarball##*/} built"

# Warnings fail as errors do; a tag that stays is named in the README's
# "Packages" section with the reason, and suppressed here.
allowed_tags=""
status=0
lintian --fail-on error,warning --tag-display-limit 0 \
  ${allowed_tags:+--suppress-tags "$allowed_tags"} "${debs[@]}" >"$work/lintian" 2>&1 || status=$?
grep -v "running with root privileges is not recommended" "$work/lintian" || true
((status == 0)) || fail "lintian reports errors or warnings (above)"
echo "ok: lintian"

for deb in "${debs[@]}"; do
  dpkg-deb -x "$deb" "$work/root"
done
bash tests/install/install_and_consume.sh --prefix "$work/root/usr"
