#pragma once

#include <QByteArray>
#include <QProcess>
#include <QString>

#include <memory>

typedef struct _XDisplay Display;

// A test's own connection to an X server, for looking at the windows of the editor processes
// it starts and at the root window's properties, and for pressing keys in them.
class XConnection
{
public:
    explicit XConnection(const QByteArray& displayName = QByteArray());
    ~XConnection();
    XConnection(const XConnection&) = delete;
    XConnection& operator=(const XConnection&) = delete;

    bool isOpen() const { return display != nullptr; }
    Display* handle() const { return display; }
    QByteArray name() const { return displayName; }

    // The first viewable top-level window whose title matches the pattern exactly, or 0;
    // polled until the time-out.
    unsigned long waitForWindow(const QString& titlePattern, int timeoutMs = 10000) const;
    unsigned long findWindow(const QString& titlePattern) const;
    QString title(unsigned long window) const;

    // Asks the window to close, as a window manager's close button does.
    void requestClose(unsigned long window) const;
    // Gives the window the keyboard focus and presses the key (an X key-symbol name).
    bool pressKey(unsigned long window, const QString& keysym) const;
    unsigned long focusedWindow() const;
    void focusRoot() const;

    QByteArray rootProperty(const char* name) const;
    void deleteRootProperty(const char* name) const;

private:
    Display* display = nullptr;
    QByteArray displayName;
};

// An X server of the test's own (Xvfb on a free display number), for tests whose windows must
// not meet any other test's, or that need two displays.
class PrivateXServer
{
public:
    PrivateXServer();
    ~PrivateXServer();
    PrivateXServer(const PrivateXServer&) = delete;
    PrivateXServer& operator=(const PrivateXServer&) = delete;

    // ":N", or empty when the server did not start.
    QByteArray displayName() const { return name; }

private:
    std::unique_ptr<QProcess> server;
    QByteArray name;
};
