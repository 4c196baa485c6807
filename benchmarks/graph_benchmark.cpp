// What drawing a chart costs: each redraw as a ratio to the floor, which is the same picture drawn
// literally with bare GDI calls into a memory DC and copied to the window once; what the data cost;
// and how the time grows with the points.
//
//   graph_benchmark            tables, and CSV lines "type,points,ms" for a curve
//   graph_benchmark --check    the same; status 0 only when every figure keeps its bar
//   graph_benchmark --quick    without the floors of a million points, which take seconds each
#include <korcontrols/graph.h>

#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <memory>

#include "graph/pictures/literal_chart.h"
#include "interleaved.h"

namespace {

using kortest::ChartFonts;
using kortest::ChartState;

constexpr int kWidth = 320;
constexpr int kHeight = 240;
constexpr int kSmallRounds = 120;
const char* const kTypeNames[] = {"line", "area", "bar", "column", "pie"};

HWND host;
bool allHold = true;

using Values = std::vector<double>;

Values Noise(int count, unsigned seed) {
    Values values(static_cast<size_t>(count));
    for (double& value : values) {
        seed = seed * 1664525u + 1013904223u;
        value = (seed >> 8) / 16777216.0 * 100 - 20;
    }
    return values;
}

LRESULT CALLBACK HostProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    return DefWindowProcW(hwnd, message, wParam, lParam);
}

void CreateHost() {
    WNDCLASSW windowClass = {};
    windowClass.lpfnWndProc = HostProc;
    windowClass.hInstance = GetModuleHandleW(nullptr);
    windowClass.lpszClassName = L"Graph benchmark";
    RegisterClassW(&windowClass);
    RegisterGraphControl(windowClass.hInstance);
    host = CreateWindowW(windowClass.lpszClassName, L"", WS_POPUP | WS_VISIBLE, 0, 0, kWidth,
                         kHeight, nullptr, nullptr, windowClass.hInstance, nullptr);
}

HWND CreateChart() {
    return CreateWindowW(KORGRAPH_CLASS, L"", WS_CHILD | WS_VISIBLE, 0, 0, kWidth, kHeight, host,
                         nullptr, GetModuleHandleW(nullptr), nullptr);
}

void AddSeries(HWND chart, const Values& values) {
    const GraphSeriesData data = {static_cast<LONG>(values.size()), nullptr, values.data(), 0};
    KorGraph_AddSeries(chart, &data);
}

HDC CreateImage() {
    HDC window = GetDC(host);
    HDC dc = CreateCompatibleDC(window);
    SelectObject(dc, CreateCompatibleBitmap(window, kWidth, kHeight));
    ReleaseDC(host, window);
    SetBkMode(dc, TRANSPARENT);
    return dc;
}

void CopyToWindow(HWND chart, HDC dc) {
    HDC window = GetDC(chart);
    BitBlt(window, 0, 0, kWidth, kHeight, dc, 0, 0, SRCCOPY);
    ReleaseDC(chart, window);
}

// The spans of a pie's slices, found beforehand, so that its floor only draws.
struct SliceSpans {
    COLORREF colour;
    std::vector<POINT> ends;  // two per span
};

// A chart beside its floor.
class Pair {
public:
    Pair(int type, int seriesCount, int points)
        : chart_(CreateChart()), dc_(CreateImage()), fonts_(dc_), state_(fonts_) {
        state_.resize(kWidth, kHeight);
        KorGraph_SetType(chart_, type);
        state_.setType(type);
        for (int i = 0; i < seriesCount; ++i) {
            const Values values = Noise(points, static_cast<unsigned>(i + 1));
            AddSeries(chart_, values);
            state_.addSeries(values);
        }
        if (type == KORGRAPH_PIE) FindSpans();
    }
    ~Pair() { DestroyWindow(chart_); }
    Pair(const Pair&) = delete;
    Pair& operator=(const Pair&) = delete;

    void Redraw() {
        KorGraph_Redraw(chart_);
        UpdateWindow(chart_);
    }

    void Floor() {
        if (state_.type == KORGRAPH_PIE) {
            DrawPieFloor();
        } else {
            DrawLiteral(state_, fonts_, dc_);
        }
        CopyToWindow(chart_, dc_);
    }

private:
    void FindSpans();
    void DrawPieFloor();
    void DrawPercentage(POINT centre, int radius, double middle, double share);

    HWND chart_;
    HDC dc_;
    ChartFonts fonts_;
    ChartState state_;
    std::vector<SliceSpans> slices_;
};

