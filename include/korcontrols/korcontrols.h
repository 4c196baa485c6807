/* korcontrols: custom window controls for Windows CE handhelds and Windows desktops.
 *
 * This header names what belongs to no single control. Each control has a header of its own:
 *
 *   <korcontrols/grid.h>         the spreadsheet grid
 *   <korcontrols/header.h>       the header strip that the grid uses for its letters and numbers
 *   <korcontrols/graph.h>        the chart, with <korcontrols/legend.h> and <korcontrols/tooltip.h>
 *   <korcontrols/funkybar.h>     the function bar
 *   <korcontrols/listhelpers.h>  helpers for list views and tree views
 *
 * All headers are plain C (C90 and later) and C++. All text is UTF-16. All functions use the C
 * calling convention and are called from the one thread that owns the controls' windows.
 *
 * The inline functions that stand for a message, such as KorGraph_SetTitle, answer for a window
 * that is null or gone what SendMessageW does: 0, whatever 0 means to the message.
 * KorGraph_AddSeries and KorGraph_SetCategories, whose messages answer 0 for success, return TRUE
 * then.
 *
 * The library registers its six window classes under the instance that the host gives, and never
 * unregisters one. A host that unloads the library first destroys all windows of these classes, the
 * tooltips in the charts' parents among them, and then unregisters the classes with that instance:
 * KORGRID_CLASS, KORHEADER_CLASS, KORGRAPH_CLASS, KORLEGEND_CLASS, KORTOOLTIP_CLASS and
 * KORFUNKYBAR_CLASS. A class that stays leads into memory where the library was.
 *
 * None of the window classes has a cursor: a host sets one when its window gets WM_SETCURSOR, or
 * the pointer keeps the shape it had outside. */
#ifndef KORCONTROLS_KORCONTROLS_H
#define KORCONTROLS_KORCONTROLS_H

#include <windows.h>

#define KORCONTROLS_API __cdecl

/* A record of WORDs lies on even addresses, no coarser ones. Some compilers for ARM would take it
 * to lie on multiples of 4. */
#ifdef __GNUC__
#define KORCONTROLS_EVEN __attribute__((packed, aligned(2)))
#else
#define KORCONTROLS_EVEN
#endif

#ifdef __cplusplus
extern "C" {
#endif

/* Version of the library: the two low decimal digits of its release, 49 for this one.
 *   result  49; a host that needs a later library compares with "less than" */
LONG KORCONTROLS_API KORCONTROLS_Version(void);

#ifdef __cplusplus
}
#endif

#endif /* KORCONTROLS_KORCONTROLS_H */
