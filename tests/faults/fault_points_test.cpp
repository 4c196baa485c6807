// Every call that can fail, made to fail.
#include "faults/fault_run.h"
#include "faults/scenarios.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <cstdlib>
#include <string>

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

// One line for each scenario, in a folder beside the program.
void WriteNumber(const Scenario& scenario, const char* kind, int points) {
    std::printf("%s, %s: %d points %s\n", scenario.control, scenario.name, points, kind);
    char path[MAX_PATH] = {};
    GetModuleFileNameA(nullptr, path, MAX_PATH);
    std::string folder = path;
    folder = folder.substr(0, folder.find_last_of('\\')) + "\\fault_points";
    CreateDirectoryA(folder.c_str(), nullptr);
    const std::string file = folder + "\\" + scenario.name + " " + kind + ".txt";
    if (std::FILE* stream = std::fopen(file.c_str(), "w")) {
        std::fprintf(stream, "%s, %s: %d points %s\n", scenario.control, scenario.name, points,
                     kind);
        std::fclose(stream);
    }
}

class FaultPoints : public ::testing::TestWithParam<Scenario> {};

TEST_P(FaultPoints, AreSurvivedOneByOne) {
    FaultRun run(GetParam());
    ASSERT_NO_FATAL_FAILURE(run.prepare());
    const int points = run.failEachOnce();
    EXPECT_GT(points, 0);
    WriteNumber(GetParam(), "failing once", points);
}

// From its first call on; all of them where ./soak asks for it.
TEST_P(FaultPoints, AreSurvivedWhenAllFailFromThereOn) {
    const bool isSoak = std::getenv("KORCONTROLS_SOAK") != nullptr;
    FaultRun run(GetParam());
    ASSERT_NO_FATAL_FAILURE(run.prepare());
    const int points = run.failEachForEver(isSoak ? 1000000 : 1);
    EXPECT_GT(points, 0);
    WriteNumber(GetParam(), "failing for ever", points);
}

INSTANTIATE_TEST_SUITE_P(Lives, FaultPoints, ::testing::ValuesIn(kScenarios),
                         [](const auto& tested) { return std::string(tested.param.name); });

}  // namespace
}  // namespace kortest