void Pair::FindSpans() {
    const kortest::LiteralPie pie = PlacePie(state_);
    double end = 0;
    for (const double value : state_.series[0].values) {
        const double start = end;
        end += std::fabs(value) / state_.absSum() * 360;
        SliceSpans spans = {kortest::PaletteColour(2 + static_cast<int>(slices_.size() % 15)), {}};
        for (int dy = -pie.radius; dy <= pie.radius; ++dy) {
            const int half = static_cast<int>(std::sqrt(pie.radius * pie.radius - dy * dy));
            bool inside = false;
            for (int dx = -half; dx <= half; ++dx) {
                const double angle = kortest::AngleOf(dx, dy);
                const bool now = dx < half && start <= angle && angle < end;
                if (now != inside) spans.ends.push_back({pie.centre.x + dx, pie.centre.y + dy});
                inside = now;
            }
        }
        slices_.push_back(spans);
    }
}

void Pair::DrawPercentage(POINT centre, int radius, double middle, double share) {
    const double angle = middle * 0.017453292519943295;
    const POINT at = {centre.x - static_cast<int>(radius * std::sin(angle)),
                      centre.y - static_cast<int>(radius * std::cos(angle))};
    const bool left = at.x < centre.x;
    const bool above = at.y < centre.y;
    RECT box = {left ? at.x - state_.tipWidth : at.x, above ? at.y - state_.tipHeight : at.y, 0, 0};
    box.right = box.left + state_.tipWidth;
    box.bottom = box.top + state_.tipHeight;
    wchar_t text[16];
    wsprintfW(text, L"%d%%", static_cast<int>(share * 100 + 0.5));
    DrawTextW(dc_, text, -1, &box, left ? DT_RIGHT : DT_LEFT);
}

void Pair::DrawPieFloor() {
    const kortest::LiteralPie pie = PlacePie(state_);
    kortest::FillLiteral(dc_, state_.surface, state_.background);
    const double sum = state_.absSum();
    const auto radius = [&](double degrees) {
        const double angle = degrees * 0.017453292519943295;
        const POINT ends[] = {pie.centre,
                              {pie.centre.x - static_cast<int>(pie.radius * std::sin(angle)),
                               pie.centre.y - static_cast<int>(pie.radius * std::cos(angle))}};
        Polyline(dc_, ends, 2);
    };
    double end = 0;
    for (size_t k = 0; k < slices_.size(); ++k) {
        const double start = end;
        end += std::fabs(state_.series[0].values[k]) / sum * 360;
        {
            kortest::Drawn pen(dc_, CreatePen(PS_SOLID, 1, slices_[k].colour));
            for (size_t i = 0; i + 1 < slices_[k].ends.size(); i += 2) {
                Polyline(dc_, &slices_[k].ends[i], 2);
            }
        }
        radius(start);
        radius(end);
    }
    HGDIOBJ brush = SelectObject(dc_, GetStockObject(NULL_BRUSH));
    Ellipse(dc_, pie.box.left, pie.box.top, pie.box.right, pie.box.bottom);
    SelectObject(dc_, brush);
    HGDIOBJ font = SelectObject(dc_, fonts_.upright());
    end = 0;
    for (const double value : state_.series[0].values) {
        const double share = std::fabs(value) / sum;
        DrawPercentage({kWidth / 2, kHeight / 2}, pie.radius + 4, end + share * 180, share);
        end += share * 360;
    }
    SelectObject(dc_, font);
}

void PrintHeading(const char* title) {
    std::printf("\n%s\n%-30s %12s %12s %9s %7s\n", title, "", "floor us", "us", "x floor", "bar");
}

void Print(const std::string& name, double floor, double taken, double bar) {
    const double ratio = taken / floor;
    const bool holds = ratio <= bar;
    allHold = allHold && holds;
    std::printf("%-30s %12.0f %12.0f %9.4f %7.2f %s\n", name.c_str(), floor, taken, ratio, bar,
                holds ? "" : "MISSED");
    std::fflush(stdout);
}

double FastestTime(int rounds, const std::function<void()>& run) {
    std::vector<bench::Way> ways = {{"", run}};
    bench::TimeInTurns(ways, rounds, 0);
    return ways[0].fastest;
}

void MeasureSmall() {
    PrintHeading("redraw of few points");
    for (const auto& [series, points] : {std::pair{1, 10}, {3, 100}}) {
        for (int type = KORGRAPH_LINE; type <= KORGRAPH_PIE; ++type) {
            Pair pair(type, series, points);
            std::vector<bench::Way> ways = {{"floor", [&] { pair.Floor(); }},
                                            {"redraw", [&] { pair.Redraw(); }}};
            bench::TimeInTurns(ways, kSmallRounds);
            Print(std::string(kTypeNames[type]) + " of " + std::to_string(series) + " x " +
                      std::to_string(points),
                  ways[0].fastest, ways[1].fastest, 1.2);
        }
    }
}

