// The driver for Carlson RW5 raw files. What the records become is told in Rw5Translator.h,
// how a line is read in Rw5Record.h.

#include "LineSession.h"
#include "Rw5Translator.h"

SXN_LINE_DRIVER(
    Rw5Translator,
    "Carlson RW5 raw data: set-ups, back sights, angle sets, side shots and stored points",
    "rw5,raw")
