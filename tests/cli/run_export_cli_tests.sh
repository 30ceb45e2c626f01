#!/usr/bin/env bash
# Exports on the command line: each format from a job with points, lines and strings, the
# coordinate system kept in the job, a layer filter, LandXML with a document's observations,
# and the outputs and words it refuses.
# Usage: run_export_cli_tests.sh PATH/TO/sxnedit CLI_TEST_DIR
set -u
sxnedit="$1"
here="$2"
data="$here/../data"
. "$here/cli_check.sh"

job="$work/site.job"
"$sxnedit" job new "$job" >/dev/null
"$sxnedit" transfer "$data/transfer_site.neu" --job "$job" >/dev/null
"$sxnedit" doc import "$job" "$data/transfer_site.neu" --name "DAY 1" >/dev/null

check export-csv 0 "$(expected export-csv.txt)" \
    "sxnedit: a CSV file holds points only; not in it: 1 line, 0 arcs, 0 circles and 0 polylines" -- \
    "$sxnedit" export "$job" csv "$work/points.csv"
# The header, and the points whose coordinates the reduction gives without a rounding.
check export-csv-text 0 "$here/expected/export-points.csv" "" -- grep -v '^[BP]' "$work/points.csv"

for format in dxf gpkg geojson shp; do
    check "export-$format" 0 "" "" -- "$sxnedit" export "$job" "$format" "$work/site.$format"
done
check export-shp-lines 0 "" "" -- test -s "$work/site_lines.shp"
check export-kml-without-crs 1 "" \
    "sxnedit: KML holds longitudes and latitudes: give the job's coordinate system (--crs EPSG:NNNN)" -- \
    "$sxnedit" export "$job" kml "$work/site.kml"

# The coordinate system given once is kept in the job and written by every later export.
check export-crs 0 "" "" -- "$sxnedit" export "$job" kml "$work/site.kml" --crs EPSG:27700
check export-landxml 0 "$(expected export-landxml.txt)" \
    "sxnedit: LandXML holds the points and the survey only; not in it: 1 line, arc, circle or polyline" -- \
    "$sxnedit" export "$job" landxml "$work/site.xml" --doc "DAY 1"
check export-landxml-crs 0 "" "" -- grep -q '<CoordinateSystem epsgCode="27700"' "$work/site.xml"
check export-landxml-setups 0 "" "" -- test "$(grep -c '<InstrumentSetup ' "$work/site.xml")" -eq 2
check export-unknown-crs 64 "" "sxnedit: export: GDAL does not know the coordinate system EPSG:999999" -- \
    "$sxnedit" export "$job" gpkg "$work/other.gpkg" --crs EPSG:999999

check export-unknown-layer 1 "" "sxnedit: the job has no layer NOPE" -- \
    "$sxnedit" export "$job" dxf "$work/nope.dxf" --layers NOPE
check export-doc-not-landxml 64 "" "sxnedit: export: --doc is for landxml only" -- \
    "$sxnedit" export "$job" dxf "$work/doc.dxf" --doc "DAY 1"
check export-over-job 1 "" \
    "sxnedit: cannot write $job: it is the same file as $job, which this command reads" -- \
    "$sxnedit" export "$job" csv "$job"
touch "$work/site_lines.prj" && chmod a-w "$work/site_lines.prj"
check export-read-only-companion 1 "" \
    "sxnedit: cannot write $work/site_lines.prj: it is read-only" -- \
    "$sxnedit" export "$job" shp "$work/site.shp"
check export-no-format 64 "" "" -- "$sxnedit" export "$job" dwg "$work/site.dwg"

finish export_cli
