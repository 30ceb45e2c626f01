#!/usr/bin/env python3
"""The 19-leg RW5 traverse end to end: imported by the Carlson RW5 driver, reduced, and every
traverse station compared with the coordinates the data collector wrote in its OC records;
then its route found and the traverse adjusted, and the misclose compared with the closure
the file's own comments record.

The collector reduced the same observations; it worked from the means of each angle set
rounded to whole seconds (its "--SS" notes), and one second over the longest leg (1086 ft) is
0.005 ft. So the stations must agree to 0.005 US ft in north, east and elevation.

A second road to the same answer: with the collector's station coordinates taken out of the
records (all but control points 103 and 104), the reduction must give the same coordinates,
so they come from the observations and not from the collector.

The closure, worked out by hand from the file: the traverse starts on 104 oriented on 103
("--Start 104", "Ref Ang = 103 to 104") and ends on 1087, the check shot of 103 ("--CK.,103"),
so it closes on 103 (N 50000, E 20000, EL 500 from its SP record). The collector put 1087 at
N 50000.00606, E 19999.95461, EL 499.507: a closure of dN +0.00606, dE -0.04539 (0.0458 US
ft), dEL -0.493, over 19 legs of 13 862 ft, about 1:303 000. Angles ("--Ang Bal = 1087 to
1093"): the bearing 1087->1093 (1093 the check shot of 104) against 103->104, due east.

Tolerances: the collector reduced the means of each angle set rounded to whole seconds; over
this traverse that moves the closing station by a thousandth or two of a foot. So the
misclose must agree within 0.002 ft in each component and in length: far below the 0.046 ft
of the misclose itself, so that a lost face, a wrong back sight or a leg left out would show,
and below the hundredth of a foot a surveyor states coordinates to. The angular misclose must
be +8.5" within 1", the resolution of the collector's set means.

Usage: rw5_traverse.py PATH/TO/sxnedit PATH/TO/Trav_19leg.rw5 WORK_DIR
"""

import json
import math
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


# The closure the file records, in US feet (observed minus known).
CLOSURE = {"N": 0.00606, "E": -0.04539, "H": -0.493}
CLOSURE_LENGTH = 0.0458
TRAVERSE_LENGTH_FT = 13862.0
CLOSURE_TOLERANCE_FT = 0.002
KNOWN_103 = (50000.0, 20000.0, 500.0)  # N, E, EL of its SP record
ANGULAR_MISCLOSE_SEC = 8.5
ANGULAR_TOLERANCE_SEC = 1.0
ROUTE = [str(n) for n in range(104, 122)] + ["1087"]


def check_traverse(sxnedit, neutral, reduced, failures):
    routes = json.loads(run([sxnedit, "traverse", "routes", neutral, "--json"]))["routes"]
    if ROUTE not in routes:
        failures.append(f"the route {','.join(ROUTE)} was not found among {len(routes)} routes")

    # Closed on the known 103; the program works in metres, the file in US feet.
    fixed = ",".join(repr(v / US_FEET_PER_METRE) for v in (KNOWN_103[1], KNOWN_103[0],
                                                          KNOWN_103[2]))
    result = json.loads(run([sxnedit, "traverse", "adjust", neutral, "--route", ",".join(ROUTE),
                             "--backsight", "103", "--fixed", "1087", "--fixed-coords", fixed,
                             "--json"]))
    if result["result"] != 11111:
        failures.append(f"the traverse was not adjusted: result {result['result']}")
    misclose = result["unadjusted"]["misclose"]
    # The program gives known minus observed.
    ours = {"N": -misclose["DiffN"], "E": -misclose["DiffE"], "H": -misclose["DiffH"]}
    for axis, recorded in CLOSURE.items():
        got = ours[axis] * US_FEET_PER_METRE
        if abs(got - recorded) > CLOSURE_TOLERANCE_FT:
            failures.append(f"misclose d{axis} {got:+.5f} ft against the recorded {recorded:+.5f}")
    length = misclose["MiscloseDist"] * US_FEET_PER_METRE
    if abs(length - CLOSURE_LENGTH) > CLOSURE_TOLERANCE_FT:
        failures.append(f"linear misclose {length:.4f} ft against the recorded {CLOSURE_LENGTH}")
    travelled = misclose["TraverseLength"] * US_FEET_PER_METRE
    if abs(travelled - TRAVERSE_LENGTH_FT) > 1.0 or misclose["Setups"] != 18:
        failures.append(f"traverse of {travelled:.1f} ft and {misclose['Setups']} set-ups")
    # 1:N, N the traverse length over the misclose, with the misclose at either tolerance.
    ratio = int(misclose["Accuracy"].split(":")[1])
    low = TRAVERSE_LENGTH_FT / (CLOSURE_LENGTH + CLOSURE_TOLERANCE_FT)
    high = TRAVERSE_LENGTH_FT / (CLOSURE_LENGTH - CLOSURE_TOLERANCE_FT)
    if not low <= ratio <= high:
        failures.append(f"accuracy 1:{ratio}, not between 1:{low:.0f} and 1:{high:.0f}")

    # Adjusted by the Compass rule, the closing station lands on 103.
    last = result["adjusted"]["points"][-1]
    landed = (last["n"] * US_FEET_PER_METRE, last["e"] * US_FEET_PER_METRE)
    if last["id"] != "1087" or max(abs(a - b) for a, b in zip(landed, KNOWN_103)) > 0.001:
        failures.append(f"the adjusted closing station {last['id']} lies at {landed}")

    # The angular misclose: the bearing 1087->1093 as observed against 103->104, due east.
    if "1087" in reduced and "1093" in reduced:
        d_north = reduced["1093"][0] - reduced["1087"][0]
        d_east = reduced["1093"][1] - reduced["1087"][1]
        bearing = math.degrees(math.atan2(d_east, d_north)) % 360.0
        seconds = (bearing - 90.0) * 3600.0
        if abs(seconds - ANGULAR_MISCLOSE_SEC) > ANGULAR_TOLERANCE_SEC:
            failures.append(f"angular misclose {seconds:+.1f}\" against {ANGULAR_MISCLOSE_SEC:+.1f}\"")
    else:
        failures.append("1087 or 1093 was not reduced")


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

    check_traverse(sxnedit, neutral, reduced, failures)

    for failure in failures:
        print("FAIL rw5-traverse:", failure)
    return 1 if failures else 0


if __name__ == "__main__":
    sys.exit(main())
