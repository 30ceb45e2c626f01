// The driver for the output of Topcon GTS total stations. What the records become is told in
// GtsTranslator.h.

#include "GtsTranslator.h"
#include "LineSession.h"

SXN_LINE_DRIVER(GtsTranslator,
                "Topcon GTS (GTS-220 series): stations, heights, codes and measurements", "gts,txt")
