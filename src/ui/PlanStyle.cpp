#include "ui/PlanStyle.h"

#include <array>

#include "document/UNeditSettings.h"
#include "platform/job/UJobSettings.h"
#include "platform/units/Units.h"

namespace nedit {

PlanStyle PlanStyle::From(const UNeditSettings& settings, const UJobSettings& job) {
    PlanStyle style;
    style.pointNumbers = settings.Get(UNeditSettings::ShowPointNumbers) != 0;
    style.pointCodes = settings.Get(UNeditSettings::ShowPointCodes) != 0;
    style.textSize = settings.Get(UNeditSettings::TextSize);
    style.heights = job.GetShowHeight();
    switch (job.GetLengthUnit()) {
        case LengthUnit::Feet:
            style.unit = QStringLiteral("ft");
            break;
        case LengthUnit::USFeet:
            style.unit = QStringLiteral("US ft");
            break;
        default:
            break;
    }
    return style;
}

QColor PlanStyle::Colour(int number) {
    static const std::array<QColor, 16> kColours = {
        QColor(255, 255, 255), QColor(64, 96, 255),   QColor(0, 170, 0),    QColor(0, 170, 170),
        QColor(200, 40, 40),   QColor(190, 60, 190),  QColor(190, 140, 40), QColor(192, 192, 192),
        QColor(128, 128, 128), QColor(100, 140, 255), QColor(80, 230, 80),  QColor(80, 230, 230),
        QColor(255, 70, 70),   QColor(255, 90, 255),  QColor(255, 235, 60), QColor(255, 255, 255)};
    const int index = ((number % 16) + 16) % 16;
    return kColours[static_cast<std::size_t>(index)];
}

}  // namespace nedit
