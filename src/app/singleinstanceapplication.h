#pragma once

#include <QApplication>

#include <memory>

class QLocalServer;
class QLockFile;

// A QApplication of which only one instance runs per id. The first instance to take the id's
// lock serves a local socket; later instances find the lock held and can hand the first one a
// message, which arrives there through its event loop as messageReceived(). The lock of an
// instance that crashed is taken over. Lock and socket live in a directory private to the user,
// so another account can neither see nor block them; when no lock can be made, the program
// starts as if it were the first.
class SingleInstanceApplication : public QApplication
{
    Q_OBJECT
    Q_DISABLE_COPY(SingleInstanceApplication)

public:
    SingleInstanceApplication(const QString& id, int& argc, char** argv);
    ~SingleInstanceApplication() override;

    QString id() const { return appId; }
    // True when another instance holds this id.
    bool isRunning() const;
    // Delivers the message to the running instance; false when none took it in time.
    bool sendMessage(const QString& message, int timeoutMs);

signals:
    void messageReceived(const QString& message);

private:
    void acceptConnections();

    QString appId;
    QString serverName; // the socket's full path; empty without a private directory
    std::unique_ptr<QLockFile> lock;
    QLocalServer* server = nullptr;
    bool anotherRuns = false;
};
