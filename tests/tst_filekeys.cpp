// Key conversions between Qt, the X key-string form and the hotkeys file, and the INI document
// every reader and writer of the file goes through.
#include "hotkeysdocument.h"
#include "hotkeysfile.h"
#include "testenvironment.h"
#include "zemkeyserver.h"

#include <QApplication>
#include <QKeySequence>
#include <QTemporaryDir>
#include <QtTest>

class TestFileKeys : public QObject
{
    Q_OBJECT

private slots:
    void toFileKey_data();
    void toFileKey();
    void fromFileKey_data();
    void fromFileKey();
    void qtKeyRoundTrip_data();
    void qtKeyRoundTrip();
    void keyStringXToQt_data();
    void keyStringXToQt();
    void unnamedKeys();

    void loadDocument_data();
    void loadDocument();
    void unreadablePaths();
    void writtenForm();
    void nonAsciiTextAndPaths();
    void defaultSystemFile();

private:
    QTemporaryDir scratch;
};

void TestFileKeys::toFileKey_data()
{
    QTest::addColumn<QString>("keyString");
    QTest::addColumn<QString>("fileKey");

    QTest::newRow("alt-x lower-cased") << "Alt+X"
                                       << "Alt|x";
    QTest::newRow("plain letter gets None") << "Q"
                                            << "None|q";
    QTest::newRow("function key keeps case") << "F5"
                                             << "None|F5";
    QTest::newRow("three modifiers") << "Ctrl+Alt+T"
                                     << "Ctrl|Alt|t";
    QTest::newRow("super with named key") << "Super+Print"
                                          << "Super|Print";
    QTest::newRow("shift tab") << "Shift+Tab"
                               << "Shift|Tab";
    QTest::newRow("multimedia key") << "XF86AudioMute"
                                    << "None|XF86AudioMute";
    QTest::newRow("space keeps its name") << "Ctrl+space"
                                          << "Ctrl|space";
    QTest::newRow("placeholder") << "None0"
                                 << "None|None0";
    QTest::newRow("placeholder twelve") << "None12"
                                        << "None|None12";
    QTest::newRow("non-ascii letter lower-cased")
        << QString::fromUtf8("Ctrl+Ä") << QString::fromUtf8("Ctrl|ä");
    QTest::newRow("multi-letter key not lower-cased") << "Alt+Escape"
                                                      << "Alt|Escape";
    QTest::newRow("all four modifiers") << "Ctrl+Alt+Shift+Super+Delete"
                                        << "Ctrl|Alt|Shift|Super|Delete";
}

void TestFileKeys::toFileKey()
{
    QFETCH(QString, keyString);
    QFETCH(QString, fileKey);
    QCOMPARE(::toFileKey(keyString), fileKey);
}

void TestFileKeys::fromFileKey_data()
{
    QTest::addColumn<QString>("fileKey");
    QTest::addColumn<QString>("storedKey");

    QTest::newRow("modifiers and letter") << "Ctrl|Alt|t"
                                          << "Ctrl+Alt+T";
    QTest::newRow("None| dropped") << "None|Q"
                                   << "Q";
    QTest::newRow("bare function key") << "F5"
                                       << "F5";
    QTest::newRow("None|F5 same as F5") << "None|F5"
                                        << "F5";
    QTest::newRow("placeholder None|None0") << "None|None0"
                                            << "";
    QTest::newRow("placeholder None0") << "None0"
                                       << "";
    QTest::newRow("placeholder None|None12") << "None|None12"
                                             << "";
    QTest::newRow("quoted key") << "\"Ctrl|a\""
                                << "Ctrl+A";
    QTest::newRow("upper-case modifiers") << "ALT|F5"
                                          << "Alt+F5";
    QTest::newRow("upper-case letter") << "Alt|X"
                                       << "Alt+X";
    QTest::newRow("lower-case function key") << "alt|f5"
                                             << "Alt+F5";
    QTest::newRow("calculator") << "None|XF86Calculator"
                                << "Calculator";
    QTest::newRow("calculator without None") << "XF86Calculator"
                                             << "Calculator";
    QTest::newRow("super is meta") << "Super|e"
                                   << "Meta+E";
    QTest::newRow("alias Mod4 and Control") << "Mod4|Control|z"
                                            << "Meta+Ctrl+Z";
    QTest::newRow("alias Win and Mod1") << "Win|Mod1|Delete"
                                        << "Meta+Alt+Del";
    QTest::newRow("keypad digit") << "None|KP_1"
                                  << "Num+1";
    QTest::newRow("space") << "Ctrl|space"
                           << "Ctrl+Space";
    QTest::newRow("shift tab") << "Shift|Tab"
                               << "Shift+Tab";
    QTest::newRow("unknown key kept as text") << "Ctrl|NoSuchKey"
                                              << "Ctrl+NoSuchKey";
    QTest::newRow("unknown modifier kept as text") << "Hyper|x"
                                                   << "Hyper+x";
    QTest::newRow("every None+ removed") << "None|None|F2"
                                         << "F2";
}

