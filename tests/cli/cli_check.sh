# What the command-line test scripts share; sourced after sxnedit, here and data are set.
# Each script gets a temporary folder, removed at its end, and a configuration directory of
# its own there.
work="$(mktemp -d)"
trap 'rm -rf "$work"' EXIT
# Settings files (NEDIT.INI) go to a configuration directory of the test's own.
export SXNEDIT_CONFIG="$work/config"
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

# expected FILE: the expected text with @WORK@ standing for the temporary folder.
expected() { sed "s|@WORK@|$work|g" "$here/expected/$1" >"$work/expected-$1" && echo "$work/expected-$1"; }

# finish NAME: the summary line, and the exit status of the script.
finish() {
    echo "$1: $passed passed, $failed failed"
    [ "$failed" -eq 0 ]
}
