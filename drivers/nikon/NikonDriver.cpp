// The driver for Nikon RAW v2.00 files, as Nikon instruments and the Trimble M3 write them.
// What the records become is told in NikonTranslator.h.

#include "LineSession.h"
#include "NikonTranslator.h"

SXN_LINE_DRIVER(NikonTranslator,
                "Nikon RAW v2.00: stations, back sights on both faces, side shots and coordinates",
                "raw")
