// The hotkeys file on disk: key forms, what is refused before it is read, and writes that leave
// the old file whole when the disk fails them. (The line model is held against the INI reader
// by the reader fuzz target, whose seeds hold the odd cases.)
#include "bindingfilter.h"
#include "hotkeysfile.h"
#include "keyforms.h"
#include "safefile.h"
#include "testfiles.h"
#include "zemcore.h"

#include <QProcess>
#include <QTemporaryDir>
#include <QtTest>

#include <csignal>
#include <sys/mount.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <sys/xattr.h>
#include <unistd.h>

class TestHotkeysFile : public QObject
{
    Q_OBJECT

private slots:
    void locations_data();
    void locations();
    void keyForms_data();
    void keyForms();
    void typedKeys_data();
    void typedKeys();
    void oneKey_data();
    void oneKey();
    void textRules_data();
    void textRules();
    void filter_data();
    void filter();
    void refused_data();
    void refused();
    void failedWriteKeepsFile();
    void writeKeepsModeAndLink();
    void refusedWrites_data();
    void refusedWrites();

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

void TestHotkeysFile::typedKeys_data()
{
    QTest::addColumn<QString>("typed");
    QTest::addColumn<QByteArray>("file"); // empty: no key
    QTest::newRow("modifiers in any order, any case") << "alt+ctrl+t" << QByteArray("Ctrl|Alt|t");
    QTest::newRow("the file form") << "None|F5" << QByteArray("None|F5");
    QTest::newRow("| after a separator is the bar key") << "Ctrl+Alt+|" << QByteArray("Ctrl|Alt|bar");
    QTest::newRow("+ after a separator is the plus key") << "ctrl++" << QByteArray("Ctrl|plus");
    QTest::newRow("a keypad keysym stays itself") << "Ctrl+KP_Equal" << QByteArray("Ctrl|KP_Equal");
    QTest::newRow("Qt's keypad spelling") << "Num+=" << QByteArray("None|KP_Equal");
    QTest::newRow("an X name in other letter case") << "Super+page_up" << QByteArray("Super|Prior");
    QTest::newRow("a Qt name") << "Win+PgDown" << QByteArray("Super|Next");
    QTest::newRow("a character") << "Alt+\u00f6" << QByteArray("Alt|odiaeresis");
    QTest::newRow("a modifier without a key") << "Ctrl+" << QByteArray();
    QTest::newRow("an unknown name") << "Ctrl+Bogus" << QByteArray();
    QTest::newRow("an unknown modifier") << "Hyper+x" << QByteArray();
}

void TestHotkeysFile::typedKeys()
{
    QFETCH(QString, typed);
    QFETCH(QByteArray, file);
    QCOMPARE(fileKeyFromTyped(typed), file);
}

void TestHotkeysFile::oneKey_data()
{
    QTest::addColumn<QByteArray>("a");
    QTest::addColumn<QByteArray>("b");
    QTest::addColumn<bool>("same");
    QTest::newRow("two names of one keysym")
        << QByteArray("Ctrl|Prior") << QByteArray("ctrl|Page_Up") << true;
    QTest::newRow("letter case, even where X tells keysyms apart")
        << QByteArray("None|Odiaeresis") << QByteArray("none|odiaeresis") << true;
    QTest::newRow("None| or not, aliases of modifiers") << QByteArray("F5") << QByteArray("None|f5") << true;
    QTest::newRow("modifier aliases in another order")
        << QByteArray("Mod4|Control|x") << QByteArray("Ctrl|Super|X") << true;
    QTest::newRow("the keypad's = and the other =")
        << QByteArray("Ctrl|Alt|KP_Equal") << QByteArray("Ctrl|Alt|equal") << false;
    QTest::newRow("two placeholders") << QByteArray("None|None0") << QByteArray("None|None1") << false;
    QTest::newRow("unreadable keys by their text")
        << QByteArray("Ctrl|NoSuchKey") << QByteArray("CTRL|nosuchkey") << true;
}

void TestHotkeysFile::oneKey()
{
    QFETCH(QByteArray, a);
    QFETCH(QByteArray, b);
    QFETCH(bool, same);
    QCOMPARE(keyIdentity(a) == keyIdentity(b), same);
}

void TestHotkeysFile::textRules_data()
{
    QTest::addColumn<QString>("command");
    QTest::addColumn<QString>("printed");
    QTest::addColumn<QString>("problem"); // the start of the reason it is refused; empty: accepted
    QTest::newRow("an ordinary command") << "xterm -e 'top\\n'"
                                         << "xterm -e 'top\\n'"
                                         << "";
    QTest::newRow("empty") << ""
                           << ""
                           << "The command is empty";
    QTest::newRow("blank") << " \t "
                           << " \\x09 "
                           << "The command is empty";
    QTest::newRow("an escape sequence") << "echo \x1b[2J"
                                        << "echo \\x1b[2J"
                                        << "The command holds the control character \\x1b";
    QTest::newRow("a bell and a delete") << "a\x07\x7f"
                                         << "a\\x07\\x7f"
                                         << "The command holds the control character \\x07";
    QTest::newRow("a C1 control and a line separator") << "a\u0085b\u2028"
                                                       << "a\\u{0085}b\\u{2028}"
                                                       << "The command holds the control character \\u{0085}";
}

void TestHotkeysFile::textRules()
{
    QFETCH(QString, command);
    QFETCH(QString, printed);
    QFETCH(QString, problem);
    QCOMPARE(printableText(command), printed);
    QVERIFY2(problem.isEmpty() ? commandProblem(command).isEmpty()
                               : commandProblem(command).startsWith(problem),
             qPrintable(commandProblem(command)));
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
    QTest::newRow("a key typed in another form") << "alt+ctrl+left" << QString("1");
    QTest::newRow("a key with a modifier is matched whole") << "ctrl+alt+l" << QString();
    QTest::newRow("a key that types no character too") << "left" << QString();
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
    if (filter.matches(BindingFilter::searchText("close a window", "ZEMWM_CLOSE", "Ctrl+Alt+Left"),
                       "Ctrl+Alt+Left"))
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
        QVERIFY(writeFile(path, "[ShortCutKeys]\n") && QFile::resize(path, largestHotkeysFile + 1));
    else if (!bytes.isEmpty())
        QVERIFY(writeFile(path, bytes));

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
    QVERIFY(writeFile(path, old));

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
    const QByteArray after = readFile(path);
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
    QVERIFY(writeFile(target, "old"));
    QVERIFY(QFile::setPermissions(target, QFile::ReadOwner | QFile::WriteOwner));
    QVERIFY(QFile::link(target, link));

    // An access list and an attribute of the user's own, which a save must not drop.
    if (QProcess::execute(QStringLiteral("setfacl"),
                          {QStringLiteral("-m"), QStringLiteral("u:65534:r"), target}) != 0 ||
        ::setxattr(QFile::encodeName(target).constData(), "user.zem", "kept", 4, 0) != 0)
        QSKIP("the file system here keeps no access lists or attributes of users");
    const QFile::Permissions mode = QFile::permissions(target); // the access list's mask in it

    QString reason;
    QVERIFY2(writeFileSafely(link, "new", &reason), qPrintable(reason));
    QVERIFY(QFileInfo(link).isSymLink());
    QCOMPARE(readFile(target), QByteArray("new"));
    QCOMPARE(QFile::permissions(target), mode);
    QProcess acl;
    acl.start(QStringLiteral("getfacl"), {QStringLiteral("-cn"), target});
    QVERIFY(acl.waitForFinished());
    QVERIFY(acl.readAllStandardOutput().contains("user:65534:r--"));
    char value[8] = {};
    QCOMPARE(::getxattr(QFile::encodeName(target).constData(), "user.zem", value, sizeof value), ssize_t(4));
    QCOMPARE(QByteArray(value), QByteArray("kept"));
}

void TestHotkeysFile::refusedWrites_data()
{
    QTest::addColumn<QString>("why");
    QTest::addColumn<QString>("reason"); // a part of the reason given
    QTest::newRow("its owner made it read-only, for root too") << "read-only"
                                                               << "read-only";
    QTest::newRow("a hard link elsewhere") << "linked"
                                           << "has 2 hard links";
    QTest::newRow("more than 16 MiB") << "large"
                                      << "larger than 16 MiB";
    QTest::newRow("root through another account's link") << "planted"
                                                         << "symbolic link of another account";
}

void TestHotkeysFile::refusedWrites()
{
    QFETCH(QString, why);
    QFETCH(QString, reason);
    const QString base = dir.filePath(why);
    QVERIFY(QDir().mkpath(base));
    QString path = base + QLatin1String("/keyshortcutrc");
    const QByteArray old = "[ShortCutKeys]\n";
    QVERIFY(writeFile(path, old));
    QByteArray bytes = "[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\n";
    if (why == QLatin1String("read-only")) {
        QVERIFY(QFile::setPermissions(path, QFile::ReadOwner | QFile::ReadGroup | QFile::ReadOther));
    } else if (why == QLatin1String("linked")) {
        QCOMPARE(::link(QFile::encodeName(path).constData(), QFile::encodeName(base + "/hard").constData()),
                 0);
    } else if (why == QLatin1String("large")) {
        bytes = QByteArray(int(largestHotkeysFile) + 1, 'x');
    } else {
        if (::geteuid() != 0)
            QSKIP("only root follows links as another account planted them");
        const QString link = base + QLatin1String("/planted");
        QVERIFY(QFile::link(path, link) && ::lchown(QFile::encodeName(link).constData(), 65534, 65534) == 0);
        path = link;
    }
    QString said;
    QVERIFY(!writeFileSafely(path, bytes, &said));
    QVERIFY2(said.contains(reason), qPrintable(said));
    QCOMPARE(readFile(base + QLatin1String("/keyshortcutrc")), old);
    QCOMPARE(QDir(base).entryList(QDir::Files | QDir::Hidden | QDir::System).size(),
             why == QLatin1String("linked") || why == QLatin1String("planted") ? 2 : 1);
}

QTEST_GUILESS_MAIN(TestHotkeysFile)
#include "tst_hotkeysfile.moc"
