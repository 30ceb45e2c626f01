#include "RecordSession.h"

#include <cstdio>
#include <cstdlib>

#include "BuildInfo.h"
#include "platform/text/WideText.h"

bool RecordSession::LoadDefinition() {
    if (format.LoadNeutralFileDefinition(nedit::FromUtf8(DataDirectory()))) return true;
    std::fprintf(stderr, "sxnedit: the record definition could not be loaded: %s\n",
                 nedit::ToUtf8(format.LastDefinitionError()).c_str());
    return false;
}

UNeditDatabase& RecordSession::StartEngine(USurveyDoc* job) {
    engine = std::make_unique<UNeditDatabase>(&format, &list, job, &host);
    return *engine;
}

std::string DataDirectory() {
    const char* configured = std::getenv("SXNEDIT_DATA_DIR");
    return configured != nullptr && *configured != '\0' ? configured : SXNEDIT_DATA_DIR;
}
