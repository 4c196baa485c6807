/* The first and only thing that this file includes. */
#include <korcontrols/korcontrols.h>

LONG useKorcontrolsHeaderAlone(void);

LONG useKorcontrolsHeaderAlone(void) { return KORCONTROLS_Version(); }
