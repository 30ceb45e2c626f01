// The plan's geometry without a screen: the spatial index against a plain search, the
// window's arithmetic, and the rules by which a click picks a point, a line or an arc.

#include <QtTest>
#include <random>

#include "UiTestSupport.h"
#include "platform/job/UJobSettings.h"
#include "records/UNeutralFileFormat.h"
#include "reduction/UNeditDatabase.h"
#include "ui/PlanIndex.h"
#include "ui/PlanPainter.h"
#include "ui/PlanScene.h"
#include "ui/PlanTransform.h"

using nedit::PlanIndex;
using nedit::PlanPick;
using nedit::PlanScene;
using nedit::PlanTransform;

namespace {

/// An engine whose stores are filled by hand.
struct Stores {
    UJobSettings settings;
    UNeutralFileFormat format{&settings};
    UNeditDatabase engine{&format, nullptr, nullptr, nullptr};

    unsigned Point(const wchar_t* name, double x, double y) {
        return engine.SavePoint(name, x, y, 0.0, L"", 0, 0, 0);
    }
    /// A half circle of radius 10 about (50, 50), from (40, 50) over the top to (60, 50).
    void HalfCircle() {
        const UNeditPt start(L"S", 40.0, 50.0, 0.0, L"", 0);
        const UNeditPt end(L"E", 60.0, 50.0, 0.0, L"", 0);
        const UNeditPt top(L"T", 50.0, 60.0, 0.0, L"", 0);
        engine.SaveArc(start, end, top, UWArc::kThirdOnArc);
    }
};

}  // namespace

class PlanSceneTest : public QObject {
    Q_OBJECT
  private slots:
    void indexFindsWhatAPlainSearchFinds();
    void indexKeepsLongObjectsAndLeavesOutBrokenOnes();
    void transformRoundTripsAndZoomsAboutTheMouse();
    void zoomHistoryGoesBackAndForward();
    void zoomToShowsTheExtentsWhole();
    void pickPrefersAPointWithinTheAperture();
    void pickTakesALineOnlyAlongItsSegment();
    void pickTriesNoArcWhileALineCounts();
    void pickTakesAnArcOnlyInsideItsSector();
    void pickOnAnEmptyPlanFindsNothing();
    void arcsAreDrawnFromStartToEnd();
    void scaleBarLengthsAreRoundNumbers();
};

void PlanSceneTest::indexFindsWhatAPlainSearchFinds() {
    std::mt19937 random(7);
    std::uniform_real_distribution<double> place(-500.0, 500.0);
    std::uniform_real_distribution<double> size(0.0, 30.0);
    std::vector<PlanIndex::Box> boxes;
    for (int i = 0; i < 3000; ++i) {
        const double x = place(random);
        const double y = place(random);
        // Points and small objects, as a survey's points and legs are.
        const double w = i % 3 == 0 ? 0.0 : size(random);
        boxes.push_back({x, y, x + w, y + w / 2.0});
    }
    PlanIndex index;
    index.Build(boxes);
    std::vector<int> found;
    for (int query = 0; query < 50; ++query) {
        const double x = place(random);
        const double y = place(random);
        const UWRect area(x, y, x + size(random) * 5.0, y + size(random) * 3.0);
        index.Query(area, found);
        std::vector<int> expected;
        for (int i = 0; i < static_cast<int>(boxes.size()); ++i) {
            const PlanIndex::Box& b = boxes[static_cast<std::size_t>(i)];
            if (b.maxX >= area.GetMinX() && b.minX <= area.GetMaxX() && b.maxY >= area.GetMinY() &&
                b.minY <= area.GetMaxY())
                expected.push_back(i);
        }
        QCOMPARE(found, expected);
    }
    // The whole survey in view gives every object in store order.
    index.Query(UWRect(-1e4, -1e4, 1e4, 1e4), found);
    QCOMPARE(static_cast<int>(found.size()), 3000);
    QVERIFY(std::is_sorted(found.begin(), found.end()));
}

void PlanSceneTest::indexKeepsLongObjectsAndLeavesOutBrokenOnes() {
    std::vector<PlanIndex::Box> boxes;
    for (int i = 0; i < 400; ++i) boxes.push_back({i * 1.0, i * 1.0, i * 1.0, i * 1.0});
    boxes.push_back({0.0, 200.0, 400.0, 200.5});  // a line across the whole survey
    boxes.push_back({std::nan(""), 0.0, 1.0, 1.0});
    PlanIndex index;
    index.Build(boxes);
    std::vector<int> found;
    index.Query(UWRect(350.0, 199.0, 351.0, 201.0), found);
    QCOMPARE(found, std::vector<int>{400});
    index.Query(UWRect(-1e9, -1e9, 1e9, 1e9), found);
    QCOMPARE(static_cast<int>(found.size()), 401);
}

