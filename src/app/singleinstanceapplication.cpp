#include "singleinstanceapplication.h"

#include <QCryptographicHash>
#include <QDataStream>
#include <QDeadlineTimer>
#include <QDir>
#include <QLocalServer>
#include <QLocalSocket>
#include <QLockFile>
#include <QPointer>
#include <QThread>

#include <unistd.h>

namespace {

// A message on the wire: its UTF-8 length as a 32-bit big-endian number, then the bytes.
// The receiver answers one byte once it has the whole message.
constexpr char acknowledgement = '\x06';
constexpr quint32 longestMessage = 1 << 20;

QString serverNameFor(const QString& id)
{
    // The id may hold anything DISPLAY holds ("/" included); a digest makes it a safe name.
    const QByteArray digest =
        QCryptographicHash::hash(id.toUtf8(), QCryptographicHash::Sha1).toHex().left(16);
    return QStringLiteral("zem-admin-hotkeys-%1-%2")
        .arg(QString::number(::getuid()), QString::fromLatin1(digest));
}

} // namespace

SingleInstanceApplication::SingleInstanceApplication(const QString& id, int& argc, char** argv)
    : QApplication(argc, argv), appId(id), serverName(serverNameFor(id)),
      lock(std::make_unique<QLockFile>(QDir::temp().filePath(serverName + QLatin1String(".lock"))))
{
    // Stale only when its owner is gone, never by age: an editor may stay open for weeks.
    lock->setStaleLockTime(0);
    if (!lock->tryLock(0))
        return;

    server = new QLocalServer(this);
    server->setSocketOptions(QLocalServer::UserAccessOption);
    // We hold the lock, so a socket left under this name belongs to a crashed instance.
    QLocalServer::removeServer(serverName);
    if (!server->listen(serverName)) {
        qWarning("zem-admin-hotkeys: cannot listen for other instances: %s",
                 qPrintable(server->errorString()));
        return;
    }
    connect(server, &QLocalServer::newConnection, this, &SingleInstanceApplication::acceptConnections);
}

SingleInstanceApplication::~SingleInstanceApplication()
{
    if (server)
        server->close();
}

bool SingleInstanceApplication::isRunning() const
{
    return !lock->isLocked();
}

bool SingleInstanceApplication::sendMessage(const QString& message, int timeoutMs)
{
    if (!isRunning())
        return false;

    QDeadlineTimer deadline(timeoutMs);
    QLocalSocket socket;
    // The running instance may hold the lock a moment before it listens: keep trying.
    for (;;) {
        socket.connectToServer(serverName);
        if (socket.waitForConnected(int(qMax<qint64>(0, deadline.remainingTime()))))
            break;
        if (deadline.hasExpired())
            return false;
        QThread::msleep(20);
    }

    const QByteArray payload = message.toUtf8();
    QByteArray frame;
    QDataStream(&frame, QIODevice::WriteOnly) << quint32(payload.size());
    frame += payload;
    socket.write(frame);
    while (socket.bytesToWrite() > 0) {
        if (!socket.waitForBytesWritten(int(qMax<qint64>(1, deadline.remainingTime()))))
            return false;
    }
    while (socket.bytesAvailable() < 1) {
        if (deadline.hasExpired() || !socket.waitForReadyRead(int(qMax<qint64>(1, deadline.remainingTime()))))
            return false;
    }
    char answer = 0;
    socket.getChar(&answer);
    socket.disconnectFromServer();
    return answer == acknowledgement;
}

void SingleInstanceApplication::acceptConnections()
{
    while (QLocalSocket* socket = server->nextPendingConnection()) {
        connect(socket, &QLocalSocket::disconnected, socket, &QObject::deleteLater);
        connect(socket, &QLocalSocket::readyRead, this, [this, socket] {
            if (socket->bytesAvailable() < qint64(sizeof(quint32)))
                return;
            quint32 length = 0;
            QDataStream(socket->peek(sizeof(quint32))) >> length;
            if (length > longestMessage) {
                socket->abort();
                return;
            }
            if (socket->bytesAvailable() < qint64(sizeof(quint32) + length))
                return;
            socket->read(sizeof(quint32));
            const QString message = QString::fromUtf8(socket->read(length));
            socket->putChar(acknowledgement);
            socket->flush();
            // A slot may open a modal dialog; the socket must not be read again meanwhile.
            disconnect(socket, &QLocalSocket::readyRead, this, nullptr);
            emit messageReceived(message);
        });
    }
}
