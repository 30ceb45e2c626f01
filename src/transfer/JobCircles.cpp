#include "transfer/JobCircles.h"

#include <utility>

#include "platform/geometry/Tolerance.h"
#include "platform/geometry/UWCircle.h"
#include "platform/job/UDBCircle.h"
#include "platform/job/UDBPoint.h"
#include "platform/job/USurveyDoc.h"
#include "platform/messages/Translate.h"
#include "platform/text/NumberText.h"
#include "platform/text/WideText.h"
#include "transfer/PointCodeReader.h"
#include "transfer/TransferContext.h"

namespace nedit {

namespace {

// Names tried for the centre of a circle through three points.
constexpr int kCentreNames = 10000;

}  // namespace

JobCircles::JobCircles(TransferContext& context, std::wstring radiusCommand,
                       std::wstring circumCommand)
    : Context(context) {
    Radius.Keyword = std::move(radiusCommand);
    Circum.Keyword = std::move(circumCommand);
}

void JobCircles::ResetCircleData() {
    Radius.Reset();
    Circum.Reset();
}

bool JobCircles::Holds(const std::wstring& code, const std::wstring& command) const {
    if (command.empty()) return false;
    for (const CodeGroup& group : Context.Codes().Parse(code)) {
        if (Context.Codes().HasCommand(group, command)) return true;
    }
    return false;
}

bool JobCircles::SameString(long point, const std::wstring& command, const CodeGroup& first) const {
    const UDBPoint stored(&Context.Job(), point);
    for (const CodeGroup& group : Context.Codes().Parse(stored.GetCode())) {
        if (Context.Codes().HasCommand(group, command))
            return group.Code == first.Code && group.StrNo == first.StrNo;
    }
    return false;
}

bool JobCircles::Takes(const UDBPoint& saved, const CodeGroup& first, const std::wstring& code) {
    // The commands are read in the code the job keeps; a command that did not go into it
    // opens no circle, and the user is told so.
    bool hit = false;
    for (Command* command : {&Radius, &Circum}) {
        if (Holds(code, command->Keyword) && !Holds(saved.GetCode(), command->Keyword)) {
            Context.Leave(L"circle", saved.GetName(),
                          Translate(L"the circle command {1} of its code is not in the job's "
                                    L"point code (\"Include Commands\" is off)",
                                    {command->Keyword}));
        }
        if (command->Active) {
            hit = hit || (!command->Points.empty() &&
                          SameString(command->Points.front(), command->Keyword, first));
        } else if (Holds(saved.GetCode(), command->Keyword)) {
            command->Active = true;
            hit = true;
        }
    }
    return hit;
}

void JobCircles::Add(const UDBPoint& saved, const CodeGroup& first, const USvyCode& code) {
    if (Radius.Active) {
        if (Radius.Points.empty()) {
            Radius.Points.push_back(saved.GetId());
        } else {
            const UDBPoint centre(&Context.Job(), Radius.Points.front());
            const double radius = centre.GetPoint().DistanceTo(saved.GetPoint());
            if (!Is_Zero(radius, false)) {
                SaveCircle(centre.GetId(), radius, code, false, centre.GetName());
            } else {
                Context.Leave(
                    L"circle", centre.GetName(),
                    Translate(L"its rim point {1} lies on the centre", {saved.GetName()}));
            }
            Radius.Reset();
        }
    }
    if (Circum.Active) {
        if (Circum.Points.size() < 2) {
            Circum.Points.push_back(saved.GetId());
            return;
        }
        const UDBPoint one(&Context.Job(), Circum.Points[0]);
        const UDBPoint two(&Context.Job(), Circum.Points[1]);
        const UWCircle circle(saved.GetPoint(), one.GetPoint(), two.GetPoint());
        if (!Is_Zero(circle.GetRadius(), false)) {
            const long centre = SaveCentre(circle.GetCentre(), saved, first);
            if (centre != 0) {
                SaveCircle(centre, circle.GetRadius(), code, code.LineUseInSurface != 0,
                           saved.GetName());
            }
        } else {
            Context.Leave(L"circle", saved.GetName(),
                          Translate(L"its points {1}, {2} and {3} lie on one line",
                                    {one.GetName(), two.GetName(), saved.GetName()}));
        }
        Circum.Reset();
    }
}

long JobCircles::SaveCentre(const UWPoint& at, const UDBPoint& rim, const CodeGroup& first) {
    USurveyDoc& job = Context.Job();
    std::wstring name;
    for (int number = 1; number <= kCentreNames; ++number) {
        name = L"Center-" + std::to_wstring(number);
        if (Context.PointId(name) == 0) break;
    }
    UDBPoint centre(&job, at);
    centre.SetName(name);
    centre.SetCode(first.Code);
    centre.SetLayer(rim.GetLayer());
    centre.SetColour(rim.GetColour());
    centre.SetPointMark(rim.GetPointMark());
    if (!centre.Save(1, false, false)) {
        Context.Leave(
            L"circle", rim.GetName(),
            Translate(L"its centre point {1} cannot be saved: {2}", {name, centre.LastError()}));
        return 0;
    }
    ++Context.Report().PointsAdded;
    return centre.GetId();
}

bool JobCircles::SaveCircle(long centre, double radius, const USvyCode& code, bool useInSurface,
                            const std::wstring& name) {
    USurveyDoc& job = Context.Job();
    UDBCircle circle(&job);
    const long layer = Context.GetLayerId(code);
    circle.SetCentreId(centre);
    circle.SetRadius(radius);
    circle.SetLayer(layer);
    circle.SetLineStyle(job.GetLineTypeIndex(code.LineType, layer));
    circle.SetColour(TextToInt(code.LineColour));
    circle.SetThickness(job.GetLineThicknessIndex(code.Thickness, layer));
    if (useInSurface) circle.SetFlags(circle.GetFlags() | UDBObject::kUseInSurface);
    if (!circle.Save(0, false, false)) {
        Context.Leave(L"circle", name, circle.LastError());
        return false;
    }
    ++Context.Report().Circles;
    return true;
}

}  // namespace nedit
