#!/usr/bin/env bash
# Runs the sxnedit program as a user would and compares what it prints, whole, with the
# expected text under expected/. Usage: run_cli_tests.sh PATH/TO/sxnedit CLI_TEST_DIR
set -u
sxnedit="$1"
here="$2"
data="$here/../data"
. "$here/cli_check.sh"

check rows-lowercase 0 "$here/expected/lowercase.rows" "" -- "$sxnedit" rows "$data/lowercase.neu"
check rows-missing 2 /dev/null "sxnedit: Failed to open $work/none.neu." -- "$sxnedit" rows "$work/none.neu"
printf '# FIELD BOOK\n#VERSION-1.0 NEUTRAL FILE\n' >"$work/noheader.neu"
check rows-no-header 2 /dev/null "sxnedit: Neutral file header not found." -- "$sxnedit" rows "$work/noheader.neu"
: >"$work/empty.neu"
check rows-empty 2 /dev/null "sxnedit: $work/empty.neu holds no records" -- "$sxnedit" rows "$work/empty.neu"
check rows-no-file 64 /dev/null "" -- "$sxnedit" rows
check unknown-command 64 /dev/null "sxnedit: unknown command 'frobnicate' (see sxnedit --help)" -- "$sxnedit" frobnicate
# Jobs: a new job, an import with awkward names and a repeated name, listings, the export,
# and a second import of the export that must give back the same points.
job="$work/survey.job"
check job-new 0 "$(expected job-new.txt)" "" -- "$sxnedit" job new "$job"
printf 'name,east,north,height,code\r\nP1,100.5,200.25,10,FNC01\r\n"Zürich, ""A""",1,2,,TREE\r\nP1,101,201,,KB\r\nCTRL,0.1,0.2,-3.5,\r\n' >"$work/points.csv"
check job-import 0 "$(expected job-import.txt)" \
    "sxnedit: $work/points.csv line 4: point P1 repeats line 2; the later row is used" -- \
    "$sxnedit" job import-points "$job" "$work/points.csv"
check job-points 0 "$here/expected/job-points.txt" "" -- "$sxnedit" job points "$job"
check job-points-json 0 "$here/expected/job-points.json" "" -- "$sxnedit" job points "$job" --json
check job-export 0 "" "" -- "$sxnedit" job export-points "$job" "$work/export.csv"
check job-export-text 0 "$here/expected/job-export.csv" "" -- cat "$work/export.csv"
check job-new-again 0 "" "" -- "$sxnedit" job new "$work/copy.job"
check job-reimport 0 "" "" -- "$sxnedit" job import-points "$work/copy.job" "$work/export.csv"
check job-roundtrip 0 "$here/expected/job-points.json" "" -- "$sxnedit" job points "$work/copy.job" --json
check job-info 0 "$(expected job-info.txt)" "" -- "$sxnedit" job info "$job"
printf 'P7,1,2,3\nP8,1,x,2,KB\n' >"$work/bad.csv"
check job-import-text-number 2 /dev/null \
    "sxnedit: $work/bad.csv line 2: the north value \"x\" is not a number; nothing was imported" -- \
    "$sxnedit" job import-points "$job" "$work/bad.csv"
printf 'P7,1,2\n' >"$work/short.csv"
check job-import-missing-column 2 /dev/null \
    "sxnedit: $work/short.csv line 1: 3 columns where name,east,north,height,code are expected; nothing was imported" -- \
    "$sxnedit" job import-points "$job" "$work/short.csv"
check job-import-nothing 0 "$here/expected/job-points.txt" "" -- "$sxnedit" job points "$job"
check job-import-no-file 2 /dev/null "sxnedit: cannot read $work/none.csv" -- \
    "$sxnedit" job import-points "$job" "$work/none.csv"
check job-missing-folder 1 /dev/null \
    "sxnedit: Cannot create the job $work/gone/x.job: the folder $work/gone does not exist." -- \
    "$sxnedit" job new "$work/gone/x.job"
check job-not-a-job 1 /dev/null "sxnedit: $work/points.csv is not a job file." -- \
    "$sxnedit" job info "$work/points.csv"
