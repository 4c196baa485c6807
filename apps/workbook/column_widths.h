// The column widths, which the grid keeps but cannot be asked for.
#pragma once

#include <array>

#include "model/address.h"

namespace workbook {

constexpr int kDefaultColumnWidth = 60;

// In units: pixels at 100 % zoom.
class ColumnWidths {
public:
    ColumnWidths() { reset(); }

    void reset() { units_.fill(kDefaultColumnWidth); }
    void set(int column, int units) { units_[static_cast<size_t>(column)] = units; }
    int of(int column) const { return units_[static_cast<size_t>(column)]; }

    // Of columns `first` up to, and without, `end`.
    int sum(int first, int end) const {
        int total = 0;
        for (int column = first; column < end; ++column) total += of(column);
        return total;
    }

private:
    std::array<int, kColumnCount> units_;
};

}  // namespace workbook
