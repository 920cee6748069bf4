#!/usr/bin/env bash
# Times `zem-hotkeys list` and `check` on a user's file of 10,000 entries (default) merged with
# a system file of 2,000, five runs each after a warm-up; prints the median.
#   bench/bench_cli.sh [BUILD_DIR] [ENTRIES]
set -euo pipefail
build=${1:-build-release}
entries=${2:-10000}
work=$(mktemp -d)
trap 'rm -rf "$work"' EXIT
mkdir -p "$work/user" "$work/system"
generate() { # entries, offset
    awk -v n="$1" -v o="$2" 'BEGIN {
        print "[ShortCutKeys]";
        split("Ctrl| Alt| Super| Ctrl|Alt| Ctrl|Shift| Alt|Shift| Ctrl|Super|", mods, " ");
        for (i = o; i < o + n; i++) {
            key = mods[i % 7 + 1] "F" (i % 35 + 1) "|x" i;  # unreadable keys too, as in real files
            if (i % 3 == 0) key = mods[i % 7 + 1] sprintf("%c", 97 + i % 26);
            if (i % 2) print key "=ZEMWM_CLOSE"; else print key "=\"sh -c true " i "\"";
        }
    }'
}
generate "$entries" 0 >"$work/user/keyshortcutrc"
generate $((entries / 5)) $((entries - entries / 10)) >"$work/system/keyshortcutrc"
export ZEM_USER_DIR="$work/user" ZEM_SYSTEM_DIR="$work/system"
for command in list check; do
    times=()
    for run in 0 1 2 3 4 5; do
        start=$(date +%s%N)
        "$build/src/zem-hotkeys" "$command" >/dev/null || true
        end=$(date +%s%N)
        [ "$run" -gt 0 ] && times+=($(((end - start) / 1000000)))
    done
    sorted=($(printf '%s\n' "${times[@]}" | sort -n))
    echo "zem-hotkeys $command, $entries + $((entries / 5)) entries: median ${sorted[2]} ms (runs: ${times[*]} ms)"
done
