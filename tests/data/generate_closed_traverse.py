#!/usr/bin/env python3
"""Writes closed_traverse.neu and closed_traverse_truth.csv: a closed traverse of six
stations with side shots on both faces, observed exactly from known coordinates (angles in
decimal degrees to 1e-8, distances to 1e-5 m), so a reduction must give the truth back."""
import math

stations = [("T1", 5000.0, 8000.0, 100.0), ("T2", 5120.5, 8040.25, 101.2),
            ("T3", 5180.75, 8150.0, 99.85), ("T4", 5100.0, 8240.5, 102.4),
            ("T5", 4980.25, 8190.75, 100.9), ("T6", 4930.0, 8080.0, 98.7)]
HI, HT = 1.55, 1.65


def bearing(a, b):
    return math.degrees(math.atan2(b[1] - a[1], b[2] - a[2])) % 360.0


def observe(key, at, target, back_bearing, code, face2=False):
    ha = (bearing(at, target) - back_bearing) % 360.0
    dx, dy = target[1] - at[1], target[2] - at[2]
    dz = target[3] - at[3] - HI + HT
    hd = math.hypot(dx, dy)
    sd = math.sqrt(hd * hd + dz * dz)
    va = math.degrees(math.atan2(hd, dz))
    if face2:
        ha, va = (ha + 180.0) % 360.0, 360.0 - va
    return "%-10sID=%s,HA=%.8f,VA=%.8f,SD=%.5f,HT=%.3f,CO=%s" % (key, target[0], ha, va, sd, HT, code)


rows = ["#VERSION-1.0 NEUTRAL FILE", "UNIT      UL=M,UA=D", "AMODE     HM=A,VM=Z"]
truth = list(stations)
for i, st in enumerate(stations):
    back, ahead = stations[i - 1], stations[(i + 1) % len(stations)]
    rows.append("STN       ID=%s,HI=%.3f,CO=STN" % (st[0], HI))
    back_bearing = bearing(st, back)
    if i == 0:
        rows.append("XYZ       ID=%s,E=%.5f,N=%.5f,H=%.5f" % st)
        rows.append("BKB       ID=%s,BRG=%.8f,HA=0" % (back[0], back_bearing))
    else:
        rows.append("BKB       ID=%s,HA=0" % back[0])
    rows.append(observe("BS", st, back, back_bearing, ""))
    for k in range(3):
        angle = math.radians(40 + 97 * k + 13 * i)
        dist = 12.0 + 7.5 * k + i
        shot = ("S%d%d" % (i + 1, k + 1), st[1] + dist * math.sin(angle), st[2] + dist * math.cos(angle),
                st[3] + 0.3 * k - 0.4)
        truth.append(shot)
        rows.append(observe("SS", st, shot, back_bearing, "FC01"))
        rows.append(observe("SS", st, shot, back_bearing, "FC01", face2=True))
    rows.append(observe("SS", st, ahead, back_bearing, "STN"))

with open("closed_traverse.neu", "w") as out:
    out.write("\n".join(rows) + "\n")
with open("closed_traverse_truth.csv", "w") as out:
    for name, e, n, h in truth:
        out.write("%s,%.5f,%.5f,%.5f\n" % (name, e, n, h))