void TestFileKeys::fromFileKey()
{
    QFETCH(QString, fileKey);
    QFETCH(QString, storedKey);
    QCOMPARE(::fromFileKey(fileKey), storedKey);
}

void TestFileKeys::qtKeyRoundTrip_data()
{
    QTest::addColumn<int>("keyQt");
    QTest::addColumn<QString>("fileKey");

    QTest::newRow("letter") << int(Qt::CTRL | Qt::Key_T) << "Ctrl|t";
    QTest::newRow("digit") << int(Qt::ALT | Qt::Key_7) << "Alt|7";
    QTest::newRow("comma") << int(Qt::CTRL | Qt::Key_Comma) << "Ctrl|comma";
    QTest::newRow("plus") << int(Qt::ALT | Qt::Key_Plus) << "Alt|plus";
    QTest::newRow("slash") << int(Qt::META | Qt::Key_Slash) << "Super|slash";
    QTest::newRow("F1") << int(Qt::Key_F1) << "None|F1";
    QTest::newRow("F12 with shift") << int(Qt::SHIFT | Qt::Key_F12) << "Shift|F12";
    QTest::newRow("Print") << int(Qt::Key_Print) << "None|Print";
    QTest::newRow("Escape") << int(Qt::CTRL | Qt::Key_Escape) << "Ctrl|Escape";
    QTest::newRow("space") << int(Qt::META | Qt::Key_Space) << "Super|space";
    QTest::newRow("keypad digit") << int(Qt::KeypadModifier | Qt::Key_5) << "None|KP_5";
    QTest::newRow("keypad enter") << int(Qt::CTRL | Qt::KeypadModifier | Qt::Key_Enter) << "Ctrl|KP_Enter";
    QTest::newRow("keypad plus") << int(Qt::KeypadModifier | Qt::Key_Plus) << "None|KP_Add";
    QTest::newRow("volume mute") << int(Qt::Key_VolumeMute) << "None|XF86AudioMute";
    QTest::newRow("media play") << int(Qt::Key_MediaPlay) << "None|XF86AudioPlay";
    QTest::newRow("super letter") << int(Qt::META | Qt::Key_L) << "Super|l";
    QTest::newRow("shift tab") << int(Qt::SHIFT | Qt::Key_Tab) << "Shift|Tab";
    QTest::newRow("calculator") << int(Qt::Key_Calculator) << "None|XF86Calculator";
    QTest::newRow("arrow") << int(Qt::CTRL | Qt::ALT | Qt::Key_Left) << "Ctrl|Alt|Left";

    // Every combination of the four modifiers, written in the fixed order.
    const struct
    {
        int bit;
        const char* name;
    } modifiers[] = {{Qt::CTRL, "Ctrl"}, {Qt::ALT, "Alt"}, {Qt::SHIFT, "Shift"}, {Qt::META, "Super"}};
    for (int mask = 0; mask < 16; ++mask) {
        int key = Qt::Key_Delete;
        QStringList names;
        for (int i = 0; i < 4; ++i) {
            if (mask & (1 << i)) {
                key |= modifiers[i].bit;
                names << QLatin1String(modifiers[i].name);
            }
        }
        const QString fileKey = names.isEmpty() ? QStringLiteral("None|Delete")
                                                : names.join(QLatin1Char('|')) + QLatin1String("|Delete");
        QTest::addRow("modifiers %d", mask) << key << fileKey;
    }
}

void TestFileKeys::qtKeyRoundTrip()
{
    QFETCH(int, keyQt);
    QFETCH(QString, fileKey);

    const QString written = ::toFileKey(ZemKeyServer::KeyQtToKeyStringX(keyQt));
    QCOMPARE(written, fileKey);
    const QString stored = ::fromFileKey(written);
    QCOMPARE(QKeySequence::fromString(stored, QKeySequence::PortableText), QKeySequence(keyQt));
}

