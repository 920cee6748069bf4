#!/usr/bin/env bash
# The editor's controls as a screen reader meets them: the editor runs with Qt's AT-SPI bridge on
# a private D-Bus session, and a walk of its accessible tree finds a name for every control.
#   accessibility.sh EDITOR
set -euo pipefail
editor=$1
here=$(cd "$(dirname "$0")" && pwd)
scratch=$(mktemp -d)
trap 'rm -rf "$scratch"' EXIT
mkdir -p "$scratch/home" "$scratch/run" "$scratch/user" "$scratch/system"
chmod 700 "$scratch/run"
printf '[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\n' >"$scratch/system/keyshortcutrc"
printf '[ShortCutKeys]\n' >"$scratch/user/keyshortcutrc"
export HOME=$scratch/home XDG_RUNTIME_DIR=$scratch/run XDG_CONFIG_HOME=$scratch/home/.config
export ZEM_USER_DIR=$scratch/user ZEM_SYSTEM_DIR=$scratch/system
export QT_LINUX_ACCESSIBILITY_ALWAYS_ON=1 QT_QPA_PLATFORM=xcb NO_AT_BRIDGE=0
exec dbus-run-session -- bash -c '
    "$1" >"$3/editor.log" 2>&1 &
    editor=$!
    status=0
    /usr/bin/python3 "$2" || status=$?
    kill "$editor" 2>/dev/null || true
    wait "$editor" 2>/dev/null || true
    exit "$status"' walk "$editor" "$here/atspi_names.py" "$scratch" 2> >(grep -v -e "^dbus-daemon" -e "SpiRegistry" >&2)
