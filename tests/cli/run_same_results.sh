#!/usr/bin/env bash
# The reduction gives the very results it always gave: the JSON and the report of the bundled
# example, compared whole, and of a generated survey with stations on unknown back stations
# and stations that nothing positions, compared by their SHA-256 (the outputs are megabytes;
# the survey is made again from its seed). doc reduce of the same survey must give the same
# JSON and keep the same rows.
# Usage: run_same_results.sh PATH/TO/sxnedit PATH/TO/generate_survey CLI_TEST_DIR
set -u
sxnedit="$1"
generate="$2"
here="$3"
data="$here/../data"
expected_dir="$data/same_results"
. "$here/cli_check.sh"

check boundary-json 0 "$expected_dir/boundary.json" "" -- "$sxnedit" reduce "$here/../../examples/boundary.neu" --json
check boundary-report 0 "$expected_dir/boundary.report" "" -- "$sxnedit" reduce "$here/../../examples/boundary.neu" --report -

"$generate" 2000 --seed 11 --unknown-back-every 7 --unpositioned-every 11 -o "$work/survey.neu"
"$sxnedit" reduce "$work/survey.neu" --json >"$work/survey.json" 2>/dev/null
"$sxnedit" reduce "$work/survey.neu" --report - >"$work/survey.report" 2>/dev/null
"$sxnedit" job new "$work/survey.job" >/dev/null
"$sxnedit" doc import "$work/survey.job" "$work/survey.neu" --name SURVEY >/dev/null
"$sxnedit" doc reduce "$work/survey.job" SURVEY --json >"$work/doc.json" 2>/dev/null
"$sxnedit" doc export "$work/survey.job" SURVEY "$work/doc.neu"
(cd "$work" && sha256sum survey.json survey.report doc.json doc.neu) >"$work/sums"
if diff -u "$expected_dir/generated.sha256" "$work/sums"; then
    passed=$((passed + 1))
else
    echo "FAIL generated-survey: the outputs above differ from those the reduction always gave"
    failed=$((failed + 1))
fi

finish same-results
