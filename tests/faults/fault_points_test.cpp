// Every call that can fail, made to fail.
#include "faults/fault_run.h"
#include "faults/scenarios.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <cstdlib>

namespace kortest {
namespace {

const Scenario kScenarios[] = {
    {"grid", "GridCreation", LiveGridCreation},
    {"grid", "GridDrawing", LiveGridDrawing},
    {"grid", "GridSizes", LiveGridSizes},
    {"grid", "GridView", LiveGridView},
    {"grid", "GridSelection", LiveGridSelection},
    {"grid", "GridScrolling", LiveGridScrolling},
    {"grid", "GridEquation", LiveGridEquation},
    {"header", "Header", LiveHeader},
    {"chart", "ChartCreation", LiveChartCreation},
    {"chart", "LineChart", LiveLineChart},
    {"chart", "AreaChart", LiveAreaChart},
    {"chart", "BarChart", LiveBarChart},
    {"chart", "ColumnChart", LiveColumnChart},
    {"chart", "PieChart", LivePieChart},
    {"chart", "ManyPoints", LiveManyPoints},
    {"chart", "Sweep", LiveSweep},
    {"chart", "Replacement", LiveReplacement},
    {"chart", "Zoom", LiveZoom},
    {"chart", "Settings", LiveSettings},
    {"tooltip", "ToolTip", LiveToolTip},
    {"legend", "Legend", LiveLegend},
    {"chart", "Copy", LiveCopy},
    {"chart", "Print", LivePrint},
    {"chart", "SheetOfTitles", LiveSheetOfTitles},
    {"chart", "SheetOfRanges", LiveSheetOfRanges},
    {"command bar", "CommandBar", LiveCommandBar},
    {"function bar", "FunctionBar", LiveFunctionBar},
    {"helpers", "Lists", LiveLists},
    {"helpers", "Trees", LiveTrees},
};

class FaultPoints : public ::testing::TestWithParam<Scenario> {};

TEST_P(FaultPoints, AreSurvivedOneByOne) {
    const DWORD begin = GetTickCount();
    FaultRun run(GetParam());
    ASSERT_NO_FATAL_FAILURE(run.prepare());
    const int points = run.failEachOnce();
    EXPECT_GT(points, 0);
    std::printf("%s, %s: %d points, %lu ms\n", GetParam().control, GetParam().name, points,
                GetTickCount() - begin);
    if (std::getenv("KORCONTROLS_FAULT_TRACE"))
        for (const auto& [name, calls] : run.calls())
            std::printf("  %s %d\n", name.c_str(), static_cast<int>(calls.size()));
}

INSTANTIATE_TEST_SUITE_P(Once, FaultPoints, ::testing::ValuesIn(kScenarios),
                         [](const auto& tested) { return std::string(tested.param.name); });

}  // namespace
}  // namespace kortest
