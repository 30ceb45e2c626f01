#!/usr/bin/env bash
# Save To Survey on the command line: a first transfer into a new job, the conflicts that a
# second one meets when no option answers them (nothing is written), each answer of
# --existing, the terminal's questions, a stored document, and the job's listings.
# Usage: run_transfer_cli_tests.sh PATH/TO/sxnedit CLI_TEST_DIR
set -u
sxnedit="$1"
here="$2"
data="$here/../data"
site="$data/transfer_site.neu"
. "$here/cli_check.sh"

job="$work/site.job"
"$sxnedit" job new "$job" >/dev/null
check transfer-new 0 "$(expected transfer-new.txt)" "" -- "$sxnedit" transfer "$site" --job "$job"
check transfer-lines 0 "$here/expected/transfer-lines.json" "" -- "$sxnedit" job lines "$job" --json
check transfer-points 0 "$here/expected/transfer-points.txt" "" -- "$sxnedit" job points "$job"
printf '[\n]\n' >"$work/none.json"
for kind in polylines arcs circles; do
    check "transfer-no-$kind" 0 "$work/none.json" "" -- "$sxnedit" job "$kind" "$job" --json
done

# P2 and P3 moved in the job: a transfer with no answer writes nothing and lists both.
printf 'P2,1000.5,1980,50,TREE\nP3,1100,2006,,FC01\n' >"$work/moved.csv"
"$sxnedit" job import-points "$job" "$work/moved.csv" >/dev/null
"$sxnedit" job points "$job" >"$work/moved.txt"
check transfer-conflicts 1 "$here/expected/transfer-conflicts.json" \
    "sxnedit: nothing was written: 2 questions need an answer:
  point P2: the job holds it with other coordinates (--existing)
  point P3: the job holds it with other coordinates (--existing)" -- \
    "$sxnedit" transfer "$site" --job "$job" --json
check transfer-conflicts-kept 0 "$work/moved.txt" "" -- "$sxnedit" job points "$job"
# Abort at the first point the job holds with other coordinates: what was written before it
# stays (one point, written again as it stands), nothing after it.
check transfer-abort 1 "" "sxnedit: Not written to the job:
point B: the reduction took its coordinates from the job, which stand
sxnedit: The transfer was stopped: what was written before the stop (1 point, 0 lines, 0 arcs, 0 circles, 0 polylines) is kept in the job, the rest was not written." -- \
    "$sxnedit" transfer "$site" --job "$job" --existing abort
check transfer-abort-kept 0 "$work/moved.txt" "" -- "$sxnedit" job points "$job"

# Each answer on a copy of the job: new names with a prefix, new numbers, and overwriting.
cp "$job" "$work/prefix.job"
check transfer-prefix 0 "$(expected transfer-prefix.txt)" "" -- \
    "$sxnedit" transfer "$site" --job "$work/prefix.job" --existing prefix=N
cp "$job" "$work/renumber.job"
check transfer-renumber 0 "$(expected transfer-renumber.txt)" "" -- \
    "$sxnedit" transfer "$site" --job "$work/renumber.job" --existing renumber
check transfer-renumbered 0 "$here/expected/transfer-renumbered.txt" "" -- \
    "$sxnedit" job points "$work/renumber.job"
cp "$job" "$work/refused.job"
"$sxnedit" transfer "$site" --job "$work/refused.job" --existing prefix=N >/dev/null 2>&1
check transfer-prefix-taken 1 /dev/null "" -- \
    "$sxnedit" transfer "$site" --job "$work/refused.job" --existing prefix=N
grep -q 'point P2: Points with Prefix N Already Exist ! (--existing)' "$work/err" &&
    passed=$((passed + 1)) || { echo "FAIL transfer-prefix-taken: no refusal named"; failed=$((failed + 1)); }

# On the terminal: the job's coordinates for the stations, for all of them, then overwrite,
# for the rest of the run.
printf 'd\ny\no\ny\n' >"$work/answers"
"$sxnedit" transfer "$site" --job "$job" --interactive <"$work/answers" >"$work/out" 2>"$work/err"
status=$?
[ "$status" -eq 0 ] && grep -q 'Written to .*: points 3 (3 updated)' "$work/out" &&
    grep -q 'How would you like to deal with this point:  Overwrite / Create New / Abort ?' "$work/err" &&
    passed=$((passed + 1)) || { echo "FAIL transfer-interactive: status $status"; cat "$work/err"; failed=$((failed + 1)); }
check transfer-overwritten 0 "$here/expected/transfer-points.txt" "" -- "$sxnedit" job points "$job"

# A stored document, and the options a transfer refuses.
"$sxnedit" doc import "$job" "$site" --name DAY1 >/dev/null
check doc-transfer 0 "$(expected transfer-again.txt)" "" -- "$sxnedit" doc transfer "$job" DAY1
# The job keeps a record of every transfer it kept, with what each left out.
"$sxnedit" job transfers "$job" --json >"$work/transfers.json"
[ "$(grep -c '"made_at"' "$work/transfers.json")" -eq 4 ] &&
    [ "$(grep -c '"complete": false' "$work/transfers.json")" -eq 1 ] &&
    grep -q '"source": "DAY1", "complete": true, "written": {"points": 3, "lines": 1' "$work/transfers.json" &&
    grep -q '"name": "B", "reason": "the reduction took its coordinates from the job, which stand"' "$work/transfers.json" &&
    passed=$((passed + 1)) || { echo "FAIL job-transfers"; cat "$work/transfers.json"; failed=$((failed + 1)); }
cp "$job" "$work/readonly.job"
chmod a-w "$work/readonly.job"
check transfer-read-only 2 /dev/null \
    "sxnedit: The job $work/readonly.job is read-only: it can be opened for reading only." -- \
    "$sxnedit" transfer "$site" --job "$work/readonly.job"
check transfer-bad-answer 64 /dev/null "" -- "$sxnedit" transfer "$site" --job "$job" --existing keep
check transfer-no-job 64 /dev/null "" -- "$sxnedit" transfer "$site"

finish transfer_cli
