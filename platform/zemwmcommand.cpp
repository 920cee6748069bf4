#include "zemwmcommand.h"

#include <cstdio>
#include <cstdlib>
#include <cstring>

#include <X11/Xlib-xcb.h>
#include <X11/Xlib.h>
#include <xcb/xcb.h>

bool SendCommandToWM(Display* display, const char* command)
{
    if (!display) {
        std::fprintf(stderr, "zem-admin-hotkeys: no X display; the window manager was not told\n");
        return false;
    }
    if (!command)
        return false;
    // The toolkit's X connection reports errors of unchecked requests to its own log only; a
    // checked request on the underlying connection lets the caller know.
    xcb_connection_t* connection = XGetXCBConnection(display);
    const char name[] = "_ZEMWM_COMMAND";
    xcb_intern_atom_reply_t* atom =
        xcb_intern_atom_reply(connection, xcb_intern_atom(connection, 0, sizeof(name) - 1, name), nullptr);
    if (!atom)
        return false;
    const xcb_window_t root = DefaultRootWindow(display);
    xcb_generic_error_t* error = xcb_request_check(
        connection, xcb_change_property_checked(connection, XCB_PROP_MODE_APPEND, root, atom->atom,
                                                XCB_ATOM_STRING, 8, uint32_t(std::strlen(command)), command));
    const bool sent = !error;
    std::free(atom);
    std::free(error);
    return sent;
}
