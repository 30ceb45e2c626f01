#pragma once
// A point list, lines and arcs in memory behind the codes' host interface, so that filing and
// assembly are tested without a reduction: points are put in by name and coordinates.

#include <string>
#include <vector>

#include "codes/CodeGeometryHost.h"

namespace nedit::test {

struct FakeLine {
    std::wstring From, To, Code, String;
};

class CodeGeometryFake : public CodeGeometryHost {
  public:
    /// Puts a point with its code in the list (overwriting one of that name); gives its index.
    unsigned Put(const std::wstring& name, double e, double n, const std::wstring& code = L"",
                 bool derived = false) {
        const int at = PointIndex(name);
        UNeditPt point(name, e, n, derived ? 0.0 : 10.0, code,
                       derived ? UNeditPt::kInterpolated : 0u);
        if (at >= 0) {
            Points[static_cast<std::size_t>(at)] = point;
            return static_cast<unsigned>(at);
        }
        Points.push_back(point);
        return static_cast<unsigned>(Points.size() - 1);
    }
    const UNeditPt& Named(const std::wstring& name) const {
        return Points.at(static_cast<std::size_t>(PointIndex(name)));
    }
    bool HasLine(const std::wstring& a, const std::wstring& b) const {
        for (const FakeLine& line : Lines) {
            if ((line.From == a && line.To == b) || (line.From == b && line.To == a)) return true;
        }
        return false;
    }

    int PointIndex(const std::wstring& name) const override {
        for (std::size_t i = Points.size(); i-- > 0;) {
            if (Points[i].GetID() == name) return static_cast<int>(i);
        }
        return -1;
    }
    const UNeditPt& PointAt(unsigned index) const override { return Points.at(index); }
    unsigned SaveDerivedPoint(const std::wstring& name, double x, double y,
                              const std::wstring& code) override {
        return Put(name, x, y, code, true);
    }
    int SaveStringLine(unsigned from, unsigned to, const std::wstring& code,
                       const std::wstring& stringName) override {
        Lines.push_back({Points.at(from).GetID(), Points.at(to).GetID(), code, stringName});
        return 1;
    }
    void SaveStringArc(const UNeditPt& first, const UNeditPt& second, const UNeditPt& third,
                       ArcType type) override {
        Arcs.emplace_back(first, second, third, type);
    }
    double CodeDistance(double value) const override { return value; }
    bool StopRequested() const override { return false; }
    void StringProgress(unsigned) override {}
    void CodeNotice(const std::wstring& text) override { Notices.push_back(text); }

    std::vector<UNeditPt> Points;
    std::vector<FakeLine> Lines;
    std::vector<UWArc> Arcs;
    std::vector<std::wstring> Notices;
};

}  // namespace nedit::test
