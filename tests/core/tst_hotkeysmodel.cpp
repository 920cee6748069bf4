// The rules of the hotkeys file, on the core alone: merging the user's file over the system
// file, writing back what nobody edited byte for byte, and finding who holds a key.
#include "hotkeysmodel.h"

#include <QtTest>

namespace {

QString nameOf(const Binding* row)
{
    return row->isCommand() ? QLatin1String("cmd:") + row->command
                            : HotkeysModel::functionNames().at(row->function);
}

// Rows in order, "FUNCTION=key@source" or "cmd:command=key@source", keyless function rows left
// out; then the disabled keys, "off:key". A placeholder stands for no key.
QStringList listing(const HotkeysModel& model)
{
    QStringList rows;
    for (const Binding* row : model.rows()) {
        if (row->isCommand() || !row->key.isEmpty())
            rows << nameOf(row) + QLatin1Char('=') +
                        (row->key.startsWith(QLatin1String("None")) ? QString() : row->key) +
                        (row->source == BindingSource::User ? QLatin1String("@user")
                                                            : QLatin1String("@system"));
    }
    for (const QString& key : model.disabledKeys())
        rows << QLatin1String("off:") + key;
    return rows;
}

BindingId rowOf(const HotkeysModel& model, const QString& name)
{
    for (const Binding* row : model.rows()) {
        if (nameOf(row) == name)
            return row->id;
    }
    return 0;
}

} // namespace

class TestHotkeysModel : public QObject
{
    Q_OBJECT

private slots:
    void merge_data();
    void merge();
    void writeBack_data();
    void writeBack();
    void holder_data();
    void holder();
};

void TestHotkeysModel::merge_data()
{
    QTest::addColumn<QByteArray>("user");
    QTest::addColumn<QByteArray>("system");
    QTest::addColumn<QStringList>("rows");

    QTest::newRow("system bindings under an empty user file")
        << QByteArray() << QByteArray("Alt|F4=ZEMWM_CLOSE\nCtrl|Alt|t=\"xterm\"\n")
        << QStringList{"ZEMWM_CLOSE=Alt+F4@system", "cmd:xterm=Ctrl+Alt+T@system"};
    QTest::newRow("the user's key wins; the system's binding of it is shown nowhere")
        << QByteArray("Alt|F4=ZEMWM_KILL\n") << QByteArray("Alt|F4=ZEMWM_CLOSE\n")
        << QStringList{"ZEMWM_KILL=Alt+F4@user"};
    QTest::newRow("further rows follow the first, the one read last nearest")
        << QByteArray("Alt|F5=ZEMWM_CLOSE\nAlt|F6=ZEMWM_CLOSE\n") << QByteArray("Alt|F4=ZEMWM_CLOSE\n")
        << QStringList{"ZEMWM_CLOSE=Alt+F5@user", "ZEMWM_CLOSE=Alt+F4@system", "ZEMWM_CLOSE=Alt+F6@user"};
    QTest::newRow("Disable switches a system key off, listed once")
        << QByteArray("Alt|F4=\"Disable\"\nCtrl|q=Disable\n")
        << QByteArray("Alt|F4=ZEMWM_CLOSE\nCtrl|q=\"Disable\"\n") << QStringList{"off:Alt+F4", "off:Ctrl+Q"};
    // In key order: "None1" sorts before "None|None0".
    QTest::newRow("placeholders read as keyless commands")
        << QByteArray("None|None0=\"xterm\"\nNone1=\"xclock\"\n") << QByteArray()
        << QStringList{"cmd:xclock=@user", "cmd:xterm=@user"};
    QTest::newRow("keys differing by case or None| are one key, the first in key order wins")
        << QByteArray("None|F5=ZEMWM_RESTART\nF5=ZEMWM_LOCK\nAlt|x=ZEMWM_CLOSE\n")
        << QByteArray("ALT|X=ZEMWM_KILL\n") << QStringList{"ZEMWM_CLOSE=Alt+X@user", "ZEMWM_LOCK=F5@user"};
    QTest::newRow("an unknown function binds nothing and leaves its key free")
        << QByteArray("Alt|u=ZEMWM_NO_SUCH_THING\n") << QByteArray("Alt|u=ZEMWM_CLOSE\n")
        << QStringList{"ZEMWM_CLOSE=Alt+U@system"};
    QTest::newRow("an unclosed quote loses no character")
        << QByteArray("Super|t=\"xterm\n") << QByteArray() << QStringList{"cmd:\"xterm=Meta+T@user"};
    QTest::newRow("an unreadable key is kept as read")
        << QByteArray("Ctrl|NoSuchKey=ZEMWM_CLOSE\n") << QByteArray()
        << QStringList{"ZEMWM_CLOSE=Ctrl+NoSuchKey@user"};
}