void TestFileKeys::keyStringXToQt_data()
{
    QTest::addColumn<QString>("keyString");
    QTest::addColumn<QString>("portable");

    QTest::newRow("lower-case modifiers") << "ctrl+alt+t"
                                          << "Ctrl+Alt+T";
    QTest::newRow("upper-case modifiers") << "CTRL+SHIFT+F3"
                                          << "Ctrl+Shift+F3";
    QTest::newRow("meta alias") << "Meta+x"
                                << "Meta+X";
    QTest::newRow("multimedia") << "XF86AudioRaiseVolume"
                                << "Volume Up";
    QTest::newRow("empty") << ""
                           << "";
    QTest::newRow("unknown key") << "Ctrl+Frobnicate"
                                 << "";
    QTest::newRow("unknown modifier") << "Hyper+x"
                                      << "";
    QTest::newRow("modifier without key") << "Ctrl+"
                                          << "";
}

void TestFileKeys::keyStringXToQt()
{
    QFETCH(QString, keyString);
    QFETCH(QString, portable);
    QCOMPARE(ZemKeyServer::KeyStringXToQt(keyString), portable);
}

void TestFileKeys::unnamedKeys()
{
    QVERIFY(ZemKeyServer::KeyQtToKeyStringX(0).isEmpty());
    QVERIFY(ZemKeyServer::KeyQtToKeyStringX(Qt::CTRL).isEmpty());
    QVERIFY(ZemKeyServer::KeyQtToKeyStringX(Qt::Key_unknown).isEmpty());
    // A letter outside Latin-1 has no key-symbol name of its own here.
    QVERIFY(ZemKeyServer::KeyQtToKeyStringX(Qt::CTRL | 0x416).isEmpty());
}

void TestFileKeys::loadDocument_data()
{
    QTest::addColumn<QByteArray>("content");
    QTest::addColumn<bool>("loads");
    QTest::addColumn<QStringList>("entries"); // key=value, in the order the document yields them

    QTest::newRow("section only") << QByteArray("[ShortCutKeys]\n") << true << QStringList();
    QTest::newRow("empty file refused") << QByteArray() << false << QStringList();
    QTest::newRow("other section refused")
        << QByteArray("[Other]\nAlt|x=ZEMWM_CLOSE\n") << false << QStringList();
    QTest::newRow("ordinary entries sorted by key")
        << QByteArray("[ShortCutKeys]\nNone|F5=ZEMWM_LOCK\nAlt|x=\"xterm\"\n") << true
        << QStringList{"Alt|x=\"xterm\"", "None|F5=ZEMWM_LOCK"};
    QTest::newRow("byte-order mark skipped") << QByteArray("\xEF\xBB\xBF[ShortCutKeys]\nAlt|x=ZEMWM_CLOSE\n")
                                             << true << QStringList{"Alt|x=ZEMWM_CLOSE"};
    QTest::newRow("section name in other case")
        << QByteArray("[shortcutkeys]\nAlt|x=ZEMWM_CLOSE\n") << true << QStringList{"Alt|x=ZEMWM_CLOSE"};
    QTest::newRow("same key in other case: later line counts, first place kept")
        << QByteArray("[ShortCutKeys]\nalt|X=ZEMWM_CLOSE\nBeta=x\nALT|x=ZEMWM_KILL\n") << true
        << QStringList{"alt|X=ZEMWM_KILL", "Beta=x"};
    QTest::newRow("other sections and comments ignored")
        << QByteArray("; comment\n[Misc]\na=b\n[ShortCutKeys]\n# note\nAlt|x = ZEMWM_CLOSE\n[Tail]\nc=d\n")
        << true << QStringList{"Alt|x=ZEMWM_CLOSE"};
    QTest::newRow("ascii case-insensitive order")
        << QByteArray("[ShortCutKeys]\nb=1\nA=2\nc=3\n") << true << QStringList{"A=2", "b=1", "c=3"};
    QTest::newRow("line without value")
        << QByteArray("[ShortCutKeys]\nAlt|x=\n") << true << QStringList{"Alt|x="};
    QTest::newRow("crlf line ends") << QByteArray("[ShortCutKeys]\r\nAlt|x=ZEMWM_CLOSE\r\n") << true
                                    << QStringList{"Alt|x=ZEMWM_CLOSE"};
}

