// The table of what a user or a host does with the controls.
#pragma once

#include <functional>
#include <string>
#include <vector>

namespace footprint {

struct Interaction {
    std::string name;
    std::function<void()> prepare;  // in an empty host; not counted
    std::function<void()> act;
};

// Those of the grid, its strips, the function bar and the list helpers.
std::vector<Interaction> PlainInteractions();

// Those of a chart of one series.
std::vector<Interaction> ChartInteractions(int points);

struct Creation {
    std::string name;
    std::function<void()> create;  // in an empty host
};

std::vector<Creation> Creations();

}  // namespace footprint