void MeasureLarge(int type, int points, int floorRounds, double bar) {
    Pair pair(type, 1, points);
    pair.Redraw();
    const double floor = FastestTime(floorRounds, [&] { pair.Floor(); });
    Print(std::string(kTypeNames[type]) + " of " + std::to_string(points), floor,
          FastestTime(12, [&] { pair.Redraw(); }), bar);
}

// One pass that copies and finds what a series keeps.
double CopyInOnePass(const Values& values) {
    auto* copy = static_cast<double*>(LocalAlloc(LMEM_FIXED, values.size() * sizeof(double)));
    double least = values[0];
    double most = values[0];
    double sum = 0;
    for (size_t i = 0; i < values.size(); ++i) {
        const double value = values[i];
        copy[i] = value;
        if (value < least) least = value;
        if (value > most) most = value;
        sum += std::fabs(value);
    }
    const double kept = copy[values.size() / 2] + least + most + sum;
    LocalFree(copy);
    return kept;
}

void MeasureAdding() {
    PrintHeading("adding a series of 1,000,000 values");
    const Values values = Noise(1000000, 1);
    HWND chart = CreateChart();
    volatile double kept = 0;
    std::vector<bench::Way> ways = {{"copy", [&] { kept = CopyInOnePass(values); }},
                                    {"add", [&] {
                                         AddSeries(chart, values);
                                         KorGraph_Clear(chart);
                                     }}};
    bench::TimeInTurns(ways, 20);
    Print("add and remove", ways[0].fastest, ways[1].fastest, 1.2);
    DestroyWindow(chart);
}

double HeapBytes() {
    double bytes = 0;
    PROCESS_HEAP_ENTRY entry = {};
    HeapLock(GetProcessHeap());
    while (HeapWalk(GetProcessHeap(), &entry)) {
        if (entry.wFlags & PROCESS_HEAP_ENTRY_BUSY) bytes += entry.cbData;
    }
    HeapUnlock(GetProcessHeap());
    return bytes;
}

void MeasureMemory(const char* name, DWORD options, double bar) {
    constexpr int kPoints = 200000;
    const Values values = Noise(kPoints, 1);
    HWND chart = CreateChart();
    KorGraph_ToggleOptions(chart, options);
    const double before = HeapBytes();
    AddSeries(chart, values);
    const double perPoint = (HeapBytes() - before) / kPoints;
    const bool holds = perPoint >= bar && perPoint < bar + 0.05;
    allHold = allHold && holds;
    std::printf("%-30s %12.3f bytes, bar %.0f %s\n", name, perPoint, bar, holds ? "" : "MISSED");
    DestroyWindow(chart);
}

void PrintCurve() {
    std::printf("\ntype,points,ms\n");
    for (int type = KORGRAPH_LINE; type <= KORGRAPH_COLUMN; ++type) {
        for (int points = 10; points <= 10000000; points *= 10) {
            HWND chart = CreateChart();
            KorGraph_SetType(chart, type);
            AddSeries(chart, Noise(points, 1));
            const double taken = FastestTime(points > 100000 ? 3 : 9, [&] {
                KorGraph_Redraw(chart);
                UpdateWindow(chart);
            });
            std::printf("%s,%d,%.3f\n", kTypeNames[type], points, taken / 1000);
            DestroyWindow(chart);
        }
    }
}

bool HasArgument(int count, char** arguments, const char* wanted) {
    for (int i = 1; i < count; ++i) {
        if (std::strcmp(arguments[i], wanted) == 0) return true;
    }
    return false;
}

}  // namespace

int main(int argumentCount, char** arguments) {
    CreateHost();
    std::printf("chart, %d x %d, %d bits\n", kWidth, kHeight, static_cast<int>(8 * sizeof(void*)));
    MeasureSmall();
    PrintHeading("redraw of many points");
    for (const int type : {KORGRAPH_LINE, KORGRAPH_COLUMN, KORGRAPH_BAR}) {
        MeasureLarge(type, 10000, 3, 0.10);
    }
    MeasureLarge(KORGRAPH_AREA, 10000, 1, 0.05);
    if (!HasArgument(argumentCount, arguments, "--quick")) {
        for (const int type : {KORGRAPH_LINE, KORGRAPH_COLUMN, KORGRAPH_BAR}) {
            MeasureLarge(type, 1000000, 1, 0.01);
        }
    }
    MeasureAdding();
    std::printf("\nmemory per point\n");
    MeasureMemory("series", 0, 8);
    MeasureMemory("series in live mode", KORGRAPH_LIVE, 16);
    PrintCurve();
    DestroyWindow(host);
    std::printf("\n%s\n", allHold ? "every bar holds" : "some bars were MISSED");
    return HasArgument(argumentCount, arguments, "--check") && !allHold ? 1 : 0;
}
