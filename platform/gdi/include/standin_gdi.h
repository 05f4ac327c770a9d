// The stand-in's own control surface for the graphics interface: the virtual
// screen that every window paints into. Not part of the real platform's API;
// the windowing system and the test harness use it.
#pragma once
#include "windef.h"

namespace standin {

// Size of the virtual desktop surface in pixels (default 1280 x 1024).
SIZE screen_size();
void set_screen_size(int cx, int cy);

// A device context that draws onto the screen surface. Logical (0,0) maps to
// the screen point `origin`; output is clipped to `clip` (screen coordinates).
// The windowing system creates these for GetDC/BeginPaint and frees them with
// delete_screen_dc when the DC is released.
HDC create_screen_dc(POINT origin, const RECT& clip);
void delete_screen_dc(HDC hdc);

// Pixels of the screen surface, 0x00RRGGBB, row-major.
DWORD screen_pixel(int x, int y);

// Save a part of the screen (screen coordinates) as a PNG file. Returns false
// if the file cannot be written.
bool save_screen_png(const wchar_t* path, const RECT& area);

}  // namespace standin
