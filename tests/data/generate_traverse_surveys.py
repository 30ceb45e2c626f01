#!/usr/bin/env python3
"""Writes the traverse fixtures and prints the figures the traverse tests expect, worked here
from the observations as a surveyor works them by hand: bearings carried from the start
bearing with the observed angles, latitudes and departures from the horizontal distances,
the misclose, and its distribution by the Compass rule (by leg length) and the Transit rule
(by each leg's latitude and departure). The fixtures carry small errors so that they misclose.

traverse_loop.neu   a loop A,B,C,D closing on A, side shots S1 from B and S2 from C
traverse_link.neu   A (oriented on R) to E by B and C, E observing F: a link traverse with an
                    angle check at E, and an open traverse carried on to F
traverse_routes.neu two loops, a spur and a re-occupied station, for the route search
"""
import math

HI, HT = 1.5, 1.6


def brg(a, b):
    return math.degrees(math.atan2(b[0] - a[0], b[1] - a[1])) % 360.0


def observe(at, target, back_bearing, ha_error=0.0, sd_error=0.0, va_error=0.0):
    """HA from the back sight, zenith VA and slope distance, as the rows hold them."""
    ha = (brg(at, target) - back_bearing + ha_error) % 360.0
    hd = math.hypot(target[0] - at[0], target[1] - at[1]) + sd_error
    dz = target[2] - at[2] - HI + HT
    sd = math.hypot(hd, dz)
    va = math.degrees(math.atan2(hd, dz)) + va_error
    return round(ha, 8), round(va, 8), round(sd, 5)


def row(key, name, obs, code=""):
    return "%-10sID=%s,HA=%.8f,VA=%.8f,SD=%.5f,HT=%.3f,CO=%s" % (key, name, *obs, HT, code)


def reduce_leg(at, back_bearing, obs):
    """The point an observation gives, and the bearing of the leg."""
    ha, va, sd = obs
    bearing = (back_bearing + ha) % 360.0
    hd = sd * math.sin(math.radians(va))
    dz = sd * math.cos(math.radians(va))
    return (at[0] + hd * math.sin(math.radians(bearing)),
            at[1] + hd * math.cos(math.radians(bearing)), at[2] + dz + HI - HT), bearing


def compass(points, fixed, heights):
    legs = [math.hypot(b[0] - a[0], b[1] - a[1]) for a, b in zip(points, points[1:])]
    total = sum(legs)
    d = [fixed[i] - points[-1][i] for i in range(3)]
    out, run = [points[0]], 0.0
    for p, leg in zip(points[1:], legs):
        run += leg
        out.append((p[0] + d[0] * run / total, p[1] + d[1] * run / total,
                    p[2] + (d[2] * run / total if heights else 0.0)))
    return out


def transit(points, fixed, heights):
    dep = [abs(b[0] - a[0]) for a, b in zip(points, points[1:])]
    lat = [abs(b[1] - a[1]) for a, b in zip(points, points[1:])]
    d = [fixed[i] - points[-1][i] for i in range(3)]
    out, ce, cn = [points[0]], 0.0, 0.0
    for p, de, dn in zip(points[1:], dep, lat):
        ce += d[0] * de / sum(dep)
        cn += d[1] * dn / sum(lat)
        # Every point takes the same share of the height misclose, n counting all points.
        out.append((p[0] + ce, p[1] + cn, p[2] + (d[2] / len(points) if heights else 0.0)))
    return out


def show(title, points, names):
    print(title)
    for name, p in zip(names, points):
        print("  %-3s %.6f %.6f %.6f" % (name, *p))


