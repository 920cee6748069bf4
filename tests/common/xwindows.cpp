#include "xwindows.h"

#include <QDeadlineTimer>
#include <QProcess>
#include <QRegularExpression>
#include <QThread>

#include <X11/Xatom.h>
#include <X11/Xlib.h>
#include <X11/Xutil.h>

XConnection::XConnection(const QByteArray& name) : displayName(name.isEmpty() ? qgetenv("DISPLAY") : name)
{
    display = XOpenDisplay(displayName.constData());
}

XConnection::~XConnection()
{
    if (display)
        XCloseDisplay(display);
}

QString XConnection::title(unsigned long window) const
{
    const Atom netWmName = XInternAtom(display, "_NET_WM_NAME", False);
    const Atom utf8 = XInternAtom(display, "UTF8_STRING", False);
    Atom type = None;
    int format = 0;
    unsigned long count = 0, after = 0;
    unsigned char* data = nullptr;
    QString result;
    if (XGetWindowProperty(display, window, netWmName, 0, 1024, False, utf8, &type, &format, &count, &after,
                           &data) == Success &&
        data) {
        result = QString::fromUtf8(reinterpret_cast<const char*>(data), int(count));
        XFree(data);
        return result;
    }
    char* name = nullptr;
    if (XFetchName(display, window, &name) && name) {
        result = QString::fromLocal8Bit(name);
        XFree(name);
    }
    return result;
}

unsigned long XConnection::findWindow(const QString& titlePattern) const
{
    if (!display)
        return 0;
    const QRegularExpression pattern(QRegularExpression::anchoredPattern(titlePattern));
    Window root = 0, parent = 0;
    Window* children = nullptr;
    unsigned int count = 0;
    unsigned long found = 0;
    if (!XQueryTree(display, DefaultRootWindow(display), &root, &parent, &children, &count))
        return 0;
    for (unsigned int i = 0; i < count && !found; ++i) {
        XWindowAttributes attributes;
        if (!XGetWindowAttributes(display, children[i], &attributes) || attributes.map_state != IsViewable)
            continue;
        if (pattern.match(title(children[i])).hasMatch())
            found = children[i];
    }
    if (children)
        XFree(children);
    return found;
}

unsigned long XConnection::waitForWindow(const QString& titlePattern, int timeoutMs) const
{
    QDeadlineTimer deadline(timeoutMs);
    for (;;) {
        if (const unsigned long window = findWindow(titlePattern))
            return window;
        if (deadline.hasExpired())
            return 0;
        QThread::msleep(25);
    }
}

void XConnection::requestClose(unsigned long window) const
{
    XEvent event = {};
    event.xclient.type = ClientMessage;
    event.xclient.window = window;
    event.xclient.message_type = XInternAtom(display, "WM_PROTOCOLS", False);
    event.xclient.format = 32;
    event.xclient.data.l[0] = long(XInternAtom(display, "WM_DELETE_WINDOW", False));
    event.xclient.data.l[1] = CurrentTime;
    XSendEvent(display, window, False, NoEventMask, &event);
    XFlush(display);
}

bool XConnection::pressKey(unsigned long window, const QString& keysym) const
{
    XSetInputFocus(display, window, RevertToPointerRoot, CurrentTime);
    XSync(display, False);
    // xdotool sends the key through the XTEST extension, as a real keyboard would.
    QProcess xdotool;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("DISPLAY"), QString::fromLocal8Bit(displayName));
    xdotool.setProcessEnvironment(environment);
    xdotool.start(QStringLiteral("xdotool"), {QStringLiteral("key"), keysym});
    return xdotool.waitForFinished(5000) && xdotool.exitCode() == 0;
}

unsigned long XConnection::focusedWindow() const
{
    Window focus = 0;
    int revert = 0;
    XGetInputFocus(display, &focus, &revert);
    return focus;
}

void XConnection::focusRoot() const
{
    XSetInputFocus(display, PointerRoot, RevertToPointerRoot, CurrentTime);
    XSync(display, False);
}

QByteArray XConnection::rootProperty(const char* name) const
{
    const Atom property = XInternAtom(display, name, False);
    Atom type = None;
    int format = 0;
    unsigned long count = 0, after = 0;
    unsigned char* data = nullptr;
    QByteArray result;
    if (XGetWindowProperty(display, DefaultRootWindow(display), property, 0, 1 << 20, False, AnyPropertyType,
                           &type, &format, &count, &after, &data) == Success &&
        data) {
        if (type == XA_STRING && format == 8)
            result = QByteArray(reinterpret_cast<const char*>(data), int(count));
        XFree(data);
    }
    return result;
}

void XConnection::deleteRootProperty(const char* name) const
{
    XDeleteProperty(display, DefaultRootWindow(display), XInternAtom(display, name, False));
    XSync(display, False);
}

PrivateXServer::PrivateXServer() : server(std::make_unique<QProcess>())
{
    // Xvfb writes the display number it found free to standard output once it is ready.
    server->setProgram(QStringLiteral("Xvfb"));
    server->setArguments({QStringLiteral("-displayfd"), QStringLiteral("1"), QStringLiteral("-screen"),
                          QStringLiteral("0"), QStringLiteral("1024x768x24"), QStringLiteral("-nolisten"),
                          QStringLiteral("tcp")});
    server->setStandardErrorFile(QProcess::nullDevice());
    server->start();
    QDeadlineTimer deadline(15000);
    QByteArray output;
    while (!output.contains('\n') && !deadline.hasExpired()) {
        if (server->waitForReadyRead(int(qMax<qint64>(1, deadline.remainingTime()))))
            output += server->readAllStandardOutput();
        else if (server->state() == QProcess::NotRunning)
            return;
    }
    if (output.contains('\n'))
        name = ':' + output.trimmed();
}

PrivateXServer::~PrivateXServer()
{
    if (server->state() != QProcess::NotRunning) {
        server->terminate();
        if (!server->waitForFinished(5000))
            server->kill();
        server->waitForFinished(2000);
    }
}