void TestHotkeysModel::merge()
{
    QFETCH(QByteArray, user);
    QFETCH(QByteArray, system);
    QFETCH(QStringList, rows);

    HotkeysModel model;
    QVERIFY(model.loadBytes("[ShortCutKeys]\n" + user, "[ShortCutKeys]\n" + system, true));
    QCOMPARE(listing(model), rows);
}

void TestHotkeysModel::writeBack_data()
{
    QTest::addColumn<QByteArray>("file");
    QTest::addColumn<QString>("edit"); // "key|ROW|KEY", "clear|ROW", "command|ROW|TEXT", "add||TEXT"
    QTest::addColumn<QByteArray>("written");

    // Keys and values the key server reads differently from how they were written.
    const QByteArray odd = "None|Super_L=ZEMWM_LOCK\nNone|Clear=ZEMWM_CLOSE\nNone|Select=ZEMWM_KILL\n"
                           "None|KP_Equal=ZEMWM_EXIT\nNone|odiaeresis=ZEMWM_REBOOT\nNone|mu=ZEMWM_SHUTDOWN\n"
                           "|=\"bar\"\nNone|;|F7=\"semi\"\nCtrl|l=\"echo caf\xe9\"\n";
    QTest::newRow("untouched entries keep their bytes when another row changes")
        << QByteArray("[ShortCutKeys]\n" + odd) << "key|ZEMWM_DPMS_ON|Ctrl+Alt+D"
        << QByteArray(
               "[ShortCutKeys]\nNone|Clear=ZEMWM_CLOSE\nNone|Select=ZEMWM_KILL\nNone|Super_L=ZEMWM_LOCK\n"
               "None|KP_Equal=ZEMWM_EXIT\nNone|odiaeresis=ZEMWM_REBOOT\nNone|mu=ZEMWM_SHUTDOWN\n"
               "Ctrl|Alt|d=ZEMWM_DPMS_ON\nCtrl|l=\"echo caf\xe9\"\nNone|;|F7=\"semi\"\n|=\"bar\"\n");
    QTest::newRow("what is not shown stays: comments, unknown functions, other sections")
        << QByteArray("; mine\n[ShortCutKeys]\r\n# close it\r\n Alt|F4 = ZEMWM_CLOSE "
                      "\r\nAlt|n=ZEMWM_NEWER\nAlt|b=ZEMWM_BETA\n"
                      "[Other]\nx=y\n; tail\n")
        << "key|ZEMWM_LOCK|Ctrl+L"
        << QByteArray("; mine\n[ShortCutKeys]\r\n# close it\r\n Alt|F4 = ZEMWM_CLOSE \r\nCtrl|l=ZEMWM_LOCK\n"
                      "Alt|n=ZEMWM_NEWER\nAlt|b=ZEMWM_BETA\n[Other]\nx=y\n; tail\n");
    QTest::newRow("a shown binding takes the key of an unknown function")
        << QByteArray("[ShortCutKeys]\nAlt|n=ZEMWM_NEWER\n") << "key|ZEMWM_LOCK|Alt+N"
        << QByteArray("[ShortCutKeys]\nAlt|n=ZEMWM_LOCK\n");
    QTest::newRow("a new key keeps the value's bytes")
        << QByteArray("[ShortCutKeys]\nCtrl|l=\"echo caf\xe9\"\n") << "key|cmd:echo caf\xef\xbf\xbd|Ctrl+E"
        << QByteArray("[ShortCutKeys]\nCtrl|e=\"echo caf\xe9\"\n");
    QTest::newRow("a new command keeps the key's bytes and the comment above")
        << QByteArray("[ShortCutKeys]\n; calc\nAlt|XF86Calculator=\"calc-a\"\n")
        << "command|cmd:calc-a|calc-b"
        << QByteArray("[ShortCutKeys]\n; calc\nAlt|XF86Calculator=\"calc-b\"\n");
    QTest::newRow("clearing a system key disables it in the system file's spelling")
        << QByteArray("[ShortCutKeys]\n") << "clear|ZEMWM_CLOSE"
        << QByteArray("[ShortCutKeys]\nALT|f4=\"Disable\"\n");
    QTest::newRow("a file the editor wrote is written the same")
        << QByteArray("[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\nCtrl|Alt|t=\"xterm\"\nNone|None0=\"xclock\"\n"
                      "Ctrl|q=\"Disable\"\n")
        << "key|ZEMWM_LOCK|Ctrl+L"
        << QByteArray("[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\nCtrl|l=ZEMWM_LOCK\nCtrl|Alt|t=\"xterm\"\n"
                      "None|None0=\"xclock\"\nCtrl|q=\"Disable\"\n");
    QTest::newRow("a keyless command gets a placeholder no other entry has")
        << QByteArray("[ShortCutKeys]\nNone|None0=\"xterm\"\n") << "add||xclock"
        << QByteArray("[ShortCutKeys]\nNone|None0=\"xterm\"\nNone|None1=\"xclock\"\n");
    QTest::newRow("an unclosed quote is kept")
        << QByteArray("[ShortCutKeys]\nSuper|t=\"xterm\n") << "key|cmd:\"xterm|Meta+X"
        << QByteArray("[ShortCutKeys]\nSuper|x=\"xterm\n");
    QTest::newRow("a system row given a new key switches its old key off")
        << QByteArray("[ShortCutKeys]\n") << "key|ZEMWM_CLOSE|Alt+F9"
        << QByteArray("[ShortCutKeys]\nAlt|F9=ZEMWM_CLOSE\nALT|f4=\"Disable\"\n");
    QTest::newRow("a freed key keeps the system binding it hid switched off")
        << QByteArray("[ShortCutKeys]\nAlt|F4=ZEMWM_LOCK\n") << "clear|ZEMWM_LOCK"
        << QByteArray("[ShortCutKeys]\nAlt|F4=\"Disable\"\n");
    QTest::newRow("reassign: the key moves, the old holder is left without one")
        << QByteArray("[ShortCutKeys]\nAlt|F5=ZEMWM_LOCK\n") << "reassign|ZEMWM_CLOSE|ZEMWM_LOCK"
        << QByteArray("[ShortCutKeys]\nAlt|F4=ZEMWM_LOCK\n");
    QTest::newRow("revert: the system's rows, their keys no longer disabled")
        << QByteArray("[ShortCutKeys]\nAlt|F9=ZEMWM_CLOSE\nAlt|F4=Disable\n") << "revert|ZEMWM_CLOSE"
        << QByteArray("[ShortCutKeys]\n");
    QTest::newRow("a multi-key sequence is written with its first key")
        << QByteArray("[ShortCutKeys]\n") << "key|ZEMWM_LOCK|Ctrl+A, B"
        << QByteArray("[ShortCutKeys]\nCtrl|a=ZEMWM_LOCK\n");
}

