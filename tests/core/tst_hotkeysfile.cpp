// The hotkeys file on disk: key forms, what is refused before it is read, and writes that leave
// the old file whole when the disk fails them. (The line model is held against the INI reader
// by the reader fuzz target, whose seeds hold the odd cases.)
#include "bindingfilter.h"
#include "hotkeysfile.h"
#include "safefile.h"
#include "keyforms.h"
#include "zemcore.h"

#include <QTemporaryDir>
#include <QtTest>

#include <csignal>
#include <sys/mount.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

namespace {

QByteArray readAll(const QString& path)
{
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

bool writeRaw(const QString& path, const QByteArray& bytes)
{
    QFile file(path);
    return file.open(QIODevice::WriteOnly) && file.write(bytes) == bytes.size();
}

} // namespace

class TestHotkeysFile : public QObject
{
    Q_OBJECT

private slots:
    void locations_data();
    void locations();
    void keyForms_data();
    void keyForms();
    void filter_data();
    void filter();
    void refused_data();
    void refused();
    void failedWriteKeepsFile();
    void writeKeepsModeAndLink();

private:
    QTemporaryDir dir;
};

void TestHotkeysFile::locations_data()
{
    QTest::addColumn<QByteArray>("zemUserDir");
    QTest::addColumn<QByteArray>("xdgConfigHome");
    QTest::addColumn<QString>("user"); // below the scratch directory, made on first use

    QTest::newRow("ZEM_USER_DIR first, trailing slashes dropped")
        << QByteArray("new/конфиг dir//") << QByteArray("x") << "new/конфиг dir/keyshortcutrc.s";
    QTest::newRow("then XDG_CONFIG_HOME") << QByteArray() << QByteArray("x") << "x/zem/keyshortcutrc.s";
    QTest::newRow("then the home directory")
        << QByteArray() << QByteArray() << "h/.config/zem/keyshortcutrc.s";
}

void TestHotkeysFile::locations()
{
    QFETCH(QByteArray, zemUserDir);
    QFETCH(QByteArray, xdgConfigHome);
    QFETCH(QString, user);

    const QByteArray base =
        QFile::encodeName(dir.filePath(QString::fromLatin1(QTest::currentDataTag()))) + '/';
    qputenv("ZEM_USER_DIR", zemUserDir.isEmpty() ? QByteArray() : base + zemUserDir);
    qputenv("XDG_CONFIG_HOME", xdgConfigHome.isEmpty() ? QByteArray() : base + xdgConfigHome);
    qputenv("HOME", base + "h");
    qputenv("ZEM_SYSTEM_DIR", "/opt/zem/etc/");
    qputenv("ZEM_SESSION_SUFFIX", ".s");
    QCOMPARE(userHotkeysFilePath(), QFile::decodeName(base) + user);
    QVERIFY(QFileInfo(QFileInfo(userHotkeysFilePath()).path()).isDir());
    QCOMPARE(systemHotkeysFilePath(), QStringLiteral("/opt/zem/etc/keyshortcutrc.s"));
}

void TestHotkeysFile::keyForms_data()
{
    QTest::addColumn<QString>("stored"); // what loading keeps
    QTest::addColumn<QString>("file");   // what saving writes
    // Modifiers in their order, Meta as Super, a single letter lower-cased, None| when there is no
    // modifier, X names for multimedia keys and the calculator, placeholders for no key.
    for (const auto& [stored, file] : {std::pair{"Ctrl+Alt+T", "Ctrl|Alt|t"},
                                       {"F5", "None|F5"},
                                       {"Meta+Ctrl+Alt+Shift+Del", "Ctrl|Alt|Shift|Super|Delete"},
                                       {"Volume Mute", "None|XF86AudioMute"},
                                       {"Calculator", "None|XF86Calculator"},
                                       {"None3", "None|None3"}})
        QTest::newRow(stored) << QString::fromLatin1(stored) << QString::fromLatin1(file);
}

void TestHotkeysFile::keyForms()
{
    QFETCH(QString, stored);
    QFETCH(QString, file);
    QCOMPARE(fileKeyOf(stored), file);
    if (!stored.startsWith(QLatin1String("None")))
        QCOMPARE(fromFileKey(file), stored);
    else
        QCOMPARE(fromFileKey(file), QString());
}

void TestHotkeysFile::filter_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("shown"); // which of the three rows below it shows

    QTest::newRow("action, any case") << "CLOSE a"
                                      << "1";
    QTest::newRow("function name") << "zemwm_res"
                                   << "3";
    QTest::newRow("command line") << "xterm -e"
                                  << "2";
    QTest::newRow("key as shown") << "alt+t"
                                  << "1";
    QTest::newRow("modifiers in another order") << "alt+ctrl+t"
                                                << "1";
    QTest::newRow("file form") << "Ctrl|Alt|t"
                               << "1";
    QTest::newRow("file form without modifier") << "None|F5"
                                                << "3";
    QTest::newRow("Super and Win are Meta") << "win+d"
                                            << "2";
    QTest::newRow("ExecCommand names no command") << "ExecCommand"
                                                  << "";
    QTest::newRow("empty shows all") << "  "
                                     << "123";
}