def loop():
    truth = {"A": (1000.0, 2000.0, 50.0), "B": (1080.5, 2060.2, 51.3), "C": (1150.3, 1990.7, 49.8),
             "D": (1070.1, 1920.4, 50.6), "S1": (1090.0, 2080.0, 51.0), "S2": (1160.0, 2010.0, 50.0)}
    # Errors: distances and angles, so the loop misses its start.
    ha_err = {"B": 0.0, "C": 0.004, "D": -0.002, "A": 0.0}
    sd_err = {"B": 0.030, "C": -0.020, "D": 0.015, "A": 0.010}
    va_err = {"B": 0.0, "C": 0.010, "D": 0.0, "A": -0.004}
    order = ["A", "B", "C", "D", "A"]
    rows = ["#VERSION-1.0 NEUTRAL FILE", "UNIT      UL=M,UA=D", "AMODE     HM=A,VM=Z"]
    start_bearing = brg(truth["A"], truth["D"])
    pos = {"A": truth["A"]}
    back = {"A": start_bearing}
    reduced = [truth["A"]]
    sides = {}
    for i in range(4):
        name, ahead = order[i], order[i + 1]
        rows.append("STN       ID=%s,HI=%.3f,CO=STN" % (name, HI))
        if i == 0:
            rows.append("XYZ       ID=A,E=%.3f,N=%.3f,H=%.3f" % truth["A"])
            rows.append("BKB       ID=D,BRG=%.8f,HA=0" % start_bearing)
            rows.append(row("BS", "D", observe(truth["A"], truth["D"], start_bearing)))
        else:
            rows.append("BKB       ID=%s,HA=0" % order[i - 1])
            rows.append(row("BS", order[i - 1], observe(truth[name], truth[order[i - 1]], brg(truth[name], truth[order[i - 1]]))))
        # The true back bearing lays out the angles; the reduction orients on reduced points.
        true_back = start_bearing if i == 0 else brg(truth[name], truth[order[i - 1]])
        here = pos[name]
        for side in {"B": ["S1"], "C": ["S2"]}.get(name, []):
            obs = observe(truth[name], truth[side], true_back)
            rows.append(row("SS", side, obs, "FC01"))
            sides[side] = (name, obs)
        obs = observe(truth[name], truth[ahead], true_back, ha_err[ahead], sd_err[ahead],
                      va_err[ahead])
        rows.append(row("SS", ahead, obs, "STN"))
        nxt, leg_bearing = reduce_leg(here, back[name], obs)
        reduced.append(nxt)
        if ahead != "A":
            pos[ahead] = nxt
            back[ahead] = (leg_bearing + 180.0) % 360.0
    open("traverse_loop.neu", "w").write("\n".join(rows) + "\n")
    print("loop start bearing %.8f" % start_bearing)
    show("loop unadjusted", reduced, order)
    fixed = truth["A"]
    mis = [reduced[-1][k] - fixed[k] for k in range(3)]
    length = sum(math.hypot(b[0] - a[0], b[1] - a[1]) for a, b in zip(reduced, reduced[1:]))
    print("loop misclose E %.6f N %.6f H %.6f dist %.6f length %.6f accuracy 1:%d" %
          (-mis[0], -mis[1], -mis[2], math.hypot(mis[0], mis[1]), length,
           int(length / math.hypot(mis[0], mis[1]))))
    comp = compass(reduced, fixed, True)
    show("loop compass (heights too)", comp, order)
    show("loop transit (heights too)", transit(reduced, fixed, True), order)
    # Side shots from the adjusted stations, each oriented on its adjusted back sight.
    adj = dict(zip(order, comp))
    for side, (name, obs) in sides.items():
        prev = order[order.index(name) - 1]
        p, _ = reduce_leg(adj[name], brg(adj[name], adj[prev]), obs)
        print("loop side shot %s after compass %.6f %.6f %.6f" % (side, *p))


