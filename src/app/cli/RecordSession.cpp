#include "RecordSession.h"

#include <cstdio>

#include "platform/settings/DataDirectory.h"
#include "platform/text/WideText.h"
#include "report/NeditIni.h"

bool RecordSession::Start(USurveyDoc* job) {
    nedit::InstallDefaultNeditIni(nedit::DataDirectory());
    doc = std::make_unique<UNeditDoc>(job);
    doc->SetDialogHost(&host);
    list = std::make_unique<UListCtrl>(doc.get());
    if (doc->IsKeysInitialised()) return true;
    std::fprintf(stderr, "sxnedit: the record definition could not be loaded: %s\n",
                 nedit::ToUtf8(doc->LastDefinitionError()).c_str());
    return false;
}

UNeditDatabase& RecordSession::StartEngine() {
    engine = std::make_unique<UNeditDatabase>(doc.get(), list.get(), doc->GetSurveyDoc(), &host);
    report = std::make_unique<UNeditReport>(doc.get(), L"Raw Data Reduction Report");
    engine->SetReportPtr(report.get());
    // Every run finds the routes, as the document's own engines do.
    doc->GetTraverseRoutes().ClearTraverseList();
    engine->AddStage(&doc->GetTraverseRoutes());
    return *engine;
}
