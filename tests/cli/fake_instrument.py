#!/usr/bin/env python3
"""An instrument on a pseudo-terminal for the command-line tests.

Usage: fake_instrument.py RAWFILE PATHFILE
       fake_instrument.py --receive OUTFILE PATHFILE
Writes the terminal's device path to PATHFILE and waits until the program has set the
terminal to raw bytes. Then it plays RAWFILE line by line as a slow link would, ends the
transmission with EOT and keeps the link open a moment longer; or, with --receive, keeps
what comes until the program closes the port (or nothing has come for five seconds) and
writes it to OUTFILE.
"""
import os
import pty
import select
import sys
import termios
import time


def open_link(path_file):
    master, slave = pty.openpty()
    with open(path_file + ".part", "w") as out:
        out.write(os.ttyname(slave))
    os.rename(path_file + ".part", path_file)
    deadline = time.time() + 20
    while termios.tcgetattr(slave)[3] & termios.ICANON:
        if time.time() > deadline:
            sys.exit("the program never opened the port")
        time.sleep(0.02)
    return master, slave


def play(raw_file, path_file):
    master, _ = open_link(path_file)
    with open(raw_file, "rb") as raw:
        data = raw.read()
    for line in data.replace(b"\r", b"\r\0").split(b"\0"):
        os.write(master, line)
        time.sleep(0.005)
    os.write(master, b"\x04")
    time.sleep(1)


def receive(out_file, path_file):
    master, slave = open_link(path_file)
    os.close(slave)  # so that the program's closing of the port ends the reading
    received = b""
    while select.select([master], [], [], 5)[0]:
        try:
            data = os.read(master, 4096)
        except OSError:  # the port was closed
            break
        if not data:
            break
        received += data
    with open(out_file, "wb") as out:
        out.write(received)


if sys.argv[1] == "--receive":
    receive(sys.argv[2], sys.argv[3])
else:
    play(sys.argv[1], sys.argv[2])
