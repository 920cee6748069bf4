#!/usr/bin/env bash
# Installs the build into a temporary prefix, and into a staged /usr, and runs the installed
# programs from there: they must find their own system file, and everything must be in place.
#   install.sh BUILD_DIR
set -euo pipefail
build=$1
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
fail() { echo "install: $*" >&2; exit 1; }

prefix="$work/prefix with blank"
cmake --install "$build" --prefix "$prefix" >/dev/null
for file in bin/zem-admin-hotkeys bin/zem-hotkeys etc/zem/keyshortcutrc \
    share/applications/zem-admin-hotkeys.desktop share/icons/hicolor/scalable/apps/zem-admin-hotkeys.svg \
    share/icons/hicolor/48x48/apps/zem-admin-hotkeys.png share/man/man1/zem-admin-hotkeys.1 \
    share/man/man1/zem-hotkeys.1 share/zem-admin-hotkeys/translations/zem-admin-hotkeys_de.qm; do
    [ -f "$prefix/$file" ] || fail "$file is missing"
done
desktop-file-validate "$prefix/share/applications/zem-admin-hotkeys.desktop" || fail "the desktop entry does not validate"
version=$(env -u DISPLAY "$prefix/bin/zem-admin-hotkeys" --version)
[ "$version" = "zem-admin-hotkeys 2.8.16" ] || fail "--version said: $version"

# Moved after installing, the programs still find the system file beside them.
mv "$prefix" "$work/moved"
mkdir "$work/user"
listed=$(env -u DISPLAY -u ZEM_SYSTEM_DIR ZEM_USER_DIR="$work/user" "$work/moved/bin/zem-hotkeys" list)
grep -q "^Super|space	ZEMWM_TOGGLE_KB	system$" <<<"$listed" || fail "the installed system file was not found"
said=$(LC_ALL=de_DE.UTF-8 LANG=de_DE.UTF-8 ZEM_USER_DIR="$work/user" "$work/moved/bin/zem-hotkeys" unset Ctrl+Alt+Q 2>&1 || true)
[ "$said" = "zem-hotkeys: kein Kürzel belegt Ctrl+Alt+Q" ] || fail "the installed translation was not used: $said"

# A /usr install puts the system file in /etc.
DESTDIR="$work/stage" cmake --install "$build" --prefix /usr >/dev/null
[ -f "$work/stage/etc/zem/keyshortcutrc" ] || fail "a /usr install did not put the system file in /etc"
[ -f "$work/stage/usr/bin/zem-admin-hotkeys" ] || fail "DESTDIR was not honoured"
echo "install: 1 passed, 0 failed"