check job-exists 1 /dev/null \
    "sxnedit: Cannot create the job $job: a file of that name exists." -- "$sxnedit" job new "$job"
check job-usage 64 /dev/null "" -- "$sxnedit" job points
printf 'sxnedit %s\n' "$("$sxnedit" --version | cut -d' ' -f2)" >"$work/version"
check version 0 "$work/version" "" -- "$sxnedit" --version
"$sxnedit" --help >"$work/help"
grep -q '^Usage: sxnedit COMMAND' "$work/help" && grep -q 'rows FILE.neu' "$work/help" &&
    passed=$((passed + 1)) || { echo "FAIL help: usage text incomplete"; failed=$((failed + 1)); }
# Every command has a help of its own, and a wrong command line is told with the usage of
# the command it was meant for.
"$sxnedit" doc import --help >"$work/help"
grep -q '^Usage: sxnedit doc import JOB FILE.neu \[OPTIONS\]$' "$work/help" && grep -q -- '--name NAME' "$work/help" &&
    passed=$((passed + 1)) || { echo "FAIL command-help: doc import --help incomplete"; failed=$((failed + 1)); }
check command-usage 64 /dev/null "sxnedit: reduce: --angles: rad not in {dms,deg,gon}
Usage: sxnedit reduce FILE.neu [OPTIONS]
Run 'sxnedit reduce --help' for more information." -- "$sxnedit" reduce "$work/none.neu" --angles rad
check group-usage 64 /dev/null "sxnedit: job: a command is needed
Usage: sxnedit job COMMAND [ARGUMENTS]
Run 'sxnedit job --help' for more information." -- "$sxnedit" job

