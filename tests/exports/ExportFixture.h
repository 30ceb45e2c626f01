#pragma once
// A job holding a little of everything an export writes, with numbers easy to check by hand:
//
//   P4 (1000,2010,52) TOPO      P3 (1010,2010, no height)
//        |  arc P4 -> P2 about P1, clockwise, a quarter circle of radius 10
//   P1 (1000,2000,50) --line-- P2 (1010,2000,51)      both on BOUNDARY
//
// - polyline KERB on TOPO: P1, P2 (bulge -1: a half circle anticlockwise to P3, bulging
//   East through (1015,2005)), P3, P1 again: closed;
// - circle about P3 of radius 2.5 on TOPO; P1 carries the attribute Owner = "Smith, J".

#include <gtest/gtest.h>

#include <memory>
#include <string>

#include "../support/TestSupport.h"
#include "exports/JobContents.h"
#include "platform/job/USurveyDoc.h"

namespace nedit::test {

class ExportTest : public ::testing::Test {
  protected:
    void SetUp() override {
        ASSERT_FALSE(dir.Path().empty());
        path = dir.File("site.job");
        job = USurveyDoc::CreateJob(path, nullptr);
        job->Database().Execute(R"(
            INSERT INTO layer (name) VALUES ('BOUNDARY'), ('TOPO'), ('EMPTY');
            INSERT INTO point (name, east, north, height, code, layer_id, note) VALUES
                ('P1', 1000, 2000, 50, 'FC01', 1, 'iron pin'),
                ('P2', 1010, 2000, 51, 'FC02', 1, ''),
                ('P3', 1010, 2010, NULL, '', 1, ''),
                ('P4', 1000, 2010, 52, 'TREE', 2, '');
            INSERT INTO attribute (object_id, seq, name, value) VALUES (67108865, 1, 'Owner',
                'Smith, J');
            INSERT INTO line (start_id, end_id, layer_id) VALUES (67108865, 67108866, 1);
            INSERT INTO arc (start_id, end_id, third_id, arc_type, layer_id)
                VALUES (67108868, 67108866, 67108865, 0, 1);
            INSERT INTO circle (centre_id, radius, layer_id) VALUES (67108867, 2.5, 2);
            INSERT INTO polyline (name, layer_id) VALUES ('KERB', 2);
            INSERT INTO polyline_vertex (polyline_id, seq, point_id, bulge) VALUES
                (1073741825, 1, 67108865, 0), (1073741825, 2, 67108866, -1),
                (1073741825, 3, 67108867, 0), (1073741825, 4, 67108865, 0);
        )");
    }

    JobContents Contents(const std::vector<std::string>& layers = {}) {
        return ReadJobContents(*job, layers);
    }

    TempDir dir;
    std::string path;
    std::unique_ptr<USurveyDoc> job;
};

}  // namespace nedit::test
