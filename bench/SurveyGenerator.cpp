#include "SurveyGenerator.h"

#include <cmath>
#include <cstdarg>
#include <cstdio>
#include <fstream>
#include <random>

namespace nedit {
namespace {

constexpr double kPi = 3.141592653589793;
constexpr double kDegree = kPi / 180.0;
constexpr double kPrismHeight = 1.5;
constexpr const char* kCodes[] = {"FC01", "TR", "FENCE", "KB", "EP",
                                  "BLD",  "CL", "TREE",  "WM", "POST"};

struct Position {
    double east = 0.0;
    double north = 0.0;
    double height = 0.0;
};

// One observation as the instrument records it: circle reading, zenith angle, slope distance.
struct Reading {
    double horizontal = 0.0;
    double zenith = 0.0;
    double distance = 0.0;
};

std::string Printf(const char* format, ...) {
    char buffer[256];
    va_list arguments;
    va_start(arguments, format);
    const int length = std::vsnprintf(buffer, sizeof buffer, format, arguments);
    va_end(arguments);
    return std::string(buffer, static_cast<std::size_t>(length));
}

double Normalised(double degrees) {
    const double turn = std::fmod(degrees, 360.0);
    return turn < 0.0 ? turn + 360.0 : turn;
}

// Degrees as ddd.mmsss, seconds to a tenth, as instruments write them.
std::string Sexagesimal(double degrees) {
    constexpr long long kTenthsPerTurn = 360LL * 36000;
    long long tenths = std::llround(Normalised(degrees) * 36000.0) % kTenthsPerTurn;
    const long long whole = tenths / 36000;
    tenths %= 36000;
    return Printf("%lld.%02lld%03lld", whole, tenths / 600, tenths % 600);
}

class Generator {
  public:
    Generator(const SurveyShape& shape, const std::function<void(const std::string&)>& line)
        : Shape(shape), Line(line), Random(shape.seed) {}

    void Run();

  private:
    double Uniform(double low, double high) {
        return low + (high - low) * (static_cast<double>(Random()) / 4294967296.0);
    }
    Position NextStation(const Position& from);
    Position Around(const Position& station, double nearest, double farthest);
    bool Unpositioned(int station) const {
        return station > 0 && Shape.unpositionedEvery > 0 && station % Shape.unpositionedEvery == 0;
    }
    bool UnknownBack(int station) const {
        return station > 0 && Shape.unknownBackEvery > 0 && station % Shape.unknownBackEvery == 0;
    }
    /// The reading of `target` from `station`, whose circle reads `zero` on `backBearing`;
    /// face 2 when `face2`, each value with a little noise.
    Reading Observe(const Position& station, double instrument, const Position& target,
                    double targetHeight, double backBearing, double zero, bool face2);
    void Observation(const char* key, const std::string& name, const Reading& reading,
                     double targetHeight, const char* code);
    void Station(int index, const Position& here, const Position* back, const Position* next);

    const SurveyShape& Shape;
    const std::function<void(const std::string&)>& Line;
    std::mt19937 Random;
    double Heading = 0.0;
    long long NextPoint = 1000;
    long long SideShots = 0;

