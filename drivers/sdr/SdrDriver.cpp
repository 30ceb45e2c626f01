// The driver for Sokkia SDR33 and SDR2x files. What the records become is told in
// SdrTranslator.h.

#include "LineSession.h"
#include "SdrTranslator.h"

SXN_LINE_DRIVER(SdrTranslator,
                "Sokkia SDR33 and SDR2x: stations, back sights, observations and coordinates",
                "sdr")
