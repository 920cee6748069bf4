#pragma once

typedef struct _XDisplay Display;

// Hands one command line to the running window manager: the bytes are appended to the root
// window's _ZEMWM_COMMAND property, which the window manager reads and deletes. The request is
// checked: false when the X server refused it (a property of another type or format is in the
// way). Without a display (another platform than X11) it says so on standard error and returns
// false.
bool SendCommandToWM(Display* display, const char* command);
