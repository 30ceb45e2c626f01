// Save To Survey: the document hands the engine's stores to the transfer.

#include "document/UNeditDoc.h"
#include "platform/job/USurveyDoc.h"
#include "reduction/UNeditDatabase.h"
#include "transfer/CodeGrammarReader.h"
#include "transfer/TransferRun.h"

int UNeditDoc::TransferToJob() {
    if (!Database) return 0;
    return TransferToJob(*Database);
}

int UNeditDoc::TransferToJob(const UNeditDatabase& engine, const std::wstring& source) {
    if (SurveyDoc == nullptr) return 0;
    const nedit::CodeGrammarReader grammar(SurveyDoc->GetCodeSettings());
    nedit::TransferRun run(SurveyDoc, Host, Progress,
                           CodeReader != nullptr ? *CodeReader : grammar);
    const int result =
        run.TransferToJob({engine.GetPointList(), engine.GetLineList(), engine.GetArcList(),
                           &engine.GetDbCoordNames(), source.empty() ? GetName() : source});
    LastTransfer = run.GetReport();
    return result;
}
