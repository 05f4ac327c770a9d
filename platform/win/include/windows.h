// The platform's umbrella header: everything a program of the windowing
// system normally sees.
#pragma once
#include "windef.h"
#include "winerror.h"
#include "winbase.h"
#if __has_include("sysinfoapi.h")
#include "sysinfoapi.h"
#endif
#if __has_include("winuser.h")
#include "winuser.h"
#endif
#if __has_include("wingdi.h")
#include "wingdi.h"
#endif
