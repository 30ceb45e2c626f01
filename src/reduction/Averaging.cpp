// Folding the measurements of each target into one face-1 mean, and the angle of each
// target from the back sight.

#include <cmath>

#include "platform/geometry/UAngle.h"
#include "reduction/ProgressPercent.h"
#include "reduction/UNeditDatabase.h"

namespace {

constexpr const wchar_t* kGeneratingGraphics = L"Generating Graphics";

// The running mean of readings that may wrap at 0 and 360: a new value enters with the
// weight 1/n, one side of the wrap moved by a turn when the two lie across it.
double UpdateMean(double mean, double value, int n) {
    double a = value;
    double m = mean;
    if (std::fabs(value - mean) > 180.0) {
        if (value > mean && value > 270.0 && mean < 90.0) {
            a = value - 360.0;
        } else if (value <= mean && mean > 270.0 && value < 90.0) {
            m = mean - 360.0;
        }
    }
    double result = ((n - 1) * m + a) / n;
    if (result < 0.0) result += 360.0;
    return result;
}

// A measurement as face 1 readings.
void Fold(const MEASSTRUCT& measurement, double& hAng, double& vAng) {
    hAng = measurement.HAng;
    vAng = measurement.VAng;
    if (UNeditDatabase::CheckFace(vAng) == 2) {
        hAng = UNeditDatabase::chgface(hAng);
        vAng = UNeditDatabase::chgVaface(vAng);
    }
}

void AverageTarget(const UNeditDatabase& engine, SSSTRUCT& target) {
    if (target.Meas->empty()) {
        target.HAng = target.VAng = target.SDist = target.HtTarget = 0.0;
        target.MeanValid = 0;
        return;
    }
    engine.FindAverageMeas(*target.Meas, target.HAng, target.VAng, target.SDist, target.HtTarget);
    target.MeanValid = 1;
}

}  // namespace

int UNeditDatabase::CheckFace(double zenith) {
    return zenith > 180.0 && zenith < 360.0 ? 2 : 1;
}

double UNeditDatabase::chgface(double hAng) {
    return UAngle::ValidateData(hAng + 180.0);
}

double UNeditDatabase::chgVaface(double zenith) {
    return 360.0 - zenith;
}

double UNeditDatabase::AngleDiff(double from, double to) {
    if (from > to) to += 360.0;
    return to - from;
}

double UNeditDatabase::chgDeg(double dddmmss) {
    const double magnitude = std::fabs(dddmmss);
    long degrees = static_cast<long>(magnitude);
    const double minutes_and_rest = (magnitude - static_cast<double>(degrees)) * 100.0;
    long minutes = static_cast<long>(minutes_and_rest);
    long seconds =
        static_cast<long>((minutes_and_rest - static_cast<double>(minutes)) * 100.0 + 0.5);
    // The carries happen at 100, as the field programs have always done.
    if (seconds > 99) {
        minutes += 1;
        seconds %= 100;
    }
    if (minutes > 99) {
        degrees += 1;
        minutes %= 100;
    }
    if (degrees > 359) degrees %= 360;
    const double result = static_cast<double>(degrees) + static_cast<double>(minutes) / 60.0 +
                          static_cast<double>(seconds) / 3600.0;
    return dddmmss < 0.0 ? -result : result;
}

int UNeditDatabase::FindAverageMeas(const MeasurementList& measurements, double& hAng, double& vAng,
                                    double& sDist, double& htTarget) const {
    hAng = vAng = sDist = htTarget = 0.0;
    if (measurements.empty()) return 0;
    int n = 1;
    Fold(measurements.front(), hAng, vAng);
    double distance_sum = measurements.front().SDist;
    double height_sum = measurements.front().HtTarget;
    sDist = distance_sum;
    htTarget = height_sum;
    for (std::size_t i = 1; i < measurements.size(); ++i) {
        ++n;
        distance_sum += measurements[i].SDist;
        height_sum += measurements[i].HtTarget;
        double h = 0.0;
        double v = 0.0;
        Fold(measurements[i], h, v);
        hAng = UpdateMean(hAng, h, n);
        vAng = UpdateMean(vAng, v, n);
    }
    if (n >= 2) {
        sDist = distance_sum / n;
        htTarget = height_sum / n;
    }
    return 1;
}

int UNeditDatabase::ProcessAverageMeas() {
    // Point-only nodes have nothing to average; they count one step each. The set-ups walked
    // include the station of a last STN record, which never joins the list's nodes.
    std::size_t steps = PointNodes.size();
    for (const STNSTRUCT& station : Setups)
        steps += 1 + station.SSList.size() + station.FSList.size();
    std::size_t done = PointNodes.size();
    for (STNSTRUCT& station : Setups) {
        if (AbortRequested()) return 0;
        done += 1 + station.SSList.size() + station.FSList.size();
        UpdateProgress(ProgressPercent(done, steps), kGeneratingGraphics);
        for (SSSTRUCT* target : station.BSList) AverageTarget(*this, *target);
        for (SSSTRUCT* target : station.FSList) AverageTarget(*this, *target);
        for (SSSTRUCT* target : station.SSList) {
            if (!target->SkipMean) AverageTarget(*this, *target);
        }
    }
    return 1;
}

int UNeditDatabase::ProcessAverageAngle() {
    for (STNSTRUCT& node : Setups) {
        STNSTRUCT* station = &node;
        double reference = station->BkAngle;
        if (!station->BSList.empty() && station->BSList.front()->MeanValid) {
            reference = station->BSList.front()->HAng;
        }
        auto set_angle = [reference](SSSTRUCT& target) {
            double h = target.HAng;
            if (reference > h) h += 360.0;
            target.AngleFromBS = h - reference;
            target.AngleValid = 1;
        };
        for (SSSTRUCT* target : station->FSList) {
            if (target->MeanValid) set_angle(*target);
        }
        for (SSSTRUCT* target : station->SSList) {
            if (target->MeanValid && !target->SkipMean) set_angle(*target);
        }
    }
    return 1;
}
