#include "RecordSession.h"

#include <cstdio>

#include "Commands.h"
#include "platform/job/JobError.h"
#include "platform/job/USurveyDoc.h"
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

int RecordSession::Start(const std::string& jobPath, bool quiet) {
    if (!jobPath.empty()) {
        try {
            openedJob = USurveyDoc::OpenJob(jobPath);
        } catch (const nedit::JobError& error) {
            std::fprintf(stderr, "sxnedit: %s\n", error.what());
            return exit_status::Unreadable;
        }
    }
    host.SetEcho(!quiet);
    return Start(openedJob.get()) ? exit_status::Ok : exit_status::Failed;
}

bool RecordSession::Load(const std::string& path, bool quiet) {
    if (StartEngine().LoadNeFile(nedit::FromUtf8(path))) return true;
    if (quiet) {
        for (const std::wstring& message : host.Messages())
            std::fprintf(stderr, "sxnedit: %s\n", nedit::ToUtf8(message).c_str());
    }
    return false;
}
