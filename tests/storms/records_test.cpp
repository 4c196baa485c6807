// Storms of fixed seeds on the library's objects, whose records can be looked at.
#include "storms/storm.h"

#include <gtest/gtest.h>

namespace kortest {
namespace {

class StormsOfRecords : public ::testing::TestWithParam<const char*> {};

TEST_P(StormsOfRecords, KeepThemInOrder) {
    StormPlan plan;
    plan.control = GetParam();
    plan.seed = 2;
    plan.steps = 2500;
    EXPECT_TRUE(RunStorm(plan));
}

INSTANTIATE_TEST_SUITE_P(Seed2, StormsOfRecords,
                         ::testing::Values("header", "grid", "chart", "bar", "all"),
                         [](const auto& each) { return std::string(each.param); });

}  // namespace
}  // namespace kortest
