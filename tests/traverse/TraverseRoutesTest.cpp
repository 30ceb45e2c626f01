// The route search on reduced surveys, its routes worked out by hand from the search's steps.

#include <gtest/gtest.h>

#include <sstream>

#include "TraverseFixture.h"
#include "traverse/RouteList.h"

namespace {

std::vector<std::wstring> Texts(const nedit::TraverseRoutes& routes) {
    std::vector<std::wstring> texts;
    for (const nedit::NameList* route : routes.GetTraverseList())
        texts.push_back(nedit::RouteText(*route));
    return texts;
}

}  // namespace

class RouteSurvey : public TraverseFixture {};

TEST_F(RouteSurvey, TwoLoopsASpurAndAReoccupiedStation) {
    Load("traverse_routes.neu");
    // A-B-C closes on A and branches to the spur S; B, occupied again later, starts the
    // second loop B-E-F back to B, reached through A's route up to B. C's observation of A and
    // F's of B become routes of their own, carried on from the routes that reach C and F.
    EXPECT_EQ(Texts(routes), (std::vector<std::wstring>{L"A,B,C,", L"A,B,C,S,", L"A,B,C,A,",
                                                        L"A,B,E,F,", L"A,B,E,F,B,"}));
    // Each entry holds the row that led to it: the STN row of the start, then observations.
    const nedit::NameList& second_loop = *routes.GetTraverseList()[4];
    std::vector<int> rows;
    for (const nedit::NameEntry& entry : second_loop) rows.push_back(entry.Value);
    EXPECT_EQ(rows, (std::vector<int>{2, 4, 20, 24, 28}));
    // The observation at row 20 goes on from B's second set-up, the first after it; F's
    // observation of B at row 28 finds no set-up of B after it, so the route ends there.
    EXPECT_EQ(routes.FindNextStn(L"B", 4)->GetIndex(), 5);
    EXPECT_EQ(routes.FindNextStn(L"B", 6)->GetIndex(), 17);
    EXPECT_EQ(routes.FindNextStn(L"B", 28), nullptr);
    EXPECT_NE(routes.FindStn(L"B", 17), nullptr);
    EXPECT_EQ(routes.FindStn(L"B", 18), nullptr);

    // Every leg is a station line of the plan.
    for (const auto& [from, to] :
         std::vector<std::pair<std::wstring, std::wstring>>{{L"A", L"B"},
                                                            {L"B", L"C"},
                                                            {L"C", L"S"},
                                                            {L"C", L"A"},
                                                            {L"B", L"E"},
                                                            {L"E", L"F"},
                                                            {L"F", L"B"}}) {
        const int line = engine.GetLineIdx(from, to);
        ASSERT_GE(line, 0);
        EXPECT_EQ(engine.GetLineList()[static_cast<std::size_t>(line)].GetStationLine(), 1);
    }
    EXPECT_EQ(routes.IsPtObserved(L"C", 8, L"s"), 13);
    EXPECT_EQ(routes.IsPtObserved(L"C", 13, L"S"), -1);
    // Only side shots count: C's back sight of B does not, though A and F shoot B. A name
    // occupied twice looks in both set-ups; a name nothing shot is observed by none.
    EXPECT_EQ(routes.IsPtObserved(L"C", 8, L"b"), -1);
    EXPECT_EQ(routes.IsPtObserved(L"B", 4, L"e"), 20);
    EXPECT_EQ(routes.IsPtObserved(L"A", 0, L"Q"), -1);
}

TEST_F(RouteSurvey, ASetUpSightingAnotherPointThanTheRouteIsRefused) {
    Load("traverse_routes.neu");
    // B's second set-up sights back to C, not to A.
    CTraverse traverse(&engine);
    ASSERT_TRUE(traverse.CreateStnList(L"A,B,E,"));
    EXPECT_EQ(traverse.CheckBackSights(), 0);
    EXPECT_EQ(host.Messages().back().text,
              L"Backsight point C from Occupied point B is not the previous traverse point.\n");
}

TEST_F(RouteSurvey, ANewSearchForgetsTheRoutesOfTheLast) {
    Load("traverse_routes.neu");
    routes.AddRoute({{L"X", 0}, {L"Y", 1}});
    EXPECT_EQ(routes.GetTraverseList().size(), 6u);
    EXPECT_EQ(routes.FindTraverse(engine), 5);
    routes.ClearTraverseList();
    EXPECT_TRUE(routes.GetTraverseList().empty());
    EXPECT_TRUE(routes.GetTraverseBinList().empty());
}

/// A survey given as rows, and the routes its search should find.
struct SearchCase {
    const char* name;
    const wchar_t* rows;
    std::vector<std::wstring> routes;
};

// A case prints as its name, so that the names of the tests do not carry its bytes.
void PrintTo(const SearchCase& search, std::ostream* out) {
    *out << search.name;
}

class RouteSearch : public TraverseFixture, public ::testing::WithParamInterface<SearchCase> {};

