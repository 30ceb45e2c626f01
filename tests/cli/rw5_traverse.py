#!/usr/bin/env python3
"""The 19-leg RW5 traverse end to end: imported by the Carlson RW5 driver, reduced, and every
traverse station compared with the coordinates the data collector wrote in its OC records.

The collector reduced the same observations; it worked from the means of each angle set
rounded to whole seconds (its "--SS" notes), and one second over the longest leg (1086 ft) is
0.005 ft. So the stations must agree to 0.005 US ft in north, east and elevation.

A second road to the same answer: with the collector's station coordinates taken out of the
records (all but control points 103 and 104), the reduction must give the same coordinates,
so they come from the observations and not from the collector.

Usage: rw5_traverse.py PATH/TO/sxnedit PATH/TO/Trav_19leg.rw5 WORK_DIR
"""

import json
import re
import subprocess
import sys

US_FEET_PER_METRE = 3937.0 / 1200.0
TOLERANCE_FT = 0.005

# North, East, Elevation of the OC records of Trav_19leg.rw5, read by hand (US feet).
COLLECTOR = {
    "104": (50000.00000, 21085.86000, 517.439),
    "105": (49900.54933, 21697.26202, 523.879),
    "106": (49874.70981, 20951.00485, 516.390),
    "107": (49889.78690, 19961.12279, 500.774),
    "108": (49047.15278, 19635.65561, 486.240),
    "109": (48285.31663, 19253.79858, 485.463),
    "110": (47518.12408, 19175.01516, 489.938),
    "111": (47089.73749, 18887.23208, 487.287),
    "112": (47650.53373, 18767.12568, 479.099),
    "113": (48314.65330, 18896.82304, 460.601),
    "114": (49154.88301, 19212.51078, 478.693),
    "115": (49883.06780, 19297.08648, 477.439),
    "116": (49968.66720, 18325.54151, 441.714),
    "117": (49938.73790, 19322.84312, 478.562),
    "118": (50802.13062, 19529.05966, 477.128),
    "119": (51706.84604, 19598.57537, 459.075),
    "120": (51364.80346, 19832.99619, 463.872),
    "121": (50598.30656, 20057.07322, 493.757),
    "1087": (50000.00606, 19999.95461, 499.507),
}


def run(args):
    done = subprocess.run(args, capture_output=True, text=True)
    if done.returncode != 0:
        sys.exit(f"FAIL {' '.join(args)}: status {done.returncode}: {done.stderr}")
    return done.stdout


def reduce(sxnedit, neutral):
    points = json.loads(run([sxnedit, "reduce", neutral, "--json"]))["points"]
    return {p["id"]: (p["n"] * US_FEET_PER_METRE, p["e"] * US_FEET_PER_METRE,
                      p["h"] * US_FEET_PER_METRE) for p in points}


def main():
    sxnedit, raw, work = sys.argv[1:4]
    neutral = f"{work}/traverse.neu"
    run([sxnedit, "import", raw, "--instrument", "Carlson RW5", "-o", neutral])
    reduced = reduce(sxnedit, neutral)
    failures = []
    for name, known in COLLECTOR.items():
        got = reduced.get(name)
        if got is None:
            failures.append(f"station {name} was not reduced")
            continue
        for axis, a, b in zip("NEH", got, known):
            if abs(a - b) > TOLERANCE_FT:
                failures.append(f"station {name} {axis}: {a:.4f} against {b:.4f} ft")

    # The same records without the collector's coordinates of the traverse stations.
    observed_only = f"{work}/observed-only.neu"
    with open(neutral) as source, open(observed_only, "w") as target:
        for row in source:
            match = re.match(r"XYZ\s+ID=([^,]*),", row)
            if match and match.group(1) not in ("103", "104"):
                continue
            target.write(row)
    again = reduce(sxnedit, observed_only)
    for name in COLLECTOR:
        if name in reduced and name in again and max(
                abs(a - b) for a, b in zip(reduced[name], again[name])) > 1e-9:
            failures.append(f"station {name} moved without the collector's coordinates")

    for failure in failures:
        print("FAIL rw5-traverse:", failure)
    return 1 if failures else 0


if __name__ == "__main__":
    sys.exit(main())