void TestHotkeysFile::filter()
{
    QFETCH(QString, text);
    QFETCH(QString, shown);
    const BindingFilter filter(text);
    QString matched;
    if (filter.matches(BindingFilter::searchText("close a window", "ZEMWM_CLOSE", "Ctrl+Alt+T"),
                       "Ctrl+Alt+T"))
        matched += '1';
    if (filter.matches(BindingFilter::searchText("xterm -e top", QString(), "Meta+D"), "Meta+D"))
        matched += '2';
    if (filter.matches(BindingFilter::searchText("restart", "ZEMWM_RESTART", "F5"), "F5"))
        matched += '3';
    QCOMPARE(matched, shown);
}

void TestHotkeysFile::refused_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("reason");

    QTest::newRow("a NUL byte") << QByteArray("[ShortCutKeys]\na=b\0c=d\n", 22) << "The file holds NUL bytes";
    QTest::newRow("larger than 16 MiB") << QByteArray() << "The file is larger than 16 MiB";
    QTest::newRow("a directory") << QByteArray() << "Not a regular file";
}

void TestHotkeysFile::refused()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QString, reason);

    const QString path = dir.filePath(QString::fromLatin1(QTest::currentDataTag()));
    if (reason.startsWith(QLatin1String("Not a")))
        QVERIFY(QDir().mkpath(path));
    else if (reason.contains(QLatin1String("16 MiB")))
        QVERIFY(writeRaw(path, "[ShortCutKeys]\n") && QFile::resize(path, largestHotkeysFile + 1));
    else if (!bytes.isEmpty())
        QVERIFY(writeRaw(path, bytes));

    QByteArray read;
    QString why;
    QVERIFY(!readHotkeysFile(path, &read, &why));
    QCOMPARE(why, reason);
    // Refused before being read whole.
    QVERIFY(read.size() <= bytes.size());
}

void TestHotkeysFile::failedWriteKeepsFile()
{
    const QString base = dir.filePath(QStringLiteral("full"));
    const QString path = base + QLatin1String("/keyshortcutrc");
    const QByteArray old = "[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\n";
    QVERIFY(QDir().mkpath(base));
    // 64 KiB of room, the old file in it; where no tmpfs can be mounted, a file size limit.
    const bool mounted = ::mount("tmpfs", QFile::encodeName(base).constData(), "tmpfs", 0, "size=64k") == 0;
    QVERIFY(writeRaw(path, old));

    // In a child, so that a file size limit touches nothing else.
    const pid_t child = ::fork();
    if (child == 0) {
        if (!mounted) {
            std::signal(SIGXFSZ, SIG_IGN);
            const rlimit limit{4096, 4096};
            ::setrlimit(RLIMIT_FSIZE, &limit);
        }
        QString reason;
        const bool written = writeFileSafely(path, QByteArray(64 * 1024, 'x'), &reason);
        ::_exit(written ? 1 : (reason.isEmpty() ? 2 : 0));
    }
    int status = 0;
    QCOMPARE(::waitpid(child, &status, 0), child);
    const QByteArray after = readAll(path);
    // No half-written file is left beside it.
    const QStringList files = QDir(base).entryList(QDir::Files | QDir::Hidden);
    if (mounted)
        ::umount2(QFile::encodeName(base).constData(), MNT_DETACH);
    QVERIFY2(WIFEXITED(status) && WEXITSTATUS(status) == 0, "the write reported success or gave no reason");
    QCOMPARE(after, old);
    QCOMPARE(files, QStringList{"keyshortcutrc"});
}

void TestHotkeysFile::writeKeepsModeAndLink()
{
    const QString target = dir.filePath(QStringLiteral("target"));
    const QString link = dir.filePath(QStringLiteral("link"));
    QVERIFY(writeRaw(target, "old"));
    QVERIFY(QFile::setPermissions(target, QFile::ReadOwner | QFile::WriteOwner));
    QVERIFY(QFile::link(target, link));

    QString reason;
    QVERIFY(writeFileSafely(link, "new", &reason));
    QVERIFY(QFileInfo(link).isSymLink());
    QCOMPARE(readAll(target), QByteArray("new"));
    QCOMPARE(QFile::permissions(target) & 0x7077, QFile::ReadOwner | QFile::WriteOwner);
}

QTEST_GUILESS_MAIN(TestHotkeysFile)
#include "tst_hotkeysfile.moc"