void PlanSceneTest::transformRoundTripsAndZoomsAboutTheMouse() {
    PlanTransform transform;
    transform.SetViewSize(800, 600);
    transform.SetWindow(UWPoint(1000.0, 2000.0), 4.0);
    // East runs right and North up: 10 units east and 5 north of the centre.
    const nedit::ScreenPoint at = transform.ToScreen(1010.0, 2005.0);
    QCOMPARE(at.x, 440.0);
    QCOMPARE(at.y, 280.0);
    const UWPoint back = transform.ToWorld(at);
    QCOMPARE(back.x, 1010.0);
    QCOMPARE(back.y, 2005.0);
    const UWPoint under = transform.ToWorld({100.0, 50.0});
    transform.ZoomAbout({100.0, 50.0}, 2.5);
    QCOMPARE(transform.Scale(), 10.0);
    const UWPoint still = transform.ToWorld({100.0, 50.0});
    QVERIFY(std::fabs(still.x - under.x) < 1e-9 && std::fabs(still.y - under.y) < 1e-9);
    transform.PanBy(40.0, -20.0);  // the world follows the mouse: 4 units west, 2 south
    QCOMPARE(transform.ToWorld({140.0, 30.0}).x, still.x);
    QCOMPARE(transform.ToWorld({140.0, 30.0}).y, still.y);
}

void PlanSceneTest::zoomHistoryGoesBackAndForward() {
    PlanTransform transform;
    transform.SetViewSize(100, 100);
    transform.SetWindow(UWPoint(0, 0), 1.0);
    QVERIFY(!transform.CanZoomPrevious());
    transform.AddZoomHistory();
    transform.SetWindow(UWPoint(5, 5), 2.0);
    transform.AddZoomHistory();
    transform.SetWindow(UWPoint(9, 9), 4.0);
    transform.ZoomPrevious();
    QCOMPARE(transform.Scale(), 2.0);
    transform.ZoomPrevious();
    QCOMPARE(transform.Scale(), 1.0);
    QVERIFY(!transform.CanZoomPrevious());
    transform.ZoomNext();
    transform.ZoomNext();
    QCOMPARE(transform.Scale(), 4.0);
    QCOMPARE(transform.Centre().x, 9.0);
    // A new window forgets the way forward.
    transform.ZoomPrevious();
    transform.AddZoomHistory();
    QVERIFY(!transform.CanZoomNext());
}

void PlanSceneTest::zoomToShowsTheExtentsWhole() {
    PlanTransform transform;
    transform.SetViewSize(1000, 500);
    transform.ZoomTo(UWRect(0, 0, 200, 200), 0.0);
    // The height decides: 500 pixels for 200 units.
    QCOMPARE(transform.Scale(), 2.5);
    QCOMPARE(transform.Centre().x, 100.0);
    const UWRect seen = transform.VisibleWorld();
    QVERIFY(seen.GetMinY() <= 0.0 && seen.GetMaxY() >= 200.0);
    QVERIFY(seen.GetMinX() <= 0.0 && seen.GetMaxX() >= 200.0);
}

void PlanSceneTest::pickPrefersAPointWithinTheAperture() {
    Stores stores;
    const unsigned a = stores.Point(L"A", 0.0, 0.0);
    const unsigned b = stores.Point(L"B", 100.0, 0.0);
    stores.Point(L"C", 50.0, 1.0);
    stores.engine.SaveLine(a, b, 0);
    PlanScene scene;
    scene.Build(&stores.engine);
    PlanPick pick = scene.Pick(UWPoint(50.5, 1.5), 2.0);
    QCOMPARE(pick.kind, PlanPick::Kind::Point);
    QCOMPARE(pick.index, 2);
    // Just beyond the aperture from C, the line beneath is picked.
    pick = scene.Pick(UWPoint(50.0, -1.5), 2.0);
    QCOMPARE(pick.kind, PlanPick::Kind::Line);
    QCOMPARE(pick.index, 0);
}

