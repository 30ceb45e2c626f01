#!/usr/bin/env bash
# The upload as a user meets it: the chosen points of a job written as a GSI-16 coordinate
# file or a neutral file, and sent over a serial port to an instrument played on a
# pseudo-terminal; outputs that must not be replaced are refused.
# Usage: run_upload_cli_tests.sh PATH/TO/sxnedit CLI_TEST_DIR
set -u
sxnedit="$1"
here="$2"
data="$here/../data"
unset SXNEDIT_DRIVER_DIR  # the drivers beside the program
. "$here/cli_check.sh"

job="$work/site.job"
"$sxnedit" job new "$job" >/dev/null
cat >"$work/points.csv" <<'CSV'
name,east,north,height,code
1,1000.5,2000.25,50.125,STN
2,1010,1990,,TREE
3,-5.5,7,1.2345,TREE 2
CSV
"$sxnedit" job import-points "$job" "$work/points.csv" >/dev/null

# Worked out by hand: metres in 1/10 mm (unit 6), names and codes padded with zeros to 16
# characters, no word 83 for a point without height, no word 71 for a code with a blank.
printf '%s\r\n' \
    '*110001+0000000000000001 81...6+0000000010005000 82...6+0000000020002500 83...6+0000000000501250 71....+0000000000000STN ' \
    '*110002+0000000000000002 81...6+0000000010100000 82...6+0000000019900000 71....+000000000000TREE ' \
    '*110003+0000000000000003 81...6-0000000000055000 82...6+0000000000070000 83...6+0000000000012345 ' \
    >"$work/expected.gsi"
check upload-gsi 0 /dev/null "sxnedit: Point 3 was uploaded without its code TREE 2, which GSI-16 cannot hold.
sxnedit: 3 points uploaded to $work/out.gsi" -- "$sxnedit" upload "$job" --instrument "Leica GSI" -o "$work/out.gsi"
check upload-gsi-bytes 0 "$work/expected.gsi" "" -- cat "$work/out.gsi"
check upload-gsi-read-back 0 /dev/null "" -- "$sxnedit" import "$work/out.gsi" --instrument "Leica GSI" -o "$work/back.neu"
grep -q '^PT        ID=1,E=1000.5000,N=2000.2500,H=50.1250,CO=STN$' "$work/back.neu" &&
    passed=$((passed + 1)) || { echo "FAIL upload-gsi-read-back-point"; cat "$work/back.neu"; failed=$((failed + 1)); }

printf '%s\n' '#VERSION-1.0 NEUTRAL FILE' 'UNIT UL=M,UA=S' \
    'PT ID=2,E=1010.0000,N=1990.0000,H=-10000.000,CO=TREE' \
    'PT ID=3,E=-5.5000,N=7.0000,H=1.2345,CO=TREE 2' >"$work/expected.neu"
check upload-neutral-codes 0 "" "sxnedit: 2 points uploaded to $work/out.neu" -- "$sxnedit" upload "$job" --instrument Neutral -o "$work/out.neu" --codes tree
check upload-neutral-bytes 0 "$work/expected.neu" "" -- cat "$work/out.neu"
check upload-point-range 0 "" "sxnedit: 2 points uploaded to $work/range.neu" -- "$sxnedit" upload "$job" --instrument Neutral -o "$work/range.neu" --points 3-2
check upload-nothing-chosen 1 "" "sxnedit: no point of $job is chosen; nothing was uploaded" -- "$sxnedit" upload "$job" --instrument Neutral -o "$work/none.neu" --layers NONE
[ ! -e "$work/none.neu" ] && passed=$((passed + 1)) || { echo "FAIL upload-nothing-written"; failed=$((failed + 1)); }

# Outputs: never the job itself, nor a read-only file or a folder; a device or a named pipe
# is written in place, never replaced by a plain file.
check upload-over-job 1 "" "sxnedit: cannot write $job: it is the same file as $job, which this command reads" -- "$sxnedit" upload "$job" --instrument "Leica GSI" -o "$job"
echo "keep" >"$work/read-only.gsi" && chmod a-w "$work/read-only.gsi"
check upload-read-only 1 "" "sxnedit: cannot write $work/read-only.gsi: it is read-only" -- "$sxnedit" upload "$job" --instrument "Leica GSI" -o "$work/read-only.gsi"
check upload-read-only-kept 0 "" "" -- grep -qx keep "$work/read-only.gsi"
check upload-folder 1 "" "sxnedit: cannot write $work: it is a folder" -- "$sxnedit" upload "$job" --instrument "Leica GSI" -o "$work"
check upload-device 0 "" "" -- "$sxnedit" upload "$job" --instrument Neutral -o /dev/null --codes STN
[ -c /dev/null ] && passed=$((passed + 1)) || { echo "FAIL upload-device-kept"; failed=$((failed + 1)); }
mkfifo "$work/pipe"
cat "$work/pipe" >"$work/from-pipe" &
reader=$!
check upload-pipe 0 "" "" -- "$sxnedit" upload "$job" --instrument "Leica GSI" -o "$work/pipe"
wait "$reader"
check upload-pipe-bytes 0 "$work/expected.gsi" "" -- cat "$work/from-pipe"
[ -p "$work/pipe" ] && passed=$((passed + 1)) || { echo "FAIL upload-pipe-kept"; failed=$((failed + 1)); }

check upload-cannot 1 "" "sxnedit: the driver Carlson RW5 cannot upload points" -- "$sxnedit" upload "$job" --instrument "Carlson RW5" -o "$work/x.rw5"
check upload-no-target 64 "" "" -- "$sxnedit" upload "$job" --instrument "Leica GSI"
check upload-two-targets 64 "" "" -- "$sxnedit" upload "$job" --instrument "Leica GSI" -o "$work/y.gsi" --port COM1
check upload-missing-job 2 "" "" -- "$sxnedit" upload "$work/none.job" --instrument "Leica GSI" -o "$work/z.gsi"
check upload-not-a-port 1 "" "sxnedit: /dev/null is not a serial port." -- "$sxnedit" upload "$job" --instrument "Leica GSI" --port /dev/null

# Over a serial port: the instrument on a pseudo-terminal receives the same bytes.
python3 "$here/fake_instrument.py" --receive "$work/received.gsi" "$work/pty" &
instrument=$!
for _ in $(seq 100); do [ -e "$work/pty" ] && break; sleep 0.05; done
check upload-port 0 "" "" -- "$sxnedit" upload "$job" --instrument "Leica GSI" --port "$(cat "$work/pty")" --baud 19200
wait "$instrument"
check upload-port-bytes 0 "$work/expected.gsi" "" -- cat "$work/received.gsi"

finish cli-upload
