// Names in the public headers; nothing is done with them here.
#pragma once

#include <windows.h>

struct TBBUTTON;