TEST_P(RouteSearch, FindsTheRoutes) {
    const SearchCase& search = GetParam();
    Rows(std::wstring(L"#VERSION-1.0 NEUTRAL FILE\nUNIT UL=M,UA=D\n") + search.rows);
    engine.AddStage(&routes);
    ASSERT_EQ(engine.Process(), 1);
    EXPECT_EQ(Texts(routes), search.routes);
}

INSTANTIATE_TEST_SUITE_P(
    Cases, RouteSearch,
    ::testing::Values(SearchCase{"Chain",
                                 L"STN ID=A\nXYZ ID=A,E=0,N=0,H=0\nSS ID=B,HA=0,VA=90,SD=10\n"
                                 L"STN ID=B\nSS ID=C,HA=90,VA=90,SD=10\nSTN ID=C\n",
                                 {L"A,B,C,"}},
                      // A set-up that observes both neighbours goes on to the next one only.
                      SearchCase{"ShotBack",
                                 L"STN ID=A\nXYZ ID=A,E=0,N=0,H=0\nSS ID=B,HA=0,VA=90,SD=10\n"
                                 L"STN ID=B\nSS ID=A,HA=0,VA=90,SD=10\nSS ID=C,HA=90,VA=90,SD=10\n"
                                 L"STN ID=C\n",
                                 {L"A,B,C,"}},
                      // Angles only, the station itself, and an unoccupied point are no legs.
                      SearchCase{"NoLegs",
                                 L"STN ID=A\nXYZ ID=A,E=0,N=0,H=0\nSS ID=B,HA=0,VA=90,SD=0\n"
                                 L"SS ID=A,HA=0,VA=90,SD=5\nSS ID=P,HA=0,VA=90,SD=5\n"
                                 L"STN ID=B\nXYZ ID=B,E=9,N=9,H=0\n",
                                 {}},
                      // Two faces of one target are one leg.
                      SearchCase{"Faces",
                                 L"STN ID=A\nXYZ ID=A,E=0,N=0,H=0\nSS ID=B,HA=0,VA=90,SD=10\n"
                                 L"SS ID=B,HA=180,VA=270,SD=10\nSTN ID=B\n",
                                 {L"A,B,"}},
                      // A set-up seen onward twice splits the route: a copy takes the first.
                      SearchCase{"Split",
                                 L"STN ID=X\nXYZ ID=X,E=0,N=0,H=0\nSS ID=A,HA=0,VA=90,SD=10\n"
                                 L"STN ID=A\nSS ID=B,HA=0,VA=90,SD=10\nSS ID=C,HA=90,VA=90,SD=10\n"
                                 L"STN ID=B\nSTN ID=C\n",
                                 {L"X,A,B,", L"X,A,C,"}},
                      // A station occupied only before the observation of it ends the route there.
                      SearchCase{"OccupiedBefore",
                                 L"STN ID=B\nXYZ ID=B,E=0,N=0,H=0\nSS ID=A,HA=0,VA=90,SD=10\n"
                                 L"STN ID=A\nSS ID=C,HA=0,VA=90,SD=10\nSTN ID=C\n"
                                 L"SS ID=B,HA=0,VA=90,SD=10\n",
                                 {L"B,A,C,", L"B,A,C,B,"}},
                      SearchCase{"TooFewRows", L"", {}}),
    [](const ::testing::TestParamInfo<SearchCase>& search) { return search.param.name; });

TEST(RouteList, NeighboursAsTheWalkOverAllRoutesHasThem) {
    const nedit::NameList first{{L"X", 0}, {L"A", 1}};
    const nedit::NameList second{{L"Y", 2}, {L"Z", 3}, {L"B", 4}};
    nedit::RouteList routes;
    routes.Append(&first);
    routes.Append(&second);
    EXPECT_TRUE(routes.IsNeighbour(L"x", L"A"));
    EXPECT_TRUE(routes.IsNeighbour(L"A", L"X"));
    EXPECT_TRUE(routes.IsNeighbour(L"Q", L"q"));
    // A stands second on the first route; B stands third on the next, one above it.
    EXPECT_TRUE(routes.IsNeighbour(L"A", L"B"));
    EXPECT_FALSE(routes.IsNeighbour(L"B", L"A"));
    EXPECT_FALSE(routes.IsNeighbour(L"A", L"Z"));
    EXPECT_FALSE(routes.IsNeighbour(L"A", L"Y"));
    // X stands first: Z, second on the next route, is taken for its neighbour too.
    EXPECT_TRUE(routes.IsNeighbour(L"X", L"Z"));
    EXPECT_TRUE(routes.Holds(nedit::NameList{{L"Y", 9}, {L"Z", 9}, {L"B", 9}}));
    EXPECT_FALSE(routes.Holds(nedit::NameList{{L"y", 2}, {L"Z", 3}, {L"B", 4}}));
    const auto places = routes.FirstPlaces(L"z");
    ASSERT_EQ(places.size(), 1u);
    EXPECT_EQ(places[0].Route, 1u);
    EXPECT_EQ(places[0].Entry, 1u);
}
