// The driver for Zeiss (Trimble) Elta data in the R4, R5 and Rec 500 layouts. What the lines
// become is told in ZeissTranslator.h, how they are read in ZeissLine.h.

#include "LineSession.h"
#include "ZeissTranslator.h"

SXN_LINE_DRIVER(ZeissTranslator,
                "Zeiss Elta R4, R5 and Rec 500: stations, orientation, points and polar readings",
                "r4,r5,rec,dat")
