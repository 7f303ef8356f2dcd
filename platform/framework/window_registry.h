#pragma once

#include "platform/framework/window.h"

#include <memory>

// The register of living windows; for the framework alone.
namespace kota {

// Makes a window and gives its handle. `object` may be null.
HWND registerWindow(const WindowSetup& setup, CWnd* object);
// The windows inside are the caller's to destroy before.
void unregisterWindow(HWND handle);
// Null for a handle of no living window.
WindowState* windowState(HWND handle);
// Makes a plain object the window's own, until another takes the window over.
CWnd* adoptWindow(HWND handle, std::unique_ptr<CWnd> object);
// Whether the object of a window is the plain one of its own.
bool hasPlainObject(HWND handle);
// Hands the window over to `object`; the plain one that it had lets go of it.
void releaseWindow(HWND handle, CWnd* object);
// The window that a control reports to: the nearest around it that is no mere group or row.
HWND dialogAround(HWND control);
// Makes the tabs of a sheet.
HWND createTabs(HWND sheet, UINT id, std::vector<CString> captions);
// The focus is with nobody, if it was with this window.
void forgetFocus(HWND handle);

} // namespace kota
