#pragma once
// One traverse computation: a chosen route, its misclose at the fixed end, and the stages that
// adjust it. A traverse here is not computed afresh from angles and distances: the run gave
// every set-up its coordinates leg after leg, and the unadjusted traverse reads them back.
// The misclose is the gap between the end so reached and the point the user declares fixed.
//
// Results: kDone (11111) finished, kGivenUp (22222) not finished, or a code of the engine's
// error table (34701, 34702, -3 to -10), whose message is shown through the engine's host.
//
// Decisions:
// - The misclose dialog lives as long as the computation, so its stages can be run and read
//   without showing it; Compute shows it.
// - Stages report to an observer (SetStageObserver) after the misclose of each is stated,
//   so a caller can keep the figures of every stage.
// - When the start's back sight is fixed from typed coordinates before the coordinate stage,
//   its height is looked up without asking the user: the adjustment asks nothing mid-way.

#include <functional>
#include <memory>
#include <string>
#include <vector>

#include "platform/geometry/UWPoint.h"
#include "traverse/CTravStn.h"
#include "traverse/TraverseParams.h"
#include "traverse/UMisReportDlg.h"
#include "traverse/UWTraverse.h"

class UNeditDatabase;
struct SSSTRUCT;

namespace nedit {
class DialogHost;
}

class CTraverse {
  public:
    static constexpr int kDone = 11111;
    static constexpr int kGivenUp = 22222;
    /// Error codes of the engine's table that the traverse shows.
    static constexpr int kInvalidCheckPoint = 34701;
    static constexpr int kInvalidRoute = 34702;
    static constexpr int kNotAveraged = -4;
    static constexpr int kNoSetUp = -5;
    static constexpr int kNoObservation = -6;
    /// Methods of the coordinate stage.
    static constexpr int kCompass = 1;
    static constexpr int kTransit = 2;
    /// The stages whose misclose ComputeMisclose states.
    enum Stage { kUnadjusted = 0, kAfterAngles = 1, kAfterCoordinates = 2 };

    explicit CTraverse(UNeditDatabase* db);
    virtual ~CTraverse();
    CTraverse(const CTraverse&) = delete;
    CTraverse& operator=(const CTraverse&) = delete;

    /// Builds the route from names each followed by a comma ("A,B,C,"): every name but the
    /// last must be a set-up that observed the next name. False, with an empty route, when a
    /// name cannot be resolved or there are fewer than two.
    bool CreateStnList(const std::wstring& names);
    /// 0, after telling the user, when a set-up of the route sighted back to another point
    /// than the entry before it; else 1.
    int CheckBackSights();
    /// The whole run: the angle check's misclose, the unadjusted stage, the misclose dialog
    /// and, when it ends with OK and the user wants the adjustment, the stages not done yet,
    /// the traverse points and the side shots reduced again (report lines into `records`).
    int Compute(TraverseParams& params, std::vector<std::wstring>* records);
    int ComputeUnadjusted(TraverseParams& params);
    void ComputeMisclose(TraverseParams& params, int stage);
    /// The bearing at the closing station that the present coordinates and the closing
    /// observation give.
    double ObservedCloseBearing() const;
    /// The angle stage: 1 when there is no angle misclose, kDone, or an error code.
    int AdjustAngles(TraverseParams& params);
    /// The coordinate stage by the rule of the parameters: kDone when there is no misclose
    /// (nothing is adjusted), else 1.
    int AdjustCoords(TraverseParams& params, bool adjustElev);

    /// Called when the computation ends in an adjustment: the route dialog closes.
    void SetCloseDialog(std::function<void()> close) { CloseDialog = std::move(close); }
    /// Called after the misclose of each stage is stated, with the stage.
    void SetStageObserver(std::function<void(int)> observer) {
        StageObserver = std::move(observer);
    }

    const std::vector<CTravStn>& GetRoute() const { return Route; }
    /// The parameters' copy that the buttons work on; the defaults before Compute.
    TraverseParams& GetParams();
    UMisReportDlg& GetReport() { return Report; }
    const UMisReportDlg& GetReport() const { return Report; }
    nedit::DialogHost* GetHost() const;
    bool IsAngleAdjusted() const { return AngleAdjusted; }
    bool IsCoordAdjusted() const { return CoordAdjusted; }
    int GetMethod() const { return Method; }
    double GetLength() const { return Length; }
    double GetMiscloseX() const { return MiscloseX; }
    double GetMiscloseY() const { return MiscloseY; }
    double GetMiscloseZ() const { return MiscloseZ; }
    double GetAngMisclose() const { return AngMisclose; }
    const SSSTRUCT* GetCloseSS() const { return CloseSS; }

  private:
    /// Shows the code's message and gives the code.
    int Fail(int code) const;
    /// 0, or the code of the first entry (but the last) without a set-up, an observation or
    /// its means.
    int CheckLeg(const CTravStn& entry, const SSSTRUCT* observation) const;
    /// The angle check's misclose at the closing station, folded into -180..180.
    double CloseMisclose(const TraverseParams& params) const;
    void StartAtStart(const TraverseParams& params);
    void PrintHead(const std::wstring& title, bool elevAdj) const;
    void PrintFixed(const TraverseParams& params) const;
    void ComputeArea();
    /// Where the run left a name: its set-up, else its point. False when neither exists.
    bool ReducedPosition(const std::wstring& name, UWPoint& position) const;
    /// The entries' positions, for a rule to work on.
    UWTraverse Positions() const;
    /// The closing steps after the misclose dialog's OK.
    void Close(TraverseParams& params, std::vector<std::wstring>* records);

    UNeditDatabase* Db;
    std::vector<CTravStn> Route;
    double Length = 0.0;
    double MiscloseX = 0.0;
    double MiscloseY = 0.0;
    double MiscloseZ = 0.0;
    double StartBearing = 0.0;
    int Method = kCompass;
    double AngMisclose = 0.0;
    SSSTRUCT* CloseSS = nullptr;
    UMisReportDlg Report{*this};
    std::unique_ptr<TraverseParams> Params;
    bool AngleAdjusted = false;
    bool CoordAdjusted = false;
    double AngCorrSum = 0.0;
    std::function<void()> CloseDialog;
    std::function<void(int)> StageObserver;
};
