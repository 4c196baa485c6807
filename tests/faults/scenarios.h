// The lives of all controls. Each begins with the registration of the class, where that is still to
// be done, and ends with nothing of it left.
#pragma once

#include "faults/life.h"

namespace kortest {

void RegisterGridClass(Life& life);
void RegisterStripClass(Life& life);

void LiveGridCreation(Life& life);
void LiveGridDrawing(Life& life);
void LiveGridSizes(Life& life);
void LiveGridView(Life& life);
void LiveGridSelection(Life& life);
void LiveGridScrolling(Life& life);
void LiveGridEquation(Life& life);

void LiveHeader(Life& life);

void LiveChartCreation(Life& life);
void LiveLineChart(Life& life);
void LiveAreaChart(Life& life);
void LiveBarChart(Life& life);
void LiveColumnChart(Life& life);
void LivePieChart(Life& life);
void LiveManyPoints(Life& life);
void LiveSweep(Life& life);
void LiveReplacement(Life& life);
void LiveZoom(Life& life);
void LiveSettings(Life& life);
void LiveCopy(Life& life);
void LivePrint(Life& life);
void LiveSheetOfTitles(Life& life);
void LiveSheetOfRanges(Life& life);
void LiveCommandBar(Life& life);

void LiveToolTip(Life& life);
void LiveLegend(Life& life);
void LiveFunctionBar(Life& life);
void LiveLists(Life& life);
void LiveTrees(Life& life);

}  // namespace kortest
