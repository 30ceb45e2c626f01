#include "transfer/TransferContext.h"

#include "platform/job/UDBLayer.h"
#include "platform/job/USurveyDoc.h"
#include "platform/messages/DialogHost.h"
#include "platform/messages/ProgressSink.h"
#include "platform/messages/Translate.h"
#include "platform/text/NumberText.h"

namespace nedit {

TransferContext::TransferContext(USurveyDoc& job, DialogHost* host, ProgressSink* progress,
                                 const PointCodeReader& codes, TransferReport& report)
    : Survey(job), Questions(host), Sink(progress), Reader(codes), Outcome(report) {}

bool TransferContext::AbortRequested() {
    if (Sink != nullptr && Sink->AbortRequested()) Aborted = true;
    return Aborted;
}

void TransferContext::Progress(long n) {
    if (Sink == nullptr || n % 5 != 0 || Total < 1) return;
    Sink->Update(static_cast<int>(n * 100 / Total), L"Save To Survey");
}

USvyCode TransferContext::SurveyCode(const std::wstring& code, bool create, bool useDefault) {
    int answer = 0;
    return Survey.GetSurveyCodeEx(code.c_str(), answer, create, useDefault, false);
}

long TransferContext::GetLayerId(const USvyCode& code) {
    const std::wstring name = code.Layer.empty() ? USvyCode::kDefaultCode : code.Layer;
    const auto known = Layers.find(name);
    if (known != Layers.end()) {
        LastLayerProblem = LayerProblems[name];
        return known->second;
    }
    long id = Survey.GetLayerId(name);
    std::wstring problem;
    if (id == 0) {
        UDBLayer layer(&Survey, name);
        layer.SetColour(TextToInt(code.PointColour));
        layer.SetPointMark(TextToInt(code.PointMark));
        layer.SetSymbol(Survey.GetSymbolIndex(code.Symbol, 0));
        layer.SetLineStyle(Survey.GetLineTypeIndex(code.LineType, 0));
        layer.SetThickness(Survey.GetLineThicknessIndex(code.Thickness, 0));
        if (layer.Save(0)) {
            id = layer.GetId();
        } else {
            problem = Translate(L"the layer {1} cannot be made ({2})", {name, layer.LastError()});
        }
    }
    Survey.SetLayerActive(id);
    if (id != 0 && !Survey.CanSaveLayer(id)) {
        problem = Translate(L"the layer {1} is locked", {name});
        id = 0;
    }
    Layers.emplace(name, id);
    LayerProblems.emplace(name, problem);
    LastLayerProblem = problem;
    return id;
}

long TransferContext::PointId(const std::wstring& name) {
    if (!PointsFrozen) return Survey.GetPointId(UPointNumber(name));
    const auto known = PointIds.find(name);
    if (known != PointIds.end()) return known->second;
    const long id = Survey.GetPointId(UPointNumber(name));
    PointIds.emplace(name, id);
    return id;
}

const std::wstring& TransferContext::GetNewPoint(const std::wstring& name) const {
    const auto found = NewIDs.find(name);
    return found != NewIDs.end() ? found->second : name;
}

void TransferContext::SetNewID(const std::wstring& id, const std::wstring& jobName) {
    NewIDs[id] = jobName;
}

void TransferContext::Leave(const std::wstring& kind, const std::wstring& name,
                            const std::wstring& reason) {
    Outcome.Left.push_back({kind, name, reason});
}

void TransferContext::Tell(const std::wstring& text, unsigned icon) const {
    AppMessageBox(Questions, text, mb::Ok | icon);
}

}  // namespace nedit
