#include "storms/arguments.h"

#include <korcontrols/graph.h>
#include <korcontrols/grid.h>
#include <korcontrols/header.h>

#include <cmath>
#include <iterator>
#include <limits>

namespace kortest {
namespace {

int Extreme(RandomSource& random) {
    return random.anyOf(
        {0,          1,          -1,      2,          -2,          127,
         128,        255,        256,     32767,      32768,       65535,
         65536,      16383,      16384,   0x7FFFFFFF, -0x7FFFFFFF, static_cast<int>(0x80000000u),
         0x7FFFFFFE, 0x40000000, 1000000, -100000});
}

int Wild(RandomSource& random) {
    return random.oneIn(2) ? Extreme(random) : static_cast<int>(random.next());
}

int Position(RandomSource& random) {
    if (random.oneIn(40)) return Wild(random);
    if (random.oneIn(8)) return random.anyOf({0, -1, 1, 29, 30, 31, 32767, -32768, 65535});
    return random.from(-4, 150);
}

int WindowSize(RandomSource& random) {
    if (random.oneIn(4000)) return random.anyOf({4000, 32767});
    if (random.oneIn(12)) return random.from(0, 4);
    if (random.oneIn(60)) return random.from(100, 500);
    return random.from(0, 150);
}

int Column(RandomSource& random) {
    if (random.oneIn(30)) return Wild(random);
    return random.oneIn(3) ? random.from(246, 260) : random.from(-1, 12);
}

int Row(RandomSource& random) {
    if (random.oneIn(30)) return Wild(random);
    if (random.oneIn(3)) return random.from(16370, 16390);
    return random.oneIn(3) ? random.anyOf({985, 995, 1000, 9985, 9995, 10000})
                           : random.from(-1, 20);
}

int ZoomLevel(RandomSource& random) {
    if (random.oneIn(400)) return random.anyOf({-1, 0x7FFFFFFF, 4000, 65536, 100000});
    if (random.oneIn(20)) return random.from(0, 60);
    return random.from(1, 8);
}

int Key(RandomSource& random) {
    if (random.oneIn(12)) return random.from(0, 255);
    return random.anyOf({VK_LEFT, VK_UP, VK_RIGHT, VK_DOWN, VK_PRIOR, VK_NEXT, VK_HOME, VK_END,
                         VK_TAB, VK_RETURN, VK_ESCAPE, VK_DELETE, VK_BACK, VK_SHIFT});
}

int PointCount(RandomSource& random) {
    if (random.oneIn(300)) return random.from(300, 3000);
    if (random.oneIn(20)) return random.from(30, 200);
    if (random.oneIn(30)) return random.anyOf({0, -1, static_cast<int>(0x80000000u)});
    return random.from(1, 14);
}

constexpr int kOrdinaryReals = 1000;  // numbers from here on are eighths

int Real(RandomSource& random) {
    return random.oneIn(4) ? random.below(24) : kOrdinaryReals + 400 + random.from(-700, 1600);
}

// Numbers of the system's own that carry no pointer, and the library's own numbers that do not.
constexpr UINT kMessages[] = {WM_NULL,
                              WM_MOVE,
                              WM_SIZE,
                              WM_ACTIVATE,
                              WM_SETFOCUS,
                              WM_KILLFOCUS,
                              WM_ENABLE,
                              WM_SETREDRAW,
                              WM_PAINT,
                              WM_ERASEBKGND,
                              WM_SHOWWINDOW,
                              WM_CANCELMODE,
                              WM_CAPTURECHANGED,
                              WM_NCPAINT,
                              WM_NCHITTEST,
                              WM_GETDLGCODE,
                              WM_KEYDOWN,
                              WM_KEYUP,
                              WM_CHAR,
                              WM_SYSCHAR,
                              WM_TIMER,
                              WM_HSCROLL,
                              WM_VSCROLL,
                              WM_MOUSEMOVE,
                              WM_LBUTTONDOWN,
                              WM_LBUTTONUP,
                              WM_LBUTTONDBLCLK,
                              WM_RBUTTONDOWN,
                              WM_RBUTTONUP,
                              WM_MOUSEWHEEL,
                              WM_CREATE,
                              WM_SYSCOLORCHANGE,
                              WM_FONTCHANGE,
                              WM_QUERYNEWPALETTE,
                              WM_MENUCHAR,
                              WM_GETTEXTLENGTH,
                              WM_COMMAND,
                              WM_USER,
                              WM_USER + 6003,
                              WM_USER + 9999,
                              GRIDM_REDRAW,
                              GM_SETTYPE,
                              GM_AUTORANGE,
                              GM_SETZOOM,
                              GM_TOGGLEOPTIONS,
                              GM_SETDATAMODE,
                              GM_SETBKCOLOR,
                              HCM_DELETEITEM,
                              HCM_SETITEMSTATE,
                              HCM_GETITEMCOUNT,
                              HCM_GETITEMSIZE,
                              HCN_ITEMCLICK,
                              HCN_ITEMRESIZING,
                              HCN_ITEMRESIZED,
                              0x8000,
                              0xC123,
                              0xFFFF};

constexpr UINT kHostMessages[] = {WM_PARENTNOTIFY,
                                  WM_COMMAND,
                                  WM_SIZE,
                                  WM_WINDOWPOSCHANGED,
                                  WM_WINDOWPOSCHANGING,
                                  WM_SETFOCUS,
                                  WM_KILLFOCUS,
                                  WM_KEYDOWN,
                                  WM_CAPTURECHANGED,
                                  WM_ERASEBKGND,
                                  WM_PAINT,
                                  GRIDN_EQUATIONENTERED,
                                  GRIDN_EQUATIONEMPTY,
                                  HCN_ITEMCLICK,
                                  HCN_ITEMRESIZING,
                                  HCN_ITEMRESIZED,
                                  WM_ENABLE,
                                  WM_SHOWWINDOW,
                                  WM_DESTROY,
                                  WM_CANCELMODE,
                                  WM_ENTERIDLE,
                                  WM_ENTERIDLE};

constexpr UINT kCodes[] = {0,
                           GRIDN_PAINTCELLS,
                           GRIDN_PAINTCELLS,
                           GRIDN_CELLCLICKED,
                           GRIDN_COLUMNRESIZED,
                           GRIDN_ROWRESIZED,
                           GRIDN_CURRENTCELL,
                           GRIDN_SELECTING,
                           GRIDN_SELECTIONDONE,
                           GRIDN_EDITFOCUS,
                           GRIDN_EDITKILLFOCUS,
                           0};

constexpr UINT kControlMessages[] = {
    WM_NCCREATE,         WM_NCCALCSIZE,     WM_CREATE,     WM_SIZE,          WM_WINDOWPOSCHANGING,
    WM_WINDOWPOSCHANGED, WM_PAINT,          WM_NCPAINT,    WM_ERASEBKGND,    WM_SETFOCUS,
    WM_KILLFOCUS,        WM_CAPTURECHANGED, WM_SHOWWINDOW, WM_PARENTNOTIFY,  WM_CTLCOLOREDIT,
    WM_CTLCOLORBTN,      WM_COMMAND,        WM_DESTROY,    WM_NCDESTROY,     WM_STYLECHANGED,
    WM_MEASUREITEM,      WM_DRAWITEM,       WM_CANCELMODE, WM_ENABLE,        WM_HSCROLL,
    WM_VSCROLL,          WM_SETTEXT,        WM_SETFONT,    HCM_INSERTITEM,   HCM_DELETEITEM,
    HCM_SETITEM,         HCM_GETITEMCOUNT,  HCN_ITEMCLICK, HCN_ITEMRESIZING, HCN_ITEMRESIZED,
    WM_KEYDOWN,          WM_NCHITTEST,      WM_MOVE,       GRIDM_REDRAW,     WM_LBUTTONUP};

constexpr int kHostEvents = static_cast<int>(std::size(kHostMessages));
constexpr int kCodeEvents = static_cast<int>(std::size(kCodes));
constexpr int kControlEvents = static_cast<int>(std::size(kControlMessages));

int DrawEvent(RandomSource& random) {
    if (random.oneIn(2)) return kHostEvents + random.below(kCodeEvents);  // a WM_NOTIFY
    if (random.oneIn(3)) return random.below(kHostEvents);
    return kHostEvents + kCodeEvents + random.below(2 * kControlEvents);
}

}  // namespace

int DrawArgument(RandomSource& random, char kind) {
    switch (kind) {
    case 'b': return random.below(2);
    case 's': return random.oneIn(3) ? random.below(4) : 0;
    case 'p': return random.oneIn(4) ? random.below(8) : random.below(2);
    case 'i': return random.oneIn(25) ? Wild(random) : random.from(-2, 14);
    case 'n': return Wild(random);
    case 'x': return Position(random);
    case 'z': return WindowSize(random);
    case 'c': return Column(random);
    case 'r': return Row(random);
    case 'q': return ZoomLevel(random);
    case 'k': return Key(random);
    case 'h': return random.oneIn(10) ? random.below(65536) : random.from(8, 126);
    case 't': return random.below(16);
    case 'd': return Real(random);
    case 'v': return random.below(12);
    case 'm': return PointCount(random);
    case 'e': return DrawEvent(random);
    case 'o': return random.oneIn(12) ? random.below(70000) : random.below(9);
    case 'w': return random.below(static_cast<int>(std::size(kMessages)));
    case 'g': return random.oneIn(10) ? Wild(random) : random.from(0, 300);
    default: return 0;
    }
}

const wchar_t* TextOf(int number) {
    static const std::wstring kLong(300, L'w');
    static const std::wstring kVeryLong(5000, L'i');
    static const std::wstring kLines = L"first\r\nsecond\n\nfourth\tend";
    static const wchar_t kHalfPair[] = {L'a', wchar_t(0xD800), L'b', wchar_t(0xDC00), 0};
    static const wchar_t* const kTexts[] = {nullptr,
                                            L"",
                                            L"a",
                                            L"1234.5",
                                            L"&Sold && bought",
                                            L"=SUM(A1:B2)",
                                            kLong.c_str(),
                                            kVeryLong.c_str(),
                                            kLines.c_str(),
                                            kHalfPair,
                                            L"#####",
                                            L"-0",
                                            L" ",
                                            L"\x05D0\x05D1\x0661",
                                            L"Vanilla",
                                            L"%s%n%d"};
    return kTexts[static_cast<unsigned>(number) % std::size(kTexts)];
}

double RealOf(int number) {
    using Limits = std::numeric_limits<double>;
    static const double kSpecial[] = {0.0,
                                      -0.0,
                                      Limits::quiet_NaN(),
                                      -Limits::quiet_NaN(),
                                      Limits::infinity(),
                                      -Limits::infinity(),
                                      Limits::max(),
                                      -Limits::max(),
                                      Limits::min(),
                                      Limits::denorm_min(),
                                      -Limits::denorm_min(),
                                      1e300,
                                      -1e300,
                                      1e-300,
                                      2147483647.0,
                                      2147483648.0,
                                      -2147483648.0,
                                      -2147483649.0,
                                      4294967296.0,
                                      9007199254740993.0,
                                      0.1,
                                      99999.5,
                                      1.0,
                                      -1.0};
    if (number >= kOrdinaryReals || number < 0) return (number - kOrdinaryReals - 400) / 8.0;
    return kSpecial[static_cast<unsigned>(number) % std::size(kSpecial)];
}

std::vector<double> SeriesOf(int kind, int count) {
    RandomSource random(static_cast<uint64_t>(kind) * 1000003u + static_cast<uint64_t>(count));
    std::vector<double> values(static_cast<size_t>(count));
    double walk = 0;
    for (int i = 0; i < count; ++i) {
        double value = 0;
        switch (kind) {
        case 0: value = i % 3 == 1 ? 1 : 5; break;               // ties
        case 1: value = 7; break;                                // constant
        case 2: value = i; break;                                // sorted
        case 3: value = -2.5 * i; break;                         // sorted, falling
        case 4: value = i % 2 ? 40 : -40; break;                 // zig-zag
        case 5: value = i / 4 * 3; break;                        // steps
        case 6: value = RealOf(random.below(24)); break;         // special numbers
        case 7: value = random.oneIn(4) ? RealOf(2) : i; break;  // gaps of NaN
        case 8: value = 0; break;
        case 9: value = random.from(0, 3); break;  // many ties
        case 10: value = (random.oneIn(2) ? 1e300 : -1e300) / (i + 1); break;
        default: value = walk += random.from(-50, 50) / 8.0; break;  // a walk
        }
        values[static_cast<size_t>(i)] = value;
    }
    return values;
}

UINT MessageOf(int number) {
    return kMessages[static_cast<unsigned>(number) % std::size(kMessages)];
}

Event EventOf(int number) {
    if (number < kHostEvents) return {Event::kHost, kHostMessages[number], 0};
    number -= kHostEvents;
    if (number < kCodeEvents) return {Event::kHost, WM_NOTIFY, kCodes[number]};
    number -= kCodeEvents;
    return {number % 2 ? Event::kAfter : Event::kBefore,
            kControlMessages[number / 2 % kControlEvents], 0};
}

}  // namespace kortest
