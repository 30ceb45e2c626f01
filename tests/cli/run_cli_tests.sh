#!/usr/bin/env bash
# Runs the sxnedit program as a user would and compares what it prints, whole, with the
# expected text under expected/. Usage: run_cli_tests.sh PATH/TO/sxnedit CLI_TEST_DIR
set -u
sxnedit="$1"
here="$2"
data="$here/../data"
work="$(mktemp -d)"
trap 'rm -rf "$work"' EXIT
passed=0
failed=0

# check NAME EXPECTED_STATUS EXPECTED_STDOUT_FILE EXPECTED_STDERR_TEXT -- COMMAND...
check() {
    local name="$1" want_status="$2" want_out="$3" want_err="$4"
    shift 5
    "$@" >"$work/out" 2>"$work/err"
    local status=$?
    local ok=1
    if [ "$status" -ne "$want_status" ]; then
        echo "FAIL $name: exit status $status, expected $want_status"; ok=0
    fi
    if [ -n "$want_out" ] && ! diff -u "$want_out" "$work/out" >"$work/diff"; then
        echo "FAIL $name: standard output differs"; cat "$work/diff"; ok=0
    fi
    if [ -n "$want_err" ] && [ "$(cat "$work/err")" != "$want_err" ]; then
        echo "FAIL $name: standard error was '$(cat "$work/err")', expected '$want_err'"; ok=0
    fi
    if [ "$ok" -eq 1 ]; then passed=$((passed + 1)); else failed=$((failed + 1)); fi
}

check rows-lowercase 0 "$here/expected/lowercase.rows" "" -- "$sxnedit" rows "$data/lowercase.neu"
check rows-missing 2 /dev/null "sxnedit: Failed to open $work/none.neu." -- "$sxnedit" rows "$work/none.neu"
printf '# FIELD BOOK\n#VERSION-1.0 NEUTRAL FILE\n' >"$work/noheader.neu"
check rows-no-header 2 /dev/null "sxnedit: Neutral file header not found." -- "$sxnedit" rows "$work/noheader.neu"
: >"$work/empty.neu"
check rows-empty 2 /dev/null "sxnedit: $work/empty.neu holds no records" -- "$sxnedit" rows "$work/empty.neu"
check rows-no-file 64 /dev/null "" -- "$sxnedit" rows
check unknown-command 64 /dev/null "sxnedit: unknown command 'frobnicate' (see sxnedit --help)" -- "$sxnedit" frobnicate
printf 'sxnedit %s\n' "$("$sxnedit" --version | cut -d' ' -f2)" >"$work/version"
check version 0 "$work/version" "" -- "$sxnedit" --version
"$sxnedit" --help >"$work/help"
grep -q '^Usage: sxnedit COMMAND' "$work/help" && grep -q 'rows FILE.neu' "$work/help" &&
    passed=$((passed + 1)) || { echo "FAIL help: usage text incomplete"; failed=$((failed + 1)); }

echo "cli: $passed passed, $failed failed"
[ "$failed" -eq 0 ]
