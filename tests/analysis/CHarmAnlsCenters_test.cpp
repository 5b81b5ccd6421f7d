// SPDX-License-Identifier: MIT
#include "tests/analysis/AnalysisForms.h"
#include "tests/support/Expected.h"

#include <doctest/doctest.h>

using namespace brindle;
using namespace brindle::test;
using nlohmann::json;

namespace {

/// What is left of the centers, and the index of the center that an operation returned.
json Moved(const CHarmAnlsCenters& centers, CHarmAnlsCenters::const_iterator it) {
    return {{"centers", test::FormOf(centers)}, {"it", it - centers.begin()}};
}

json ChangeRange(const json& in) {
    CHarmAnlsCenters centers = CentersOf(in.at(0));
    const auto it = centers.ChangeRangeOfHarmCenter(centers.begin() + in.at(1).get<int>(),
                                                    PositionOf(in.at(2)), PositionOf(in.at(3)));
    return Moved(centers, it);
}

json CreateNew(const json& in) {
    CHarmAnlsCenters centers = CentersOf(in.at(0));
    const auto it = centers.CreateNewHarmCenterWithChordsAfterPos(
        centers.begin() + in.at(1).get<int>(), PositionOf(in.at(2)));
    return Moved(centers, it);
}

json Collect(const json& in) {
    CHarmAnlsCenters centers = CentersOf(in.at(0));
    const CHarmAnlsChords collected = centers.CollectAndEraseChordsFromSmallerUntilBeforeLarger(
        PositionOf(in.at(1)), PositionOf(in.at(2)));
    return {{"centers", test::FormOf(centers)}, {"collected", test::FormOf(collected)}};
}

json Merge(const json& in) {
    CHarmAnlsCenters centers = CentersOf(in.at(0));
    centers.MergeAdjacentSameHarmCenters();
    return {{"centers", test::FormOf(centers)}};
}

json MostOccurrent(const json& in) {
    const CHarmCenterLite center = CentersOf(in.at(0)).FindMostOccurentHarmCenter();
    return {test::FormOf(center.mRootKeyEnh), center.mSemitones.Mask()};
}

}  // namespace

TEST_CASE("Centers give and take chords when their ranges change") {
    CheckExpected("center_ranges",
                  {{"CHarmAnlsCenters::ChangeRangeOfHarmCenter", ChangeRange},
                   {"CHarmAnlsCenters::CreateNewHarmCenterWithChordsAfterPos", CreateNew},
                   {"CHarmAnlsCenters::CollectAndEraseChordsFromSmallerUntilBeforeLarger", Collect},
                   {"CHarmAnlsCenters::MergeAdjacentSameHarmCenters", Merge}});
}

TEST_CASE("The center that sorts last is taken for the one that occurs most") {
    CheckExpected("center_most_occurrent",
                  {{"CHarmAnlsCenters::FindMostOccurentHarmCenter", MostOccurrent}});
}

TEST_CASE("A center that takes over the next one has the chords of both") {
    CHarmAnlsCenters centers(3);
    for (std::size_t n = 0; n < centers.size(); ++n) {
        centers[n].mPosition = 4.0 * static_cast<double>(n);
        centers[n].mChords.resize(n + 1);
    }
    const auto behind =
        centers._MergeHarmCentersAndEraseSecond(centers.begin(), centers.begin() + 1);
    REQUIRE(centers.size() == 2);
    CHECK(centers[0].mChords.size() == 3);
    CHECK(centers[0].mPosition == 0.0);
    CHECK(behind == centers.begin() + 1);
    CHECK(behind->mPosition == 8.0);
}
