// Steps that the chart's lives share.
#pragma once

#include <korcontrols/graph.h>
#include <korcontrols/legend.h>
#include <korcontrols/tooltip.h>

#include "faults/life.h"

#include <vector>

namespace kortest {

constexpr int kChartWidth = 150;
constexpr int kChartHeight = 100;
constexpr DWORD kAllOptions = 0x3FF;

// A visible chart in the life's host, or null.
HWND CreateChart(Life& life, int width = kChartWidth, int height = kChartHeight);

// Draws and looks once more, and destroys it.
void EndChart(Life& life, HWND chart);

// False for no window and for one without a record.
bool HasRecord(HWND chart);

void AddSeries(Life& life, HWND chart, const std::vector<double>& values, const wchar_t* name);
void SetCategories(Life& life, HWND chart, const std::vector<const wchar_t*>& labels);

// The print modules that a chart loads when it is created are the tests' own.
void StandInForPrinting(Life& life);

}  // namespace kortest
