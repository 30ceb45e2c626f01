#pragma once
// One entry of a traverse under computation.

#include <string>

struct SSSTRUCT;
struct STNSTRUCT;

struct CTravStn {
    std::wstring Name;
    /// Horizontal length of the leg leaving this entry; written by the angle adjustment.
    double Dist = 0.0;
    /// The entry's position during the computation.
    double X = 0.0;
    double Y = 0.0;
    double Z = 0.0;
    /// The set-up, not owned; null on a last entry that is no set-up.
    const STNSTRUCT* Stn = nullptr;
    /// The observation from Stn to the next entry, not owned; null on the last entry.
    const SSSTRUCT* SS = nullptr;
};
