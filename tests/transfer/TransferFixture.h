#pragma once
// A test of the transfer: a job of its own with a small code library, stores built by hand as
// a reduction would leave them, and a headless host whose answers the test sets.

#include <gtest/gtest.h>

#include <memory>
#include <set>
#include <string>
#include <vector>

#include "../support/HeadlessDialogHost.h"
#include "../support/TestSupport.h"
#include "codes/UNeditArc.h"
#include "codes/UNeditLine.h"
#include "codes/UNeditPt.h"
#include "platform/geometry/UWRect.h"
#include "platform/job/UDBPoint.h"
#include "platform/job/UDBPolyLine.h"
#include "platform/job/USurveyDoc.h"
#include "platform/messages/ProgressSink.h"
#include "transfer/DuplicatePtsDlg.h"
#include "transfer/PointCodeReader.h"
#include "transfer/TransferRun.h"

namespace nedit::test {

class TransferTest : public ::testing::Test {
  protected:
    void SetUp() override {
        ASSERT_FALSE(dir.Path().empty());
        USvyCodeLib codes;
        codes.SetSvyCode(Code(L"KB", L"KERB", 1));
        codes.SetSvyCode(Code(L"BLD", L"BUILDING", 1));
        codes.SetSvyCode(Code(L"FN", L"FENCE", 0));
        codes.SetSvyCode(Code(L"TREE", L"VEG", 0));
        job = USurveyDoc::CreateJob(dir.File("test.job"), &codes);
        job->SetSharedCodeLibraryPath(dir.File("no-shared-library.csv"));
    }

    static USvyCode Code(const std::wstring& code, const std::wstring& layer, int isString) {
        USvyCode definition;
        definition.Code = code;
        definition.Layer = layer;
        definition.Description = code + L" description";
        definition.PointColour = L"3";
        definition.LineColour = L"4";
        definition.IsString = isString;
        return definition;
    }

    /// A reduced point.
    UNeditPt& Point(const std::wstring& id, double e, double n, double h = 10.0,
                    const std::wstring& code = L"") {
        points.emplace_back(id, e, n, h, code, 0u);
        return points.back();
    }
    const UNeditPt& Find(const std::wstring& id) const {
        for (const UNeditPt& point : points) {
            if (point.GetID() == id) return point;
        }
        throw std::runtime_error("no point");
    }
    /// A line between two points of the store, of `code` in string `string` (none: empty).
    void Line(const std::wstring& from, const std::wstring& to, const std::wstring& code = L"",
              const std::wstring& string = L"") {
        Line(Find(from), Find(to), code, string);
    }
    void Line(const UNeditPt& from, const UNeditPt& to, const std::wstring& code,
              const std::wstring& string) {
        UNeditLine line(from, to);
        line.SetCode(code);
        line.SetStringNo(string);
        lines.push_back(line);
    }
    void Arc(const std::wstring& start, const std::wstring& end, const std::wstring& third,
             ArcType type, const std::wstring& code = L"", const std::wstring& string = L"") {
        UNeditArc arc(Find(start), Find(end), Find(third), type);
        arc.SetCode(code);
        arc.SetStringNo(string);
        arcs.push_back(arc);
    }

    /// A point already in the job.
    long JobPoint(const std::wstring& name, double e, double n, double h = 10.0,
                  bool locked = false) {
        UDBPoint point(job.get(), UWPoint(e, n, h));
        point.SetName(name);
        if (locked) point.Lock();
        EXPECT_TRUE(point.Save());
        return point.GetId();
    }

    int Transfer() {
        TransferRun run(job.get(), &host, &progress, *reader);
        const int result = run.TransferToJob({points, lines, arcs, &dbCoordNames, L"SITE"});
        report = run.GetReport();
        return result;
    }

    /// The job's point of that name; its identifier 0 when there is none.
    UDBPoint JobPointNamed(const std::wstring& name) {
        return UDBPoint(job.get(), job->GetPointId(UPointNumber(name)));
    }
    long Count(const char* table) {
        auto query = job->Database().Query(std::string("SELECT count(*) FROM ") + table);
        return query->Step() ? static_cast<long>(query->Int(0)) : -1;
    }
    /// The identifiers of a table's objects, in order.
    std::vector<long> Ids(const char* table) {
        std::vector<long> ids;
        auto query = job->Database().Query(std::string("SELECT id FROM ") + table + " ORDER BY id");
        while (query->Step()) ids.push_back(static_cast<long>(query->Int(0)));
        return ids;
    }
    /// The job's polylines of that name, in the order they were stored.
    std::vector<UDBPolyLine> Polylines(const std::wstring& name) {
        std::vector<UDBPolyLine> found;
        UDBPolyLine walk(job.get());
        walk.Enumerate(UWRect(0, 0, 0, 0));
        for (long id = walk.Next(); id != 0; id = walk.Next()) {
            if (walk.GetName() == name) found.push_back(walk);
        }
        return found;
    }
    /// The names of a polyline's vertices, in order.
    std::vector<std::wstring> VertexNames(const UDBPolyLine& poly) {
        std::vector<std::wstring> names;
        for (const UVertex& vertex : poly.GetVertices())
            names.push_back(UDBPoint(job.get(), vertex.PointId).GetName());
        return names;
    }
    /// Answers every DuplicatePtsDlg with `mode`, the prefix and apply-to-all given.
    void AnswerDuplicates(int mode, const std::wstring& prefix = L"NEW", bool applyAll = false) {
        host.SetFace<DuplicatePtsDlg>([=](DuplicatePtsDlg& dialog) {
            ++duplicateQuestions;
            dialog.Choose(mode);
            dialog.Prefix = prefix;
            dialog.ApplyAll = applyAll;
            return dialog.OnOK() ? dialog.EndCode() : static_cast<int>(mb::IdCancel);
        });
    }
    bool Told(const std::wstring& text) const {
        for (const auto& message : host.Messages()) {
            if (message.text.find(text) != std::wstring::npos) return true;
        }
        return false;
    }

    TempDir dir;
    ScopedEnv config{"SXNEDIT_CONFIG", dir.Path()};
    std::unique_ptr<USurveyDoc> job;
    HeadlessDialogHost host;
    ProgressSink progress;
    PointCodeReader wholeCodes;
    const PointCodeReader* reader = &wholeCodes;
    std::vector<UNeditPt> points;
    std::vector<UNeditLine> lines;
    std::vector<UNeditArc> arcs;
    std::set<std::wstring, std::less<>> dbCoordNames;
    TransferReport report;
    int duplicateQuestions = 0;
};

}  // namespace nedit::test