void TestFileKeys::loadDocument()
{
    QFETCH(QByteArray, content);
    QFETCH(bool, loads);
    QFETCH(QStringList, entries);

    const QString path = scratch.filePath(QStringLiteral("load-%1").arg(QTest::currentDataTag()));
    QVERIFY(writeFile(path, content));
    HotkeysDocument document;
    QCOMPARE(document.load(path), loads);
    QStringList seen;
    for (const HotkeysEntry& entry : document.entries())
        seen << entry.key + QLatin1Char('=') + entry.value;
    QCOMPARE(seen, entries);
}

void TestFileKeys::unreadablePaths()
{
    HotkeysDocument document;
    QVERIFY(!document.load(QString()));
    QVERIFY(!document.load(scratch.filePath(QStringLiteral("no-such-file"))));
    QVERIFY(!document.load(scratch.path()));              // a directory
    QVERIFY(!document.load(QStringLiteral("/dev/zero"))); // would never end
    const QString pipe = scratch.filePath(QStringLiteral("pipe"));
    QCOMPARE(QProcess::execute(QStringLiteral("mkfifo"), {pipe}), 0);
    QVERIFY(!document.load(pipe)); // would wait for a writer
    QVERIFY(document.entries().isEmpty());
}

void TestFileKeys::writtenForm()
{
    HotkeysDocument document;
    QCOMPARE(document.toBytes(), QByteArray("[ShortCutKeys]\n"));

    QVERIFY(document.setValue(QStringLiteral("Ctrl|Alt|t"), QStringLiteral("\"x-terminal-emulator\"")));
    QVERIFY(document.setValue(QStringLiteral("None|F5"), QStringLiteral("ZEMWM_LOCK")));
    QVERIFY(document.setValue(QStringLiteral("Alt|x"), QStringLiteral("ZEMWM_CLOSE")));
    // Setting a key again in another case replaces the value where the key already stands.
    QVERIFY(document.setValue(QStringLiteral("ctrl|alt|T"), QStringLiteral("\"Disable\"")));
    QCOMPARE(document.toBytes(), QByteArray("[ShortCutKeys]\n"
                                            "Ctrl|Alt|t=\"Disable\"\n"
                                            "None|F5=ZEMWM_LOCK\n"
                                            "Alt|x=ZEMWM_CLOSE\n"));
}

void TestFileKeys::nonAsciiTextAndPaths()
{
    const QString path = scratch.filePath(QString::fromUtf8("dir with blanks/ключи файл"));
    const QByteArray content = QString::fromUtf8("[ShortCutKeys]\nAlt|x=\"echo Grüße ключ\"\n").toUtf8();
    QVERIFY(writeFile(path, content));

    HotkeysDocument document;
    QVERIFY(document.load(path));
    const QVector<HotkeysEntry> entries = document.entries();
    QCOMPARE(entries.size(), 1);
    QCOMPARE(entries.first().value, QString::fromUtf8("\"echo Grüße ключ\""));
    QCOMPARE(document.toBytes(), content);
}

void TestFileKeys::defaultSystemFile()
{
    HotkeysDocument document;
    QVERIFY(document.load(QStringLiteral(ZEM_PROJECT_DATA_DIR "/keyshortcutrc")));
    const QVector<HotkeysEntry> entries = document.entries();
    QVERIFY(entries.size() >= 20);
    QSet<QString> keys;
    for (const HotkeysEntry& entry : entries) {
        // Every key reads as a real key combination and is written back the same way.
        const QString stored = ::fromFileKey(entry.key);
        const QKeySequence sequence = QKeySequence::fromString(stored, QKeySequence::PortableText);
        QVERIFY2(sequence.count() == 1 && sequence.toString(QKeySequence::PortableText) == stored,
                 qPrintable(entry.key));
        QCOMPARE(::toFileKey(ZemKeyServer::KeyQtToKeyStringX(sequence[0])), entry.key);
        QVERIFY2(!keys.contains(stored.toLower()), qPrintable(entry.key));
        keys.insert(stored.toLower());
        const bool function = entry.value.startsWith(QLatin1String("ZEMWM_"));
        const bool command = entry.value.size() > 2 && entry.value.startsWith(QLatin1Char('"')) &&
                             entry.value.endsWith(QLatin1Char('"'));
        QVERIFY2(function || command, qPrintable(entry.value));
    }
}

ZEM_TEST_MAIN(TestFileKeys)
#include "tst_filekeys.moc"
