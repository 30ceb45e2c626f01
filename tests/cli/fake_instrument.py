#!/usr/bin/env python3
"""An instrument on a pseudo-terminal for the command-line tests.

Usage: fake_instrument.py RAWFILE PATHFILE
Writes the terminal's device path to PATHFILE, waits until the download has set the
terminal to raw bytes, plays RAWFILE line by line as a slow link would, then ends the
transmission with EOT and keeps the link open a moment longer.
"""
import os
import pty
import sys
import termios
import time

raw_file, path_file = sys.argv[1], sys.argv[2]
master, slave = pty.openpty()
with open(path_file + ".part", "w") as out:
    out.write(os.ttyname(slave))
os.rename(path_file + ".part", path_file)

deadline = time.time() + 20
while termios.tcgetattr(slave)[3] & termios.ICANON:
    if time.time() > deadline:
        sys.exit("the download never opened the port")
    time.sleep(0.02)

with open(raw_file, "rb") as raw:
    data = raw.read()
for line in data.replace(b"\r", b"\r\0").split(b"\0"):
    os.write(master, line)
    time.sleep(0.005)
os.write(master, b"\x04")
time.sleep(1)
