#!/usr/bin/env bash
# The traverse commands as a user meets them: the routes of a file, the bundled example
# adjusted by the Compass rule, the same from a parameters file, and what they say of bad
# input. Usage: run_traverse_cli_tests.sh PATH/TO/sxnedit CLI_TEST_DIR
set -u
sxnedit="$1"
here="$2"
data="$here/../data"
example="$here/../../examples/boundary.neu"
. "$here/cli_check.sh"

# passes NAME -- CONDITION...: one test whose condition is a command.
passes() {
    local name="$1"
    shift 2
    if "$@"; then passed=$((passed + 1)); else echo "FAIL $name"; failed=$((failed + 1)); fi
}

printf 'A,B,C,\nA,B,C,S,\nA,B,C,A,\nA,B,E,F,\nA,B,E,F,B,\n' >"$work/routes.txt"
check routes 0 "$work/routes.txt" "" -- "$sxnedit" traverse routes "$data/traverse_routes.neu"
echo '{"routes": [["A", "B", "C"], ["A", "B", "C", "S"], ["A", "B", "C", "A"], ["A", "B", "E", "F"], ["A", "B", "E", "F", "B"]]}' >"$work/routes.json"
check routes-json 0 "$work/routes.json" "" -- "$sxnedit" traverse routes "$data/traverse_routes.neu" --json
check routes-missing 2 /dev/null "sxnedit: Failed to open $work/none.neu." -- "$sxnedit" traverse routes "$work/none.neu"

# The bundled example closed on its known start by the Compass rule, and its report.
flags=(--route A,B,C,D,A --start-coords 1000,2000,50 --fixed-coords 1000,2000,50)
check adjust-compass 0 "$here/expected/traverse_boundary_compass.txt" "" -- \
    "$sxnedit" traverse adjust "$example" "${flags[@]}"
"$sxnedit" traverse adjust "$example" "${flags[@]}" --report - >"$work/report.txt" 2>/dev/null
passes adjust-report -- grep -q 'Unadjusted traverse' "$work/report.txt"
passes adjust-report-blocks -- awk '/Unadjusted traverse/ { u = NR } /Coordinate Misclose/ && u { m = NR }
    /Results after coordinate adjustment \(Compass Rule\)/ && m { c = NR } /Adjusted sideshots/ && c { s = NR }
    END { exit !(u && m && c && s) }' "$work/report.txt"

# The same from a parameters file: two roads, one answer.
"$sxnedit" traverse adjust "$example" "${flags[@]}" --json >"$work/flags.json" 2>/dev/null
printf '{"route": ["A", "B", "C", "D", "A"], "StartX": 1000, "StartY": 2000, "StartZ": 50,\n "FixedX": 1000, "FixedY": 2000, "FixedZ": 50, "Transit": 0}\n' >"$work/p.json"
check adjust-params 0 "$work/flags.json" "" -- "$sxnedit" traverse adjust "$example" --params "$work/p.json" --json
passes adjust-json-result -- grep -q '"result": 11111' "$work/flags.json"
passes adjust-json-rule -- grep -q '"rule": "compass"' "$work/flags.json"
passes adjust-json-closes -- grep -q '"misclose": {"DiffE": 0, "DiffN": 0, .*"MiscloseDist": 0,' "$work/flags.json"

# A link traverse with an angle check at its end: the angles balanced first, then the Compass
# rule; C where tests/data/generate_traverse_surveys.py puts it by hand (E 1209.995597).
printf '{"route": ["A", "B", "C", "E"], "FixedPt": "E", "FixedX": 1300, "FixedY": 2080, "FixedZ": 52,\n "AdjustAngle": 1, "ChkPt": "F", "CloseBearing": 48.81407483, "AdjustAngles": 1}\n' >"$work/link.json"
"$sxnedit" traverse adjust "$data/traverse_link.neu" --params "$work/link.json" --json >"$work/link-out.json" 2>/dev/null
passes link-after-angles -- grep -q '"after_angles": {' "$work/link-out.json"
passes link-adjusted -- awk '/"adjusted": \{/ { a = 1 } a && /"id": "C"/ { exit !($0 ~ /"e": 1209\.9955(9[5-9]|60)/) }' "$work/link-out.json"
passes link-angle-told -- grep -q 'angle check on F, known bearing 48.814075' "$work/link-out.json"

