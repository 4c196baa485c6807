// What a host, the system and other programs do to any window.
#pragma once

#include "storms/stage.h"

namespace kortest {

template <Kind kind>
struct WindowWords {
    static void create(Stage& stage, const Arguments& a);
    static void destroy(Stage& stage, const Arguments& a);
    static void destroyParent(Stage& stage, const Arguments& a);
    static void destroyMessage(Stage& stage, const Arguments& a);
    static void resize(Stage& stage, const Arguments& a);
    static void show(Stage& stage, const Arguments& a);
    static void enable(Stage& stage, const Arguments& a);
    static void paint(Stage& stage, const Arguments& a);
    static void erase(Stage& stage, const Arguments& a);
    static void focus(Stage& stage, const Arguments& a);
    static void capture(Stage& stage, const Arguments& a);
    static void reparent(Stage& stage, const Arguments& a);
    static void press(Stage& stage, const Arguments& a);
    static void move(Stage& stage, const Arguments& a);
    static void release(Stage& stage, const Arguments& a);
    static void wild(Stage& stage, const Arguments& a);
};

// The words of a kind: `name` is its prefix, as a literal with a dot.
#define KORTEST_WINDOW_WORDS(kind, name)                                                           \
    {name "create", 6, "spzznb", WindowWords<kind>::create},                                       \
        {name "destroy", 5, "s", WindowWords<kind>::destroy},                                      \
        {name "destroy_parent", 2, "s", WindowWords<kind>::destroyParent},                         \
        {name "destroy_message", 1, "s", WindowWords<kind>::destroyMessage},                       \
        {name "resize", 30, "szz", WindowWords<kind>::resize},                                     \
        {name "show", 6, "sb", WindowWords<kind>::show},                                           \
        {name "enable", 2, "sb", WindowWords<kind>::enable},                                       \
        {name "paint", 30, "sb", WindowWords<kind>::paint},                                        \
        {name "erase", 4, "s", WindowWords<kind>::erase},                                          \
        {name "focus", 10, "s", WindowWords<kind>::focus},                                         \
        {name "capture", 6, "si", WindowWords<kind>::capture},                                     \
        {name "reparent", 2, "sp", WindowWords<kind>::reparent},                                   \
        {name "press", 60, "sxxn", WindowWords<kind>::press},                                      \
        {name "move", 80, "sxxb", WindowWords<kind>::move},                                        \
        {name "release", 50, "sxxb", WindowWords<kind>::release}, {                                \
        name "wild", 40, "swnn", WindowWords<kind>::wild                                           \
    }

extern const Word kHostWords[];
extern const size_t kHostWordCount;

extern template struct WindowWords<kStrip>;
extern template struct WindowWords<kGrid>;
extern template struct WindowWords<kChart>;
extern template struct WindowWords<kLegend>;
extern template struct WindowWords<kTip>;
extern template struct WindowWords<kBar>;
extern template struct WindowWords<kList>;
extern template struct WindowWords<kTree>;

inline WPARAM WideWord(int number) { return static_cast<WPARAM>(static_cast<intptr_t>(number)); }
inline int WrappedSum(int a, int b) {
    return static_cast<int>(static_cast<unsigned>(a) + static_cast<unsigned>(b));
}
inline LPARAM PairOf(int low, int high) { return static_cast<LPARAM>(MAKELPARAM(low, high)); }

}  // namespace kortest
