// The driver for the coordinate export of Leica TPS 700 instruments (TCR 705 and the like).
// What the lines become is told in Tps700Translator.h.

#include "LineSession.h"
#include "Tps700Translator.h"

SXN_LINE_DRIVER(Tps700Translator,
                "Leica TPS 700 coordinate export: set-ups, orientation and points", "txt,frt")