# Left to the dialog, a loop closes on its start as re-observed: the messages say so.
"$sxnedit" traverse adjust "$example" --route A,B,C,D,A --json >"$work/default.json" 2>/dev/null
passes adjust-default-told -- grep -q 'so the traverse closes on itself and its misclose reads 0' "$work/default.json"
passes adjust-default-nothing -- grep -q '"adjusted": null' "$work/default.json"

# Bad input: the message, and no adjustment.
printf '{"route": ["A", "B"], "Fixed": 1}\n' >"$work/unknown.json"
check params-unknown 2 /dev/null "sxnedit: $work/unknown.json: no parameter is named \"Fixed\"" -- \
    "$sxnedit" traverse adjust "$example" --params "$work/unknown.json"
printf '{"FixedX": "east"}\n' >"$work/kind.json"
check params-kind 2 /dev/null "sxnedit: $work/kind.json: \"FixedX\" has a value of the wrong kind" -- \
    "$sxnedit" traverse adjust "$example" --params "$work/kind.json"
printf '[1, 2]\n' >"$work/array.json"
check params-not-object 2 /dev/null "sxnedit: $work/array.json is no JSON object" -- \
    "$sxnedit" traverse adjust "$example" --params "$work/array.json"
check params-and-flags 64 /dev/null "" -- "$sxnedit" traverse adjust "$example" --params "$work/p.json" --route A,B
check coords-bad 2 /dev/null "sxnedit: --fixed-coords wants E,N or E,N,H: '1000'" -- \
    "$sxnedit" traverse adjust "$example" --fixed-coords 1000
check json-and-report 64 /dev/null "" -- "$sxnedit" traverse adjust "$example" --json --report -
check one-name 1 /dev/null "sxnedit: Invalid or empty traverse route !" -- \
    "$sxnedit" traverse adjust "$example" --route A
check no-such-route 1 /dev/null "sxnedit: No route found runs A,P1,B; the routes are: A,B,C,D, A,B,C,D,A," -- \
    "$sxnedit" traverse adjust "$example" --route A,P1,B
"$sxnedit" traverse adjust "$data/traverse_routes.neu" --route A,B,E,F --json >"$work/back.json" 2>/dev/null
passes back-sights -- grep -q 'Backsight point C from Occupied point B is not the previous traverse point' "$work/back.json"
passes back-sights-result -- grep -q '"result": 22222' "$work/back.json"
"$sxnedit" traverse adjust "$example" --route A,B,C,D,A --fixed ZZZ --json >"$work/zzz.json" 2>/dev/null
passes fixed-unknown -- grep -q 'The fixed point ZZZ has no coordinates in the reduced data' "$work/zzz.json"

# Saving keeps the rows as they were: the adjustment puts nothing behind the marker.
"$sxnedit" rows "$example" >"$work/rows.neu"
check save 0 "" "" -- "$sxnedit" traverse adjust "$example" "${flags[@]}" --save "$work/saved.neu"
check save-rows 0 "$work/rows.neu" "" -- cat "$work/saved.neu"
cp "$example" "$work/in.neu"
check save-onto-input 1 /dev/null \
    "sxnedit: cannot write $work/in.neu: it is the same file as $work/in.neu, which this command reads" -- \
    "$sxnedit" traverse adjust "$work/in.neu" "${flags[@]}" --save "$work/in.neu"

# A stored document: adjusted, stored, and exported unchanged but for what saving writes.
"$sxnedit" job new "$work/site.job" >/dev/null
"$sxnedit" doc import "$work/site.job" "$example" --name LOT12 >/dev/null
check doc-traverse 0 "$here/expected/traverse_boundary_compass.txt" "" -- \
    "$sxnedit" doc traverse "$work/site.job" LOT12 "${flags[@]}"
"$sxnedit" doc export "$work/site.job" LOT12 "$work/exported.neu"
check doc-traverse-rows 0 "$work/rows.neu" "" -- cat "$work/exported.neu"
check doc-traverse-missing 1 /dev/null "sxnedit: the job has no document NONE" -- \
    "$sxnedit" doc traverse "$work/site.job" NONE "${flags[@]}"

finish traverse-cli
