#include "RecordSession.h"

#include <cstdio>
#include <cstdlib>

#include "BuildInfo.h"
#include "platform/text/WideText.h"
#include "report/NeditIni.h"

bool RecordSession::Start(USurveyDoc* job) {
    nedit::InstallDefaultNeditIni(DataDirectory());
    doc = std::make_unique<UNeditDoc>(job);
    list = std::make_unique<UListCtrl>(doc.get());
    if (doc->LoadNeutralFileDefinition(nedit::FromUtf8(DataDirectory()))) return true;
    std::fprintf(stderr, "sxnedit: the record definition could not be loaded: %s\n",
                 nedit::ToUtf8(doc->LastDefinitionError()).c_str());
    return false;
}

UNeditDatabase& RecordSession::StartEngine(bool withReport) {
    engine = std::make_unique<UNeditDatabase>(doc.get(), list.get(), doc->GetSurveyDoc(), &host);
    if (withReport) {
        report = std::make_unique<UNeditReport>(doc.get(), L"Raw Data Reduction Report");
        engine->SetReportPtr(report.get());
    }
    return *engine;
}

std::string DataDirectory() {
    const char* configured = std::getenv("SXNEDIT_DATA_DIR");
    return configured != nullptr && *configured != '\0' ? configured : SXNEDIT_DATA_DIR;
}
