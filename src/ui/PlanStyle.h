#pragma once
// How the plan looks: a dark drafting background, the colours of the system's colour
// numbers, and the labels the document's display settings ask for.
//
// Colour numbers 0 to 15 are the sixteen colours the system has always drawn with (1 dark
// blue ... 12 red, 14 yellow, 15 white); a larger number takes its value modulo 16. Black
// would vanish on the background and is drawn white.

#include <QColor>
#include <QString>

class UNeditSettings;
class UJobSettings;

namespace nedit {

struct PlanStyle {
    QColor background{0x1e, 0x23, 0x2a};
    QColor highlight{0xff, 0xc1, 0x07};
    QColor label{0xd8, 0xde, 0xe6};
    bool pointNumbers = false;
    bool pointCodes = false;
    bool heights = false;
    /// 0 "Normal" (9 points), 1 "Large" (12 points).
    int textSize = 0;
    /// With more points than this in view, labels would only cover one another and are
    /// left out until the user zooms in.
    int labelLimit = 3000;
    /// The job's length unit, as the scale bar names it.
    QString unit = QStringLiteral("m");

    /// The display settings of a document and the show-height setting of its job.
    static PlanStyle From(const UNeditSettings& settings, const UJobSettings& job);
    /// The colour of a colour number.
    static QColor Colour(int number);
    int LabelPointSize() const { return textSize == 1 ? 12 : 9; }
};

}  // namespace nedit
