// Kernel services of the stand-in platform: last-error value, global memory,
// the module loader and resources.
#pragma once
#include "windef.h"
#include "winerror.h"

#ifdef __cplusplus
extern "C" {
#endif

// The last-error value is kept per thread, as on the real platform.
DWORD GetLastError(void);
void SetLastError(DWORD dwErrCode);

#ifdef __cplusplus
}
#endif
