#pragma once

typedef struct _XDisplay Display;

// Hands one command line to the running window manager: the bytes are appended to the root
// window's _ZEMWM_COMMAND property, which the window manager reads and deletes. Without a
// display (another platform than X11) it says so on standard error and does nothing.
void SendCommandToWM(Display* display, const char* command);
