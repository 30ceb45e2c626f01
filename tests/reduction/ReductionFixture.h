#pragma once
// An engine over a record list filled from text, with a scripted dialog host.

#include <gtest/gtest.h>

#include <sstream>
#include <string>

#include "../records/RecordFixture.h"
#include "../records/RowList.h"
#include "../support/HeadlessDialogHost.h"
#include "reduction/UNeditDatabase.h"

class ReductionFixture : public RecordFixture {
  protected:
    /// Puts each line of `text` into the list, as the loader would.
    void Rows(const std::wstring& text) {
        list.DeleteAllItems();
        std::wistringstream lines(text);
        for (std::wstring line; std::getline(lines, line);) {
            if (!line.empty()) list.AddRecord(list.GetItemCount(), line);
        }
    }

    /// The reduced point of that name; fails the test when there is none.
    const UNeditPt& Point(const std::wstring& name) {
        const int index = engine.GetPointIdx(name);
        EXPECT_GE(index, 0) << "no point " << std::string(name.begin(), name.end());
        static const UNeditPt kNone;
        return index < 0 ? kNone : engine.GetPointList()[static_cast<std::size_t>(index)];
    }

    void ExpectPoint(const std::wstring& name, double e, double n, double h,
                     double tolerance = 1e-6) {
        const UNeditPt& point = Point(name);
        EXPECT_NEAR(point.x, e, tolerance) << "East of " << std::string(name.begin(), name.end());
        EXPECT_NEAR(point.y, n, tolerance) << "North of " << std::string(name.begin(), name.end());
        EXPECT_NEAR(point.z, h, tolerance) << "Height of " << std::string(name.begin(), name.end());
    }

    nedit::test::RowList list{&format};
    nedit::HeadlessDialogHost host;
    UNeditDatabase engine{&format, &list, nullptr, &host};
};