# A closed traverse observed exactly from known coordinates: every reduced point lies within
# 0.001 of the coordinates it was generated from.
"$sxnedit" reduce "$data/closed_traverse.neu" --json >"$work/traverse.json" 2>"$work/err"
status=$?
far=$(awk -F'"' '
    NR == FNR { split($0, t, ","); e[t[1]] = t[2]; n[t[1]] = t[3]; h[t[1]] = t[4]; next }
    /"id":/ {
        id = $4
        match($0, /"e": [-0-9.e]+/); pe = substr($0, RSTART + 5, RLENGTH - 5)
        match($0, /"n": [-0-9.e]+/); pn = substr($0, RSTART + 5, RLENGTH - 5)
        match($0, /"h": [-0-9.e]+/); ph = substr($0, RSTART + 5, RLENGTH - 5)
        seen[id] = 1
        d = (pe - e[id]) ^ 2 + (pn - n[id]) ^ 2
        if (!(id in e) || d > 1e-6 || (ph - h[id]) ^ 2 > 1e-6) print id
    }
    END { for (id in e) if (!(id in seen)) print "missing " id }
' "$data/closed_traverse_truth.csv" "$work/traverse.json")
if [ "$status" -eq 0 ] && [ -z "$far" ] && grep -q '"error": 0' "$work/traverse.json"; then
    passed=$((passed + 1))
else
    echo "FAIL reduce-closed-traverse: status $status, points off: $far"; failed=$((failed + 1))
fi

printf '#VERSION-1.0 NEUTRAL FILE\nSTN ID=K\nSS ID=Q,HA=0,VA=90,SD=5,HT=0\n' >"$work/unknown.neu"
check reduce-unknown-station 0 "$here/expected/unknown_station.json" "" -- "$sxnedit" reduce "$work/unknown.neu" --json
"$sxnedit" job new "$work/site.job" >/dev/null
printf 'name,east,north,height,code\nK,300,400,20,CP\n' >"$work/control.csv"
"$sxnedit" job import-points "$work/site.job" "$work/control.csv" >/dev/null
check reduce-with-job 0 "$here/expected/job_station.json" "" -- "$sxnedit" reduce "$work/unknown.neu" --json --job "$work/site.job"
check reduce-missing-job 2 /dev/null "" -- "$sxnedit" reduce "$work/unknown.neu" --job "$work/nojob.job"
printf '#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\nSTN ID=A,HI=1.5\nXYZ ID=A,E=1000,N=2000,H=50\nBKB ID=B,BRG=45,HA=0\nSS ID=P1,HA=90,VA=90,SD=100,HT=1.5,CO=FC\n' >"$work/small.neu"
check reduce-report 0 "$here/expected/small_report.txt" "" -- "$sxnedit" reduce "$work/small.neu" --report - --columns ID,HA,SD,EC,NC,HC,CO --angles deg --lengths ft
cmp -s "$SXNEDIT_CONFIG/NEDIT.INI" "$here/../../data/NEDIT.INI" && passed=$((passed + 1)) ||
    { echo "FAIL nedit-ini-installed: the default NEDIT.INI was not installed"; failed=$((failed + 1)); }
check reduce-bad-columns 64 /dev/null "" -- "$sxnedit" reduce "$work/small.neu" --columns ID,XX
check reduce-bad-angles 64 /dev/null "" -- "$sxnedit" reduce "$work/small.neu" --angles rad
chmod 444 "$SXNEDIT_CONFIG/NEDIT.INI"
"$sxnedit" reduce "$work/small.neu" --report "$work/small.txt" >/dev/null 2>&1 && grep -q 'Occupied Station' "$work/small.txt" &&
    [ "$(stat -c %a "$SXNEDIT_CONFIG/NEDIT.INI")" = 444 ] && passed=$((passed + 1)) ||
    { echo "FAIL reduce-read-only-ini: no report or the file mode changed"; failed=$((failed + 1)); }
# A document imported, reduced and exported gives back its rows with the point that the run
# was given: the station nobody knew, at the entered values (0, 0, no height).
"$sxnedit" job new "$work/docs.job" >/dev/null
check doc-import 0 "" "" -- "$sxnedit" doc import "$work/docs.job" "$work/unknown.neu" --name "FIELD DAY"
check doc-list 0 "$here/expected/doc_list.txt" "" -- "$sxnedit" doc list "$work/docs.job"
"$sxnedit" doc reduce "$work/docs.job" "FIELD DAY" >/dev/null 2>&1
"$sxnedit" doc export "$work/docs.job" "FIELD DAY" "$work/exported.neu"
{ "$sxnedit" rows "$work/unknown.neu"; echo "XYZ       ID=K,E=0.000,N=0.000,H=-10000.000"; } >"$work/expected_rows"
check doc-round-trip 0 "$work/expected_rows" "" -- cat "$work/exported.neu"
check doc-rename-taken 1 /dev/null "sxnedit: the job has a document FIELD DAY already" -- "$sxnedit" doc rename "$work/docs.job" "FIELD DAY" "FIELD DAY"
check doc-delete-missing 1 /dev/null "sxnedit: the job has no document NONE" -- "$sxnedit" doc delete "$work/docs.job" NONE
check doc-usage 64 /dev/null "" -- "$sxnedit" doc export "$work/docs.job"
check reduce-missing 2 /dev/null "sxnedit: Failed to open $work/none.neu." -- "$sxnedit" reduce "$work/none.neu"
check reduce-no-file 64 /dev/null "" -- "$sxnedit" reduce --json

# One question, one answer: the JSON, the points file and the report give P1 where a hand
# calculation puts it. The back station B is known (E 1100, N 2000), so from A (E 1000,
# N 2000) the back bearing is 90, not the 45 of the BKB record; P1 at 90 + 90 = 180 and 100 m
# lies at E 1000, N 1900.
fixture="$data/back_station_overrules_bearing.neu"
from_json=$("$sxnedit" reduce "$fixture" --json |
    awk -F'[:,]' '/"id": "P1"/ { printf "%.3f %.3f", $4, $6 }')
"$sxnedit" reduce "$fixture" --points "$work/one.csv" >/dev/null
from_csv=$(awk -F, '$1 == "P1" { printf "%.3f %.3f", $2, $3 }' "$work/one.csv")
from_report=$("$sxnedit" reduce "$fixture" --report - --columns ID,EC,NC,HC |
    awk '$1 == "P1" { printf "%.3f %.3f", $2, $3 }')
if [ "$from_json" = "1000.000 1900.000" ] && [ "$from_csv" = "$from_json" ] && [ "$from_report" = "$from_json" ]; then
    passed=$((passed + 1))
else
    echo "FAIL one-answer: json '$from_json', points '$from_csv', report '$from_report'"; failed=$((failed + 1))
fi

# A station with 100 side shots fills pages of 66 lines (the default PAGELENGTH), each after
# the first beginning with a form feed.
{ printf '#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\nSTN ID=A,HI=1.5\nXYZ ID=A,E=0,N=0,H=0\nBKB ID=B,BRG=0,HA=0\n'
  for i in $(seq 1 100); do printf 'SS ID=S%d,HA=%d,VA=90,SD=10,HT=1.5\n' "$i" "$i"; done; } >"$work/hundred.neu"
"$sxnedit" reduce "$work/hundred.neu" --report - >"$work/hundred.txt" 2>/dev/null
pages=$(awk 'BEGIN { RS = "\f" } { n = split($0, lines, "\n"); if (n > 67) long++ } END { print NR, long + 0 }' "$work/hundred.txt")
[ "${pages#* }" = 0 ] && [ "${pages% *}" -ge 2 ] && passed=$((passed + 1)) ||
    { echo "FAIL report-pages: pages and pages too long: $pages"; failed=$((failed + 1)); }

# A scale of 1e308 overflows every distance: the points that come out as no finite numbers
# are named in the messages and left out of the JSON and the points file, and the run fails.
overflow="$data/scale_overflow.neu"
"$sxnedit" reduce "$overflow" --json >"$work/overflow.json" 2>"$work/err"
status=$?
"$sxnedit" reduce "$overflow" --points "$work/overflow.csv" >/dev/null 2>"$work/err-points"
points_status=$?
if [ "$status" -eq 1 ] && [ "$points_status" -eq 1 ] &&
    ! grep -qiwE 'inf|nan' "$work/overflow.json" && ! grep -qE '"(e|n)": null|"P[12]"' "$work/overflow.json" &&
    grep -q '"messages": \[".*not finite numbers (P1, P2)' "$work/overflow.json" &&
    grep -q '^A,1000,2000,50,$' "$work/overflow.csv" && ! grep -qiwE 'inf|nan' "$work/overflow.csv" &&
    grep -q 'P1, P2' "$work/err-points"; then
    passed=$((passed + 1))
else
    echo "FAIL non-finite: status $status/$points_status"; cat "$work/overflow.json" "$work/overflow.csv" "$work/err-points"
    failed=$((failed + 1))
fi

# An output never replaces an input of the same run, and a read-only file is never replaced.
# same NAME FILE -- COMMAND...: the command is refused with a message and FILE is unchanged.
same() {
    local name="$1" file="$2"
    shift 3
    cp "$file" "$work/before"
    "$@" >/dev/null 2>"$work/err"
    local status=$?
    if [ "$status" -eq 1 ] && grep -q "^sxnedit: cannot write " "$work/err" && cmp -s "$file" "$work/before"; then
        passed=$((passed + 1))
    else
        echo "FAIL $name: status $status, '$(cat "$work/err")', or $file changed"; failed=$((failed + 1))
    fi
}
cp "$work/small.neu" "$work/in.neu"
same doc-export-onto-job "$work/docs.job" -- "$sxnedit" doc export "$work/docs.job" "FIELD DAY" "$work/docs.job"
same export-points-onto-job "$work/site.job" -- "$sxnedit" job export-points "$work/site.job" "$work/site.job"
same report-onto-input "$work/in.neu" -- "$sxnedit" reduce "$work/in.neu" --report "$work/in.neu"
# A field file named DEBUG.DAT in the working directory would be removed by the reduction.
cp "$work/in.neu" "$work/DEBUG.DAT"
cd "$work"
check debug-dat-input-kept 1 /dev/null \
    "sxnedit: cannot read DEBUG.DAT: it is DEBUG.DAT of the working directory, which every reduction removes; give it another name or run from another folder" -- \
    "$sxnedit" reduce DEBUG.DAT
cd - >/dev/null
[ -f "$work/DEBUG.DAT" ] && passed=$((passed + 1)) || { echo "FAIL debug-dat-kept"; failed=$((failed + 1)); }
same points-onto-input "$work/in.neu" -- "$sxnedit" reduce "$work/in.neu" --points "$work/in.neu"
ln -s in.neu "$work/link.neu"
same points-onto-link-to-input "$work/in.neu" -- "$sxnedit" reduce "$work/link.neu" --points "$work/in.neu"
same points-onto-job "$work/site.job" -- "$sxnedit" reduce "$work/in.neu" --job "$work/site.job" --points "$work/site.job"
same doc-report-onto-job "$work/docs.job" -- "$sxnedit" doc reduce "$work/docs.job" "FIELD DAY" --report "$work/docs.job"
echo kept >"$work/kept.csv" && chmod 444 "$work/kept.csv"
same points-onto-read-only "$work/kept.csv" -- "$sxnedit" reduce "$work/in.neu" --points "$work/kept.csv"
check read-only-message 1 /dev/null "sxnedit: cannot write $work/kept.csv: it is read-only" -- \
    "$sxnedit" job export-points "$work/site.job" "$work/kept.csv"
check same-file-message 1 /dev/null \
    "sxnedit: cannot write $work/in.neu: it is the same file as $work/link.neu, which this command reads" -- \
    "$sxnedit" reduce "$work/link.neu" --report "$work/in.neu"
check two-outputs-one-file 1 /dev/null \
    "sxnedit: cannot write $work/out.txt: it is the same file as $work/out.txt, which this command also writes" -- \
    "$sxnedit" reduce "$work/in.neu" --report "$work/out.txt" --points "$work/out.txt"
# A named pipe stays a pipe, and its reader gets the points.
mkfifo "$work/points.fifo"
cat "$work/points.fifo" >"$work/from-fifo" &
reader=$!
"$sxnedit" reduce "$work/in.neu" --points "$work/points.fifo" >/dev/null 2>&1
wait "$reader"
[ -p "$work/points.fifo" ] && grep -q '^P1,' "$work/from-fifo" && passed=$((passed + 1)) ||
    { echo "FAIL points-to-fifo: the pipe was replaced or its reader got nothing"; failed=$((failed + 1)); }

# Check shots against the known point CP (1010, 2000, 50) from S1 (1000, 2000, 50), every
# shot level with instrument and target at 1.5: CP at 10.005 m East lands 5 mm beyond CP,
# X1 on face 2 (reading 270, zenith 270, folded to 90 and 90) at 10.020 m lands 2 cm beyond,
# and X2, offset 0.5 to the right of a line of sight due East, lands 0.5 m South of CP.
"$sxnedit" reduce "$data/check_shots.neu" --json >"$work/checks.json" 2>/dev/null
"$sxnedit" reduce "$data/check_shots.neu" --report - >"$work/checks.report" 2>/dev/null
if python3 - "$work/checks.json" <<'PY' && [ "$(grep -c 'CHECK POINT' "$work/checks.report")" -eq 3 ]
import json, sys
checks = {c["id"]: c for c in json.load(open(sys.argv[1]))["checks"]}
want = {"CP": (0.005, 0.0, 0.005), "X1": (0.020, 0.0, 0.020), "X2": (0.0, -0.5, 0.0)}
ok = set(checks) == set(want)
for name, (de, dn, dd) in want.items():
    d = checks[name]["differences"]
    ok = ok and abs(d["e"] - de) < 1e-9 and abs(d["n"] - dn) < 1e-9 and abs(d["distance"] - dd) < 1e-9
    ok = ok and checks[name]["point"] == "CP" and d["h"] == 0
sys.exit(0 if ok else 1)
PY
then
    passed=$((passed + 1))
else
    echo "FAIL check-shots"; cat "$work/checks.json"; failed=$((failed + 1))
fi

finish cli
