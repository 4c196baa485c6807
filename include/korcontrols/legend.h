/* The legend: a child window of the chart that lists its series, or a pie's slices, one line each.
 * The chart creates it (GM_SHOWLEGEND) and registers its class when it creates the first one. A
 * host needs only its class and id, to find it with GetDlgItem. */
#ifndef KORCONTROLS_LEGEND_H
#define KORCONTROLS_LEGEND_H

#include <korcontrols/korcontrols.h>

#define KORLEGEND_CLASS L"KORVANE Corporation LegendControl"
#define KORLEGEND_ID 30 /* among the chart's children */

#endif /* KORCONTROLS_LEGEND_H */
