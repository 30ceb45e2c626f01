// generate_survey: writes a generated survey as a neutral file, for measuring the program on
// files of any size and for the tests that compare its output on one.
//
// generate_survey STATIONS [--seed N] [--unknown-back-every N] [--unpositioned-every N]
//                 [--side-shots N] [--rounds N] [--one-face] [--offset-every N] [-o FILE]

#include <cstdio>
#include <cstdlib>
#include <string>

#include "SurveyGenerator.h"

namespace {

int Usage() {
    std::fprintf(stderr,
                 "usage: generate_survey STATIONS [--seed N] [--unknown-back-every N]\n"
                 "       [--unpositioned-every N] [--side-shots N] [--rounds N] [--one-face]\n"
                 "       [--offset-every N] [-o FILE]\n");
    return 64;
}

bool Number(const char* text, int& value) {
    char* end = nullptr;
    const long number = std::strtol(text, &end, 10);
    if (end == text || *end != '\0' || number < 0 || number > 100'000'000) return false;
    value = static_cast<int>(number);
    return true;
}

}  // namespace

int main(int argc, char** argv) {
    nedit::SurveyShape shape;
    std::string output;
    if (argc < 2 || !Number(argv[1], shape.stations)) return Usage();
    for (int i = 2; i < argc; ++i) {
        const std::string option = argv[i];
        if (option == "--one-face") {
            shape.bothFaces = false;
            continue;
        }
        if (i + 1 == argc) return Usage();
        const char* value = argv[++i];
        int number = 0;
        if (option == "-o") {
            output = value;
        } else if (!Number(value, number)) {
            return Usage();
        } else if (option == "--seed") {
            shape.seed = static_cast<std::uint32_t>(number);
        } else if (option == "--unknown-back-every") {
            shape.unknownBackEvery = number;
        } else if (option == "--unpositioned-every") {
            shape.unpositionedEvery = number;
        } else if (option == "--side-shots") {
            shape.sideShots = number;
        } else if (option == "--rounds") {
            shape.rounds = number;
        } else if (option == "--offset-every") {
            shape.offsetEvery = number;
        } else {
            return Usage();
        }
    }
    if (output.empty()) {
        nedit::GenerateSurvey(shape, [](const std::string& line) {
            std::fwrite(line.data(), 1, line.size(), stdout);
            std::fputc('\n', stdout);
        });
        return std::fflush(stdout) == 0 ? 0 : 1;
    }
    if (nedit::WriteSurvey(shape, output)) return 0;
    std::fprintf(stderr, "generate_survey: cannot write %s\n", output.c_str());
    return 1;
}