void PlanSceneTest::pickTakesALineOnlyAlongItsSegment() {
    Stores stores;
    const unsigned a = stores.Point(L"A", 0.0, 0.0);
    const unsigned b = stores.Point(L"B", 10.0, 0.0);
    stores.engine.SaveLine(a, b, 0);
    PlanScene scene;
    scene.Build(&stores.engine);
    // On the extension beyond B the line's end is further away than the line is long.
    QCOMPARE(scene.Pick(UWPoint(25.0, 0.5), 1.0).kind, PlanPick::Kind::None);
    QCOMPARE(scene.Pick(UWPoint(6.0, 0.5), 1.0).kind, PlanPick::Kind::Line);
    // Two lines at the same distance: the first stored wins.
    const unsigned c = stores.Point(L"C", 0.0, 2.0);
    const unsigned d = stores.Point(L"D", 10.0, 2.0);
    stores.engine.SaveLine(c, d, 0);
    scene.Build(&stores.engine);
    const PlanPick pick = scene.Pick(UWPoint(5.0, 1.0), 1.5);
    QCOMPARE(pick.kind, PlanPick::Kind::Line);
    QCOMPARE(pick.index, 0);
}

void PlanSceneTest::pickTriesNoArcWhileALineCounts() {
    Stores stores;
    const unsigned a = stores.Point(L"A", 0.0, 0.0);
    const unsigned b = stores.Point(L"B", 100.0, 0.0);
    stores.engine.SaveLine(a, b, 0);
    stores.HalfCircle();
    PlanScene scene;
    scene.Build(&stores.engine);
    // The click is on the arc, but far from the line's ends it still counts for the line,
    // which is too far away to pick: nothing is picked.
    QCOMPARE(scene.Pick(UWPoint(50.0, 60.2), 1.0).kind, PlanPick::Kind::None);
}

void PlanSceneTest::pickTakesAnArcOnlyInsideItsSector() {
    Stores stores;
    stores.Point(L"Far", 1000.0, 1000.0);
    stores.HalfCircle();
    PlanScene scene;
    scene.Build(&stores.engine);
    PlanPick pick = scene.Pick(UWPoint(50.0, 60.3), 1.0);
    QCOMPARE(pick.kind, PlanPick::Kind::Arc);
    QCOMPARE(pick.index, 0);
    // Near the circle's bottom the click is outside the arc's sector.
    QCOMPARE(scene.Pick(UWPoint(50.0, 40.3), 1.0).kind, PlanPick::Kind::None);
    QVERIFY(PlanScene::InSector(stores.engine.GetArcList()[0], UWPoint(57.0, 57.0)));
    QVERIFY(!PlanScene::InSector(stores.engine.GetArcList()[0], UWPoint(57.0, 43.0)));
}

void PlanSceneTest::pickOnAnEmptyPlanFindsNothing() {
    PlanScene scene;
    scene.Build(nullptr);
    QCOMPARE(scene.Pick(UWPoint(0, 0), 10.0).kind, PlanPick::Kind::None);
    const UWRect extents = scene.Extents();
    QCOMPARE(extents.GetMinX(), 0.0);
    QCOMPARE(extents.GetMaxY(), 100.0);
}

void PlanSceneTest::arcsAreDrawnFromStartToEnd() {
    const UWArc half(UWPoint(40, 50), UWPoint(60, 50), UWPoint(50, 60), UWArc::kThirdOnArc);
    const std::vector<UWPoint> path = PlanScene::SampleArc(half);
    QCOMPARE(static_cast<int>(path.size()), 91);  // 180 degrees in chords of 2
    QVERIFY(std::fabs(path.front().x - 40.0) < 1e-9 && std::fabs(path.front().y - 50.0) < 1e-9);
    QVERIFY(std::fabs(path.back().x - 60.0) < 1e-9 && std::fabs(path.back().y - 50.0) < 1e-9);
    QVERIFY(std::fabs(path[45].y - 60.0) < 1e-9);  // over the top, not under
    const UWArc straight(UWPoint(0, 0), UWPoint(10, 0), UWPoint(5, 0), UWArc::kThirdOnArc);
    QCOMPARE(static_cast<int>(PlanScene::SampleArc(straight).size()), 2);
}

void PlanSceneTest::scaleBarLengthsAreRoundNumbers() {
    QCOMPARE(nedit::PlanPainter::ScaleBarLength(1.0), 100.0);  // 60 px wanted: 100 units
    QCOMPARE(nedit::PlanPainter::ScaleBarLength(2.0), 50.0);
    QCOMPARE(nedit::PlanPainter::ScaleBarLength(0.25), 500.0);
    QCOMPARE(nedit::PlanPainter::ScaleBarLength(30.0), 2.0);
}

QTEST_MAIN(PlanSceneTest)
#include "PlanSceneTest.moc"
