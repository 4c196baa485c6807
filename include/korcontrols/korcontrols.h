/* korcontrols: custom window controls for Windows CE handhelds and Windows desktops.
 *
 * This header declares what belongs to no single control. Each control has a header of its own:
 *
 *   <korcontrols/grid.h>         the spreadsheet grid
 *   <korcontrols/header.h>       the header strip that the grid uses for its letters and numbers
 *   <korcontrols/graph.h>        the chart, with <korcontrols/legend.h> and <korcontrols/tooltip.h>
 *   <korcontrols/funkybar.h>     the function bar
 *   <korcontrols/listhelpers.h>  helpers for list views and tree views
 *
 * All headers are plain C (C90 and later) and C++. All text is UTF-16. All functions use the C
 * calling convention and must be called from the one thread that owns the controls' windows.
 *
 * The inline functions that stand for a message, such as KorGraph_SetTitle, do not check the
 * window. For a null or destroyed window they return what SendMessageW returns: 0, whatever 0 means
 * for the message. KorGraph_AddSeries and KorGraph_SetCategories, whose messages return 0 for
 * success, then return TRUE.
 *
 * The library registers its six window classes under the instance that the host gives, and never
 * unregisters them. A host that unloads the library must first destroy all windows of these
 * classes, including the tooltips in the charts' parents, and then unregister the classes with that
 * instance: KORGRID_CLASS, KORHEADER_CLASS, KORGRAPH_CLASS, KORLEGEND_CLASS, KORTOOLTIP_CLASS and
 * KORFUNKYBAR_CLASS. A class that stays registered points to unloaded code.
 *
 * None of the window classes has a cursor. Set one when the host's window receives WM_SETCURSOR;
 * otherwise the pointer keeps the shape it had outside. */
#ifndef KORCONTROLS_KORCONTROLS_H
#define KORCONTROLS_KORCONTROLS_H

#include <windows.h>

#define KORCONTROLS_API __cdecl

/* Aligns a structure of WORDs to 2 bytes, no more. Some ARM compilers would otherwise align it to
 * 4. */
#ifdef __GNUC__
#define KORCONTROLS_EVEN __attribute__((packed, aligned(2)))
#else
#define KORCONTROLS_EVEN
#endif

#ifdef __cplusplus
extern "C" {
#endif

/* Version of the library: the last two decimal digits of its release number, 49 for this release.
 *   result  49. A host that needs a later version refuses any result less than that version */
LONG KORCONTROLS_API KORCONTROLS_Version(void);

#ifdef __cplusplus
}
#endif

#endif /* KORCONTROLS_KORCONTROLS_H */