def link():
    truth = {"R": (900.0, 2100.0, 0.0), "A": (1000.0, 2000.0, 50.0), "B": (1100.0, 2050.0, 51.0),
             "C": (1210.0, 2010.0, 50.5), "E": (1300.0, 2080.0, 52.0), "F": (1380.0, 2150.0, 51.5)}
    ha_err = {"B": 0.0, "C": 0.003, "E": -0.002, "F": 0.001}
    sd_err = {"B": 0.012, "C": -0.008, "E": 0.010, "F": 0.0}
    order = ["A", "B", "C", "E", "F"]
    rows = ["#VERSION-1.0 NEUTRAL FILE", "UNIT      UL=M,UA=D", "AMODE     HM=A,VM=Z"]
    start_bearing = brg(truth["A"], truth["R"])
    pos, back, bearings, reduced, angles, dists = {"A": truth["A"]}, {"A": start_bearing}, [], [truth["A"]], [], []
    for i in range(4):
        name, ahead = order[i], order[i + 1]
        rows.append("STN       ID=%s,HI=%.3f,CO=STN" % (name, HI))
        if i == 0:
            rows.append("XYZ       ID=A,E=%.3f,N=%.3f,H=%.3f" % truth["A"])
            rows.append("BKB       ID=R,BRG=%.8f,HA=0" % start_bearing)
        else:
            rows.append("BKB       ID=%s,HA=0" % order[i - 1])
            rows.append(row("BS", order[i - 1], observe(truth[name], truth[order[i - 1]], brg(truth[name], truth[order[i - 1]]))))
        true_back = start_bearing if i == 0 else brg(truth[name], truth[order[i - 1]])
        obs = observe(truth[name], truth[ahead], true_back, ha_err[ahead], sd_err[ahead])
        rows.append(row("SS", ahead, obs, "STN" if ahead != "F" else "CTRL"))
        nxt, leg_bearing = reduce_leg(pos[name], back[name], obs)
        angles.append(obs[0])
        dists.append(obs[2] * math.sin(math.radians(obs[1])))
        reduced.append(nxt)
        pos[ahead] = nxt
        back[ahead] = (leg_bearing + 180.0) % 360.0
    open("traverse_link.neu", "w").write("\n".join(rows) + "\n")
    # The angle check at E: the observed bearing E-F against the known one.
    known = brg(truth["E"], truth["F"])
    observed = (back["E"] + angles[3]) % 360.0
    misclose = observed - known
    print("link start bearing %.8f known closing bearing %.8f angular misclose %.8f" %
          (start_bearing, known, misclose))
    # Textbook balancing: each of the four angles (A, B, C, E) takes a quarter of the error,
    # so the leg bearings turn by one, two and three quarters.
    share = -misclose / 4.0
    points, b = [truth["A"]], start_bearing
    for k in range(3):
        b = (b + angles[k] + share) % 360.0
        p = points[-1]
        points.append((p[0] + dists[k] * math.sin(math.radians(b)),
                       p[1] + dists[k] * math.cos(math.radians(b)), reduced[k + 1][2]))
        b = (b + 180.0) % 360.0
    route = ["A", "B", "C", "E"]
    show("link after angles", points, route)
    show("link compass (plan)", compass(points, truth["E"], False), route)
    open_route = reduced[:5]
    show("open to F unadjusted", open_route, order)
    show("open to F compass (plan)", compass(open_route, truth["F"], False), order)
    print("truth E %.3f %.3f F %.3f %.3f" % (truth["E"][0], truth["E"][1], truth["F"][0], truth["F"][1]))


def routes():
    rows = ["#VERSION-1.0 NEUTRAL FILE", "UNIT      UL=M,UA=D",
            "STN       ID=A,HI=1.5", "XYZ       ID=A,E=0,N=0,H=0",
            "SS        ID=B,HA=90,VA=90,SD=10,HT=1.5",
            "STN       ID=B,HI=1.5", "BKB       ID=A,HA=0", "BS        ID=A,HA=0,VA=90,SD=10,HT=1.5",
            "SS        ID=C,HA=90,VA=90,SD=10,HT=1.5",
            "STN       ID=C,HI=1.5", "BKB       ID=B,HA=0", "BS        ID=B,HA=0,VA=90,SD=10,HT=1.5",
            "SS        ID=A,HA=45,VA=90,SD=14.142,HT=1.5", "SS        ID=S,HA=200,VA=90,SD=5,HT=1.5",
            "STN       ID=S,HI=1.5", "BKB       ID=C,HA=0", "BS        ID=C,HA=0,VA=90,SD=5,HT=1.5",
            "STN       ID=B,HI=1.5", "BKB       ID=C,HA=0", "BS        ID=C,HA=0,VA=90,SD=10,HT=1.5",
            "SS        ID=E,HA=120,VA=90,SD=8,HT=1.5",
            "STN       ID=E,HI=1.5", "BKB       ID=B,HA=0", "BS        ID=B,HA=0,VA=90,SD=8,HT=1.5",
            "SS        ID=F,HA=60,VA=90,SD=8,HT=1.5",
            "STN       ID=F,HI=1.5", "BKB       ID=E,HA=0", "BS        ID=E,HA=0,VA=90,SD=8,HT=1.5",
            "SS        ID=B,HA=60,VA=90,SD=8,HT=1.5"]
    open("traverse_routes.neu", "w").write("\n".join(rows) + "\n")


loop()
link()
routes()
