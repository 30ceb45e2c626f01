// The driver for Trimble (Geodimeter) area files. What the labels become is told in
// AreTranslator.h.

#include "AreTranslator.h"
#include "LineSession.h"

SXN_LINE_DRIVER(
    AreTranslator,
    "Trimble ARE area files: stations, reference objects, measured points and coordinates", "are")
