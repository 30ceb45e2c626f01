#!/usr/bin/env bash
# The instrument commands as a user meets them: drivers listed, raw files imported to
# standard output, a file and a job, and a download from an instrument played on a
# pseudo-terminal. Usage: run_instrument_cli_tests.sh PATH/TO/sxnedit CLI_TEST_DIR
set -u
sxnedit="$1"
here="$2"
data="$here/../data"
raw="$data/raw"
unset SXNEDIT_DRIVER_DIR  # the drivers beside the program
. "$here/cli_check.sh"

no_station="sxnedit: The data hold observations before any station block; they are reduced only once a STN record stands before them."

check instruments 0 "$here/expected/instruments.txt" "" -- "$sxnedit" instruments
check instruments-usage 64 /dev/null "" -- "$sxnedit" instruments --all
"$sxnedit" instruments --json | python3 -c 'import json, sys; d = json.load(sys.stdin); names = [x["name"] for x in d["drivers"]]; assert len(names) == 10 and "Carlson RW5" in names and d["drivers"][names.index("Leica GSI")]["extensions"] == ["gsi", "gs8", "gs16"] and d["refused"] == []' &&
    passed=$((passed + 1)) || { echo "FAIL instruments-json"; failed=$((failed + 1)); }

check import-stdout 0 "$here/expected/rilievo-gon.neu" "$no_station" -- "$sxnedit" import "$raw/RILIEVO.gsi" --instrument "leica gsi" --angles gon
check import-file 0 /dev/null "$no_station" -- "$sxnedit" import "$raw/RILIEVO.gsi" --instrument "Leica GSI" --angles gon -o "$work/rilievo.neu"
check import-file-rows 0 "$here/expected/rilievo-gon.neu" "" -- "$sxnedit" rows "$work/rilievo.neu"
"$sxnedit" job new "$work/site.job" >/dev/null
printf 'Imported %s as DAY 1 (25 records).\n' "$raw/RILIEVO.gsi" >"$work/imported"
check import-job 0 "$work/imported" "" -- "$sxnedit" import "$raw/RILIEVO.gsi" --instrument "Leica GSI" --angles gon --job "$work/site.job" --name "DAY 1"
check import-job-export 0 "" "" -- "$sxnedit" doc export "$work/site.job" "DAY 1" "$work/day1.neu"
check import-job-rows 0 "$here/expected/rilievo-gon.neu" "" -- cat "$work/day1.neu"
check import-name-taken 1 /dev/null "sxnedit: the job has a document DAY 1 already" -- "$sxnedit" import "$raw/RILIEVO.gsi" --instrument "Leica GSI" --job "$work/site.job" --name "DAY 1"
check import-unknown-instrument 1 /dev/null "sxnedit: There is no driver for Total. The drivers are: Trimble ARE, Leica GSI, Topcon GTS, Neutral, Nikon RAW v2.00, Carlson RW5, Sokkia SDR33, Leica TPS 1200 export, Leica TPS 700 export, Zeiss R4/R5/Rec 500." -- "$sxnedit" import "$raw/RILIEVO.gsi" --instrument Total
check import-missing-file 2 /dev/null "sxnedit: Failed to open $work/none.gsi: No such file or directory." -- "$sxnedit" import "$work/none.gsi" --instrument "Leica GSI"
check import-other-format 2 /dev/null "sxnedit: The data are not Leica GSI: no GSI word was found in them.
sxnedit: $work/rilievo.neu gave no records" -- "$sxnedit" import "$work/rilievo.neu" --instrument "Leica GSI"
check import-no-instrument 64 /dev/null "sxnedit: import: --instrument is required
Usage: sxnedit import RAWFILE [OPTIONS]
Run 'sxnedit import --help' for more information." -- "$sxnedit" import "$raw/RILIEVO.gsi"
check import-two-outputs 64 /dev/null "sxnedit: import: -o excludes --job
Usage: sxnedit import RAWFILE [OPTIONS]
Run 'sxnedit import --help' for more information." -- "$sxnedit" import "$raw/RILIEVO.gsi" --instrument "Leica GSI" -o x.neu --job "$work/site.job"
check import-bad-units 64 /dev/null "" -- "$sxnedit" import "$raw/RILIEVO.gsi" --instrument "Leica GSI" --angles rad

check download-missing-port 1 /dev/null "sxnedit: There is no serial port $work/ttyNONE." -- "$sxnedit" download --instrument "Leica GSI" --port "$work/ttyNONE"
check download-not-a-port 1 /dev/null "sxnedit: /dev/null is not a serial port." -- "$sxnedit" download --instrument "Leica GSI" --port /dev/null
check download-no-port 64 /dev/null "sxnedit: download: --port is required
Usage: sxnedit download [OPTIONS]
Run 'sxnedit download --help' for more information." -- "$sxnedit" download --instrument "Leica GSI"
check download-bad-parity 64 /dev/null "" -- "$sxnedit" download --instrument "Leica GSI" --port COM1 --parity maybe

# The RW5 traverse imported and reduced: its stations where the data collector put them.
python3 "$here/rw5_traverse.py" "$sxnedit" "$raw/Trav_19leg.rw5" "$work" &&
    passed=$((passed + 1)) || { echo "FAIL rw5-traverse"; failed=$((failed + 1)); }

# A download end to end: the instrument plays RILIEVO.gsi and ends with EOT; the records go
# to a file and the raw data are kept.
python3 "$here/fake_instrument.py" "$raw/RILIEVO.gsi" "$work/pty" &
instrument=$!
for _ in $(seq 100); do [ -e "$work/pty" ] && break; sleep 0.05; done
check download 0 /dev/null "" -- "$sxnedit" download --instrument "Leica GSI" --port "$(cat "$work/pty")" --baud 19200 --flow xon/xoff --timeout 5 --angles gon --raw "$work/download.gsi" -o "$work/download.neu"
wait "$instrument"
check download-records 0 "$here/expected/rilievo-gon.neu" "" -- cat "$work/download.neu"
printf '\004' | cat "$raw/RILIEVO.gsi" - >"$work/expected.gsi"
check download-raw 0 "$work/expected.gsi" "" -- cat "$work/download.gsi"

finish cli-instruments
