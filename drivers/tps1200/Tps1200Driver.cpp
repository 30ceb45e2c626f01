// The driver for the data export of Leica System 1200 total stations (TCR 1205 and the like).
// What the sections become is told in Tps1200Translator.h.

#include "LineSession.h"
#include "Tps1200Translator.h"

SXN_LINE_DRIVER(Tps1200Translator,
                "Leica System 1200 data export: stations, measurements, points and lines",
                "txt,gsi1200")