void TestHotkeysModel::writeBack()
{
    QFETCH(QByteArray, file);
    QFETCH(QString, edit);
    QFETCH(QByteArray, written);

    HotkeysModel model;
    // The system file binds Alt+F4 in its own spelling.
    QVERIFY(model.loadBytes(file, "[ShortCutKeys]\nALT|f4=ZEMWM_CLOSE\n", true));
    const QStringList words = edit.split(QLatin1Char('|'));
    const BindingId id =
        words.first() == QLatin1String("add") ? model.addCommand(words.at(2)) : rowOf(model, words.at(1));
    const QString rest = words.value(2);
    if (words.first() == QLatin1String("key"))
        model.setKey(id, rest);
    else if (words.first() == QLatin1String("clear"))
        model.clearKey(id);
    else if (words.first() == QLatin1String("command"))
        model.setCommand(id, rest);
    else if (words.first() == QLatin1String("reassign"))
        model.reassign(id, rowOf(model, rest));
    else if (words.first() == QLatin1String("revert"))
        QCOMPARE(model.revertToSystem(model.find(id)->function), QStringList());
    QVERIFY2(id, "no such row");

    QByteArray bytes;
    QString reason;
    QVERIFY2(model.toBytes(true, &bytes, &reason), qPrintable(reason));
    QCOMPARE(bytes, written);

    // What was written reads back as the same bindings (a multi-key sequence as its first key).
    if (rest.contains(QLatin1Char(',')))
        return;
    HotkeysModel again;
    QVERIFY(again.loadBytes(bytes, "[ShortCutKeys]\nALT|f4=ZEMWM_CLOSE\n", true));
    QCOMPARE(listing(again), listing(model));
}

void TestHotkeysModel::holder_data()
{
    QTest::addColumn<QByteArray>("file");
    QTest::addColumn<QString>("key");
    QTest::addColumn<QString>("holder");

    QTest::newRow("same stored key in other letter case")
        << QByteArray("ctrl|alt|t=ZEMWM_CLOSE\n") << "Ctrl+Alt+T"
        << "ZEMWM_CLOSE";
    QTest::newRow("the same file key read in another form")
        << QByteArray("Alt|XF86Calculator=\"calc-a\"\n") << "Alt+Calculator"
        << "cmd:calc-a";
    QTest::newRow("a multi-key sequence is held by its first key")
        << QByteArray("Ctrl|a=ZEMWM_CLOSE\n") << "Ctrl+A, B"
        << "ZEMWM_CLOSE";
}

void TestHotkeysModel::holder()
{
    QFETCH(QByteArray, file);
    QFETCH(QString, key);
    QFETCH(QString, holder);

    HotkeysModel model;
    QVERIFY(model.loadBytes("[ShortCutKeys]\n" + file, QByteArray(), false));
    QCOMPARE(model.holderOf(key), holder.isEmpty() ? 0 : rowOf(model, holder));
    // A row never conflicts with itself.
    if (!holder.isEmpty())
        QCOMPARE(model.holderOf(key, rowOf(model, holder)), BindingId(0));
}

QTEST_GUILESS_MAIN(TestHotkeysModel)
#include "tst_hotkeysmodel.moc"
