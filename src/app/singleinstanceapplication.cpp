#include "singleinstanceapplication.h"

#include <QCryptographicHash>
#include <QDataStream>
#include <QDeadlineTimer>
#include <QFile>
#include <QLocalServer>
#include <QLocalSocket>
#include <QLockFile>
#include <QPointer>
#include <QThread>

#include <QSysInfo>

#include <cerrno>
#include <csignal>
#include <cstdio>
#include <sys/socket.h>
#include <sys/stat.h>
#include <sys/un.h>
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
    return QStringLiteral("zem-admin-hotkeys-%1").arg(QString::fromLatin1(digest));
}

// A directory that only this user can use, for the lock and the socket: $XDG_RUNTIME_DIR, else
// one of the user's own in the temporary directory. A path that another account owns, that
// others may write to, or that would make the socket's name too long is passed over.
QString privateDirectory(const QString& name)
{
    const uid_t uid = ::getuid();
    const auto usable = [&](const QByteArray& path) {
        struct stat info;
        // A socket path longer than sockaddr_un allows would be cut.
        const bool fits =
            path.size() + 1 + QFile::encodeName(name).size() + 5 < int(sizeof(sockaddr_un::sun_path));
        return fits && ::lstat(path.constData(), &info) == 0 && S_ISDIR(info.st_mode) && info.st_uid == uid &&
               (info.st_mode & 077) == 0;
    };
    const QByteArray runtime = qgetenv("XDG_RUNTIME_DIR");
    if (!runtime.isEmpty() && usable(runtime))
        return QFile::decodeName(runtime);
    for (const QByteArray& base : {qgetenv("TMPDIR"), QByteArray("/tmp")}) {
        if (base.isEmpty())
            continue;
        const QByteArray dir = base + "/zem-admin-hotkeys-" + QByteArray::number(uid);
        ::mkdir(dir.constData(), 0700);
        if (usable(dir))
            return QFile::decodeName(dir);
    }
    return QString();
}

} // namespace

SingleInstanceApplication::SingleInstanceApplication(const QString& id, int& argc, char** argv)
    : QApplication(argc, argv), appId(id)
{
    const QString name = serverNameFor(id);
    const QString dir = privateDirectory(name);
    if (dir.isEmpty()) {
        std::fprintf(stderr,
                     "zem-admin-hotkeys: no private directory for the instance lock; starting anyway\n");
        return;
    }
    serverName = dir + QLatin1Char('/') + name;
    lock = std::make_unique<QLockFile>(serverName + QLatin1String(".lock"));
    // Stale only when its owner is gone, never by age: an editor may stay open for weeks.
    lock->setStaleLockTime(0);
    if (!lock->tryLock(0)) {
        // Only a live editor of this machine holding the lock makes this start a second one; a
        // lock that cannot be made, or a file in its place that names no such editor, must not
        // keep the user from the editor.
        qint64 pid = 0;
        QString host;
        QString application;
        anotherRuns = lock->error() == QLockFile::LockFailedError &&
                      lock->getLockInfo(&pid, &host, &application) && host == QSysInfo::machineHostName() &&
                      pid > 0 && (::kill(pid_t(pid), 0) == 0 || errno == EPERM);
        if (!anotherRuns)
            std::fprintf(stderr, "zem-admin-hotkeys: cannot make the instance lock %s; starting anyway\n",
                         QFile::encodeName(serverName).constData());
        return;
    }

    server = new QLocalServer(this);
    server->setSocketOptions(QLocalServer::UserAccessOption);
    // We hold the lock, so a socket left under this name belongs to a crashed instance.
    QLocalServer::removeServer(serverName);
    if (!server->listen(serverName)) {
        std::fprintf(stderr, "zem-admin-hotkeys: cannot listen for other instances: %s\n",
                     server->errorString().toLocal8Bit().constData());
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
    return anotherRuns;
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
