// The hotkeys file on disk: key forms, the line model against the INI reader, what is refused
// before it is read, and writes that leave the old file whole when the disk fails them.
#include "hotkeysdocument.h"
#include "hotkeysfile.h"
#include "hotkeyslines.h"

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
    void keyForms_data();
    void keyForms();
    void linesAgreeWithReader_data();
    void linesAgreeWithReader();
    void refused_data();
    void refused();
    void failedWriteKeepsFile_data();
    void failedWriteKeepsFile();
    void writeKeepsModeAndLink();

private:
    QTemporaryDir dir;
};

void TestHotkeysFile::keyForms_data()
{
    QTest::addColumn<QString>("stored"); // what loading keeps
    QTest::addColumn<QString>("file");   // what saving writes

    QTest::newRow("modifiers in order, one letter lower-cased") << "Ctrl+Alt+T" << "Ctrl|Alt|t";
    QTest::newRow("no modifier gets None") << "F5" << "None|F5";
    QTest::newRow("Meta is Super") << "Meta+Print" << "Super|Print";
    QTest::newRow("keypad, space, multimedia") << "Ctrl+Space" << "Ctrl|space";
    QTest::newRow("multimedia key") << "Volume Mute" << "None|XF86AudioMute";
    QTest::newRow("calculator") << "Calculator" << "None|XF86Calculator";
    QTest::newRow("all four modifiers") << "Meta+Ctrl+Alt+Shift+Del" << "Ctrl|Alt|Shift|Super|Delete";
    QTest::newRow("placeholder") << "None3" << "None|None3";
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

void TestHotkeysFile::linesAgreeWithReader_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<int>("entries");

    QTest::newRow("plain") << QByteArray("[ShortCutKeys]\na=b\nc=d\n") << 2;
    QTest::newRow("CRLF, lone CR, blanks around =")
        << QByteArray("[ShortCutKeys]\r\n a = b \r\nc=d\re\t=\tf\t") << 3;
    QTest::newRow("comments, lines without =, empty keys")
        << QByteArray("# top\n[ShortCutKeys]\n;x=y\n  #z=w\njunk\n=v\na=\n") << 1;
    QTest::newRow("a header continued on the next line, an unclosed one")
        << QByteArray("[\n  ShortCutKeys ] tail\na=b\n[ShortCutKeys\nc=d\n") << 1;
    QTest::newRow("duplicate keys in other case, the later counts")
        << QByteArray("[ShortCutKeys]\nAlt|x=1\nALT|X=2\n") << 1;
    QTest::newRow("two sections of the same name, other sections between")
        << QByteArray("[shortcutkeys]\na=1\n[Other]\nb=2\n[ShortCutKeys]\nc=3\n") << 2;
    QTest::newRow("byte-order mark, entries before any section")
        << QByteArray("\xEF\xBB\xBFz=0\n[ShortCutKeys]\na=\"q\"\n") << 1;
}

void TestHotkeysFile::linesAgreeWithReader()
{
    QFETCH(QByteArray, bytes);
    QFETCH(int, entries);

    HotkeysDocument document;
    QVERIFY(document.load(bytes));
    QMap<QByteArray, QByteArray> read;
    for (const HotkeysEntry& entry : document.entries())
        read.insert(foldedKey(entry.key), entry.value);

    const HotkeysLines lines(bytes);
    QMap<QByteArray, QByteArray> scanned;
    for (const HotkeysLine& line : lines.lines()) {
        if (line.kind == HotkeysLine::Entry && lines.isHotkeysSection(line.section))
            scanned.insert(foldedKey(line.key), line.value);
        // Every line's bytes begin at a line start and hold its key and value.
        QVERIFY(line.start == 0 || QByteArray("\r\n").contains(bytes.at(line.start - 1)) ||
                bytes.left(line.start) == "\xEF\xBB\xBF");
        QVERIFY(bytes.mid(line.start, line.end - line.start).contains(line.kind == HotkeysLine::Entry ? line.key : line.name));
    }
    QCOMPARE(scanned, read);
    QCOMPARE(read.size(), entries);
}

void TestHotkeysFile::refused_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QString>("reason");

    QTest::newRow("a NUL byte") << QByteArray("[ShortCutKeys]\na=b\0c=d\n", 22) << "The file holds NUL bytes";
    QTest::newRow("larger than 16 MiB") << QByteArray() << "The file is larger than 16 MiB";
    QTest::newRow("a directory") << QByteArray() << "Not a regular file";
    QTest::newRow("missing") << QByteArray() << "No such file or directory";
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

void TestHotkeysFile::failedWriteKeepsFile_data()
{
    QTest::addColumn<QString>("failure");
    QTest::newRow("a full filesystem") << "full";
    QTest::newRow("a file size limit") << "limit";
    QTest::newRow("the path is a directory") << "directory";
}

void TestHotkeysFile::failedWriteKeepsFile()
{
    QFETCH(QString, failure);

    QString base = dir.filePath(failure);
    QVERIFY(QDir().mkpath(base));
    const QByteArray old = "[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\n";
    const QByteArray large(64 * 1024, 'x');
    QString path = base + QLatin1String("/keyshortcutrc");

    if (failure == QLatin1String("full")) {
        // 64 KiB of room, and the old file in it.
        if (::mount("tmpfs", QFile::encodeName(base).constData(), "tmpfs", 0, "size=64k") != 0)
            QSKIP("No tmpfs can be mounted here; the file size limit stands in for a full disk.");
    }
    if (failure == QLatin1String("directory"))
        QVERIFY(QDir().mkpath(path));
    else
        QVERIFY(writeRaw(path, old));

    // Run in a child, so that a file size limit touches nothing else.
    const pid_t child = ::fork();
    if (child == 0) {
        if (failure == QLatin1String("limit")) {
            std::signal(SIGXFSZ, SIG_IGN);
            const rlimit limit{4096, 4096};
            ::setrlimit(RLIMIT_FSIZE, &limit);
        }
        QString reason;
        const bool written = writeFileSafely(path, large, &reason);
        ::_exit(written ? 1 : (reason.isEmpty() ? 2 : 0));
    }
    int status = 0;
    QCOMPARE(::waitpid(child, &status, 0), child);
    const bool refused = WIFEXITED(status) && WEXITSTATUS(status) == 0;
    const QByteArray after = readAll(path);
    // No half-written file is left beside it.
    const int files = QDir(base).entryList(QDir::Files | QDir::Hidden).size();
    if (failure == QLatin1String("full"))
        ::umount2(QFile::encodeName(base).constData(), MNT_DETACH);

    QVERIFY2(refused, "the write reported success or gave no reason");
    if (failure == QLatin1String("directory")) {
        QCOMPARE(files, 0);
    } else {
        QCOMPARE(after, old);
        QCOMPARE(files, 1);
    }
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
