#include "header/hit_test.h"

namespace kor {

namespace {

constexpr int kGrip = 6;

}  // namespace

HeaderHit HitTestHeader(const uint16_t* sizes, uint32_t count, int position) {
    HeaderHit hit = {-1, false, -1};
    if (position < 0) return hit;
    int edge = 0;  // start of item i, then its end
    for (uint32_t i = 0; i < count && hit.item < 0; ++i) {
        const int item = static_cast<int>(i);
        if (position - edge < kGrip) {
            hit.onBorder = true;
            hit.borderItem = item - 1;
        }
        edge += sizes[i];
        if (edge > position) hit.item = item;
    }
    if (edge - position >= 1 && edge - position < kGrip) {
        hit.onBorder = true;
        hit.borderItem = hit.item;
    }
    return hit;
}

}  // namespace kor