    /// The code of the n-th side shot in a survey of coded strings.
    std::string StringCode(long long shot) const {
        static constexpr const char* kFeatures[] = {"KB", "FE", "BLD", "WL"};
        const long long string = shot % Shape.strings;
        const long long place = shot / Shape.strings;
        std::string code = kFeatures[string % 4] + std::to_string(string / 4 + 1);
        if (place % 10 == 3) code += "*AS";
        if (place % 10 == 4) code += "*AE";
        if (place % 50 == 20) code += "*RECT2.5";
        if (place % 20 == 10 || place % 20 == 11) code += "*OS1.5";
        if (place % 100 == 40) code += "*CR";
        return code;
    }
};

Position Generator::NextStation(const Position& from) {
    Heading = Normalised(Heading + Uniform(-40.0, 40.0));
    const double leg = Uniform(60.0, 180.0);
    return {from.east + leg * std::sin(Heading * kDegree),
            from.north + leg * std::cos(Heading * kDegree), from.height + Uniform(-3.0, 3.0)};
}

Position Generator::Around(const Position& station, double nearest, double farthest) {
    const double bearing = Uniform(0.0, 360.0);
    const double distance = Uniform(nearest, farthest);
    return {station.east + distance * std::sin(bearing * kDegree),
            station.north + distance * std::cos(bearing * kDegree),
            station.height + Uniform(-2.0, 2.0)};
}

Reading Generator::Observe(const Position& station, double instrument, const Position& target,
                           double targetHeight, double backBearing, double zero, bool face2) {
    const double de = target.east - station.east;
    const double dn = target.north - station.north;
    const double horizontal = std::hypot(de, dn);
    const double vertical = target.height + targetHeight - station.height - instrument;
    const double bearing = std::atan2(de, dn) / kDegree;
    Reading reading;
    reading.horizontal = Normalised(zero + bearing - backBearing + Uniform(-3.0, 3.0) / 3600.0);
    reading.zenith = std::atan2(horizontal, vertical) / kDegree + Uniform(-5.0, 5.0) / 3600.0;
    reading.distance = std::hypot(horizontal, vertical) + Uniform(-0.002, 0.002);
    if (face2) {
        reading.horizontal = Normalised(reading.horizontal + 180.0);
        reading.zenith = 360.0 - reading.zenith;
    }
    return reading;
}

void Generator::Observation(const char* key, const std::string& name, const Reading& reading,
                            double targetHeight, const char* code) {
    Line(Printf("%-9s ID=%s,HA=%s,VA=%s,SD=%.3f,HT=%.3f,CO=%s", key, name.c_str(),
                Sexagesimal(reading.horizontal).c_str(), Sexagesimal(reading.zenith).c_str(),
                reading.distance, targetHeight, code));
}

void Generator::Station(int index, const Position& here, const Position* back,
                        const Position* next) {
    const std::string name = "S" + std::to_string(index);
    const double instrument = std::round(Uniform(1.4, 1.7) * 1000.0) / 1000.0;
    Line(Printf("STN       ID=%s,HI=%.3f,CO=STN", name.c_str(), instrument));

    // The back station: the station before, a reference mark nothing knows, or for the first
    // station a reference object on a known bearing.
    std::string back_name = "S" + std::to_string(index - 1);
    Position back_position = back != nullptr ? *back : Position{};
    const double zero = Uniform(0.0, 360.0);
    if (index == 0 || UnknownBack(index)) {
        back_name = index == 0 ? "RO" : "RM" + std::to_string(index);
        back_position = Around(here, 30.0, 200.0);
    }
    const double back_bearing = Normalised(
        std::atan2(back_position.east - here.east, back_position.north - here.north) / kDegree);
    if (index == 0) {
        Line(Printf("XYZ       ID=%s,E=%.3f,N=%.3f,H=%.3f", name.c_str(), here.east, here.north,
                    here.height));
        Line(Printf("BKB       ID=%s,BRG=%s,HA=%s", back_name.c_str(),
                    Sexagesimal(back_bearing).c_str(), Sexagesimal(zero).c_str()));
    } else {
        Line(Printf("BKB       ID=%s,HA=%s", back_name.c_str(), Sexagesimal(zero).c_str()));
    }

    const std::string next_name = "S" + std::to_string(index + 1);
    const int faces = Shape.bothFaces ? 2 : 1;
    auto sight = [&](const char* key, const std::string& target, const Position& position,
                     bool face2) {
        Observation(key, target,
                    Observe(here, instrument, position, kPrismHeight, back_bearing, zero, face2),
                    kPrismHeight, key[0] == 'B' ? "" : "STN");
    };
    for (int round = 0; round < Shape.rounds; ++round) {
        sight("BS", back_name, back_position, false);
        if (next != nullptr) {
            for (int face = 0; face < faces; ++face) sight("SS", next_name, *next, face == 1);
        }
        if (faces == 2) sight("BS", back_name, back_position, true);
    }

    for (int shot = 0; shot < Shape.sideShots; ++shot) {
        const Position point = Around(here, 5.0, 80.0);
        const double target_height = shot % 4 == 0 ? 2.0 : 1.6;
        const std::string point_name = std::to_string(NextPoint++);
        const char* plain = kCodes[Random() % (sizeof kCodes / sizeof kCodes[0])];
        const std::string coded = Shape.strings > 0 ? StringCode(SideShots) : std::string();
        const char* code = Shape.strings > 0 ? coded.c_str() : plain;
        for (int face = 0; face < faces; ++face) {
            Observation(
                "SS", point_name,
                Observe(here, instrument, point, target_height, back_bearing, zero, face == 1),
                target_height, code);
        }
        ++SideShots;
        if (Shape.offsetEvery > 0 && SideShots % Shape.offsetEvery == 0) {
            // Drawn one after the other: the order of a call's arguments is the compiler's.
            const double along = Uniform(-0.5, 0.5);
            const double right = Uniform(-0.5, 0.5);
            Line(Printf("OFFSET    OA=%.3f,OR=%.3f,OU=%.3f", along, right, 0.0));
        }
    }
}

void Generator::Run() {
    Line("#VERSION-1.0 NEUTRAL FILE");
    Line(Printf("JOB       GENERATED SURVEY %u", static_cast<unsigned>(Shape.seed)));
    Line("DATE      2026-11-20");
    Line("UNIT      UL=M,UA=S");
    Line("AMODE     HM=A,VM=Z");
    Heading = Uniform(0.0, 360.0);
    Position back;
    Position here{100000.0, 200000.0, 50.0};
    Position next = NextStation(here);
    for (int index = 0; index < Shape.stations; ++index) {
        const bool last = index + 1 == Shape.stations;
        // A station that nothing positions is not observed from the station before.
        const bool observes_next = !last && !Unpositioned(index + 1);
        Station(index, here, index > 0 ? &back : nullptr, observes_next ? &next : nullptr);
        back = here;
        here = next;
        next = NextStation(here);
    }
}

}  // namespace

void GenerateSurvey(const SurveyShape& shape, const std::function<void(const std::string&)>& line) {
    Generator(shape, line).Run();
}

bool WriteSurvey(const SurveyShape& shape, const std::string& path) {
    std::ofstream file(path, std::ios::binary | std::ios::trunc);
    if (!file) return false;
    GenerateSurvey(shape, [&file](const std::string& line) { file << line << '\n'; });
    file.close();
    return static_cast<bool>(file);
}

}  // namespace nedit
