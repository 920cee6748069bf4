#include "zemwmcommand.h"

#include <cstdio>
#include <cstring>

#include <X11/Xatom.h>
#include <X11/Xlib.h>

void SendCommandToWM(Display* display, const char* command)
{
    if (!display) {
        std::fprintf(stderr, "zem-admin-hotkeys: no X display; the window manager was not told\n");
        return;
    }
    if (!command)
        return;
    const Atom property = XInternAtom(display, "_ZEMWM_COMMAND", False);
    XChangeProperty(display, DefaultRootWindow(display), property, XA_STRING, 8, PropModeAppend,
                    reinterpret_cast<const unsigned char*>(command), int(std::strlen(command)));
    XFlush(display);
}
