// Thousands of random charts, pixel for pixel against plain GDI calls.
#include "graph/pictures/random_charts.h"

#include <cstdio>

namespace kortest {
namespace {

struct Round {
    int type;
    unsigned seed;
    int pictures;
    int mostPoints;
};

class RandomPictures : public ::testing::TestWithParam<Round> {
protected:
    RecordingHost host;
};

TEST_P(RandomPictures, AreThoseOfPlainCalls) {
    const Round& round = GetParam();
    RandomCharts charts(host, round.seed);
    charts.mostPoints = round.mostPoints;
    int compared = 0;
    int differing = 0;
    int givenUp = 0;
    std::string first;
    for (int i = 0; i < round.pictures; ++i) {
        charts.next(round.type);
        if (!charts.chart().finished()) {
            ++givenUp;
            continue;
        }
        ++compared;
        if (charts.chart().compare()) continue;
        if (differing++ < 5) {
            first += "picture " + std::to_string(i) + ": " + charts.description() + "\n    " +
                     FirstDifference(charts.chart().expected(), charts.chart().shown()) + "\n";
        }
    }
    std::printf(
        "seed %u: %d compared, %d differing, %d not compared (drawing literally takes too long)\n",
        round.seed, compared, differing, givenUp);
    EXPECT_EQ(differing, 0) << first;
    EXPECT_GT(compared, round.pictures * 3 / 4);
}

std::string SeedOf(const ::testing::TestParamInfo<Round>& info) {
    return "Seed" + std::to_string(info.param.seed);
}

INSTANTIATE_TEST_SUITE_P(Lines, RandomPictures,
                         ::testing::Values(Round{KORGRAPH_LINE, 101, 500, 3000},
                                           Round{KORGRAPH_LINE, 102, 500, 500},
                                           Round{KORGRAPH_LINE, 103, 80, 20000}),
                         SeedOf);
INSTANTIATE_TEST_SUITE_P(Areas, RandomPictures,
                         ::testing::Values(Round{KORGRAPH_AREA, 201, 500, 400},
                                           Round{KORGRAPH_AREA, 202, 500, 60},
                                           Round{KORGRAPH_AREA, 203, 80, 2500}),
                         SeedOf);
INSTANTIATE_TEST_SUITE_P(Bars, RandomPictures,
                         ::testing::Values(Round{KORGRAPH_BAR, 301, 500, 3000},
                                           Round{KORGRAPH_BAR, 302, 500, 100},
                                           Round{KORGRAPH_BAR, 303, 80, 20000}),
                         SeedOf);
INSTANTIATE_TEST_SUITE_P(Columns, RandomPictures,
                         ::testing::Values(Round{KORGRAPH_COLUMN, 401, 500, 3000},
                                           Round{KORGRAPH_COLUMN, 402, 500, 100},
                                           Round{KORGRAPH_COLUMN, 403, 80, 20000}),
                         SeedOf);

}  // namespace
}  // namespace kortest
