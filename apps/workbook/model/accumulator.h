// Adds numbers up without losing the small ones among the large: ten times 0.1 is 1.
#ifndef WORKBOOK_MODEL_ACCUMULATOR_H
#define WORKBOOK_MODEL_ACCUMULATOR_H

#include <algorithm>
#include <cmath>
#include <cstddef>

namespace workbook {

class Accumulator {
public:
    void add(double number) {
        lowest_ = count_ == 0 ? number : std::min(lowest_, number);
        highest_ = count_ == 0 ? number : std::max(highest_, number);
        ++count_;
        // Neumaier's summation: what rounding cut off is collected beside the sum.
        const double next = sum_ + number;
        lost_ +=
            std::fabs(sum_) >= std::fabs(number) ? (sum_ - next) + number : (number - next) + sum_;
        sum_ = next;
    }

    size_t count() const { return count_; }
    double sum() const { return std::isfinite(sum_) ? sum_ + lost_ : sum_; }
    double average() const { return count_ == 0 ? 0 : sum() / static_cast<double>(count_); }
    double lowest() const { return lowest_; }    // 0 without numbers
    double highest() const { return highest_; }  // likewise

private:
    size_t count_ = 0;
    double sum_ = 0;
    double lost_ = 0;
    double lowest_ = 0;
    double highest_ = 0;
};

}  // namespace workbook

#endif
