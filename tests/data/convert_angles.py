#!/usr/bin/env python3
"""Writes closed_traverse_dms.neu and closed_traverse_gon.neu: the survey of
closed_traverse.neu (decimal degrees) with every angle (HA, VA, BRG) converted here, to
ddd.mmss with seconds to 1e-4 and to gons to 1e-8, so that three files hold one survey."""
import re

ANGLE = re.compile(r"\b(HA|VA|BRG)=([-0-9.]+)")


def to_dms(degrees):
    seconds = round(degrees * 3600.0, 4)
    d, rest = divmod(seconds, 3600.0)
    m, s = divmod(rest, 60.0)
    return "%d.%02d%s" % (d, m, ("%07.4f" % s).replace(".", ""))


def to_gon(degrees):
    return "%.8f" % (degrees * 400.0 / 360.0)


def convert(unit, write):
    with open("closed_traverse.neu") as source:
        rows = source.read().splitlines()
    out = []
    for row in rows:
        if row.startswith("UNIT"):
            row = row.replace("UA=D", "UA=" + unit)
        elif not row.startswith("#"):
            row = ANGLE.sub(lambda m: "%s=%s" % (m.group(1), write(float(m.group(2)))), row)
        out.append(row)
    return "\n".join(out) + "\n"


with open("closed_traverse_dms.neu", "w") as out:
    out.write(convert("S", to_dms))
with open("closed_traverse_gon.neu", "w") as out:
    out.write(convert("G", to_gon))
