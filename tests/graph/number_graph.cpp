#include "graph/number_graph.h"

#include "graph/hit_test.h"

namespace kortest {
namespace {

GraphSeriesData DataOf(const std::vector<double>& values, const wchar_t* name, LONG index) {
    return {static_cast<LONG>(values.size()), name, values.data(), index};
}

}  // namespace

NumberGraph::NumberGraph() : graph(*kor::CreateGraphRecord()) {
    graph.hwnd = GetDesktopWindow();  // scaling waits for a window; nothing is drawn into it
    resizePlot(200, 100);
    showX(0, 10);
    showY(0, 10);
}

NumberGraph::~NumberGraph() { kor::FreeRecord(&graph); }

kor::GraphSeries& NumberGraph::add(const std::vector<double>& values, const wchar_t* name) {
    graph.xAutoRange = 0;
    graph.yAutoRange = 0;
    EXPECT_TRUE(kor::AddSeries(graph, DataOf(values, name, 0)));
    rescale();
    return *graph.series[graph.seriesCount - 1];
}

bool NumberGraph::addAutomatic(const std::vector<double>& values) {
    return kor::AddSeries(graph, DataOf(values, nullptr, 0));
}

void NumberGraph::set(int series, int point, double value) {
    kor::SetSeriesValue(graph, {series, point, value});
}

void NumberGraph::replace(int series, const std::vector<double>& values) {
    kor::ReplaceSeriesValues(graph, DataOf(values, L"ignored", series));
}

void NumberGraph::resizePlot(int width, int height) {
    graph.rcPlot = {0, 0, width + 30, height + 30};
    rescale();
}

void NumberGraph::showX(double low, double high) {
    graph.xMin = low;
    graph.xMax = high;
    kor::RescaleX(graph);
}

void NumberGraph::showY(double low, double high) {
    graph.yMin = low;
    graph.yMax = high;
    kor::RescaleY(graph);
}

void NumberGraph::rescale() {
    kor::RescaleX(graph);
    kor::RescaleY(graph);
}

std::wstring NumberGraph::hit(int x, int y) const {
    wchar_t text[kor::kTipTextCapacity + 1] = L"left over";
    const int found = kor::HitTestGraphValue(graph, x, y, text);
    EXPECT_EQ(found, text[0] != L'\0' ? 1 : 0) << "a miss leaves the text empty";
    return found ? text : L"-";
}

std::vector<double> ValuesOf(const kor::GraphSeries& series) {
    return {series.values, series.values + series.pointCount};
}

}  // namespace kortest
