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
    QTest::newRow("one keysym in two spellings is one key; two keysyms are two")
        << QByteArray(
               "Ctrl|Prior=ZEMWM_CLOSE\nCtrl|Page_Up=ZEMWM_LOCK\nCtrl|KP_Equal=\"kp\"\nCtrl|equal=\"eq\"\n")
        << QByteArray()
        << QStringList{"ZEMWM_LOCK=Ctrl+PgUp@user", "cmd:eq=Ctrl+=@user", "cmd:kp=Ctrl+Num+=@user"};
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

    // Where a new line goes: among entries in the catalogue's order (functions, commands,
    // disabled keys), after the last of equal or lower rank; else after the last entry.
    const QByteArray ordered = "[ShortCutKeys]\nAlt|a=ZEMWM_TOGGLE_BORDER\n; left\nAlt|c=ZEMWM_LEFT\n"
                               "Alt|d=\"xterm\"\nAlt|n=ZEMWM_NEWER\nAlt|e=Disable\n";
    QTest::newRow("a new function goes after the last entry of equal or lower rank")
        << ordered << "key|ZEMWM_TOP|Alt+B"
        << QByteArray("[ShortCutKeys]\nAlt|a=ZEMWM_TOGGLE_BORDER\nAlt|b=ZEMWM_TOP\n; left\nAlt|c=ZEMWM_LEFT\n"
                      "Alt|d=\"xterm\"\nAlt|n=ZEMWM_NEWER\nAlt|e=Disable\n");
    QTest::newRow("a new command after the last command, unknown functions passed over")
        << ordered << "add||xclock"
        << QByteArray("[ShortCutKeys]\nAlt|a=ZEMWM_TOGGLE_BORDER\n; left\nAlt|c=ZEMWM_LEFT\n"
                      "Alt|d=\"xterm\"\nNone|None0=\"xclock\"\nAlt|n=ZEMWM_NEWER\nAlt|e=Disable\n");
    QTest::newRow("lower than every entry: right below the section's header")
        << QByteArray("; mine\n[ShortCutKeys]\n; left\nAlt|c=ZEMWM_LEFT\n") << "key|ZEMWM_TOGGLE_BORDER|Alt+A"
        << QByteArray("; mine\n[ShortCutKeys]\nAlt|a=ZEMWM_TOGGLE_BORDER\n; left\nAlt|c=ZEMWM_LEFT\n");
    QTest::newRow("out of order: after the last entry, before trailing comments and sections")
        << QByteArray("[ShortCutKeys]\nAlt|c=ZEMWM_LEFT\nAlt|a=ZEMWM_TOGGLE_BORDER\n; tail\n\n[Other]\nx=y\n")
        << "key|ZEMWM_TOP|Alt+B"
        << QByteArray(
               "[ShortCutKeys]\nAlt|c=ZEMWM_LEFT\nAlt|a=ZEMWM_TOGGLE_BORDER\nAlt|b=ZEMWM_TOP\n; tail\n\n"
               "[Other]\nx=y\n");
    QTest::newRow("a new line takes the line end of the line before it")
        << QByteArray("[ShortCutKeys]\r\nAlt|a=ZEMWM_TOGGLE_BORDER\r\n") << "key|ZEMWM_TOP|Alt+B"
        << QByteArray("[ShortCutKeys]\r\nAlt|a=ZEMWM_TOGGLE_BORDER\r\nAlt|b=ZEMWM_TOP\r\n");
    QTest::newRow("a missing final newline is added first")
        << QByteArray("\xEF\xBB\xBF[ShortCutKeys]\nAlt|a=ZEMWM_TOGGLE_BORDER") << "key|ZEMWM_TOP|Alt+B"
        << QByteArray("\xEF\xBB\xBF[ShortCutKeys]\nAlt|a=ZEMWM_TOGGLE_BORDER\nAlt|b=ZEMWM_TOP\n");
    // Lines of one key.
    QTest::newRow("an edit rewrites the line that counts in place and removes the others")
        << QByteArray("[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\n alt|f4 = ZEMWM_LOCK \nNone|F5=ZEMWM_EXIT\n"
                      "F5=ZEMWM_KILL\n")
        << "reassign|ZEMWM_LOCK|ZEMWM_TOP"
        << QByteArray("[ShortCutKeys]\n alt|f4 = ZEMWM_TOP \nNone|F5=ZEMWM_EXIT\nF5=ZEMWM_KILL\n");
    QTest::newRow("two spellings of one keysym go together")
        << QByteArray("[ShortCutKeys]\nCtrl|Prior=ZEMWM_TOP\nCtrl|Page_Up=ZEMWM_LEFT\n") << "clear|ZEMWM_LEFT"
        << QByteArray("[ShortCutKeys]\n");
    // What an edit keeps of its line.
    const QByteArray commented = "[ShortCutKeys]\n; terminal\nCtrl|Alt|u=\"xclock\"\r\nAlt|F5=ZEMWM_LOCK\n";
    QTest::newRow("a binding given a new key keeps its line, its place and its comment")
        << commented << "key|cmd:xclock|Ctrl+Alt+Y"
        << QByteArray("[ShortCutKeys]\n; terminal\nCtrl|Alt|y=\"xclock\"\r\nAlt|F5=ZEMWM_LOCK\n");
    QTest::newRow("a command left without a key keeps its line under a placeholder")
        << commented << "clear|cmd:xclock"
        << QByteArray("[ShortCutKeys]\n; terminal\nNone|None0=\"xclock\"\r\nAlt|F5=ZEMWM_LOCK\n");
    QTest::newRow("a new key keeps the value's bytes")
        << QByteArray("[ShortCutKeys]\nCtrl|l=\"echo caf\xe9\"\n") << "key|cmd:echo caf\xef\xbf\xbd|Ctrl+E"
        << QByteArray("[ShortCutKeys]\nCtrl|e=\"echo caf\xe9\"\n");
    QTest::newRow("a shown binding takes the key of an unknown function")
        << QByteArray("[ShortCutKeys]\nAlt|n=ZEMWM_NEWER\n") << "key|ZEMWM_LOCK|Alt+N"
        << QByteArray("[ShortCutKeys]\nAlt|n=ZEMWM_LOCK\n");
    QTest::newRow("a keyless command gets a placeholder no other entry has")
        << QByteArray("[ShortCutKeys]\nNone|None0=\"xclock\"\n") << "add||xclock"
        << QByteArray("[ShortCutKeys]\nNone|None0=\"xclock\"\nNone|None1=\"xclock\"\n");
    // The merged view's rules, written.
    QTest::newRow("clearing a system key disables it in the system file's spelling")
        << QByteArray("[ShortCutKeys]\n") << "clear|ZEMWM_CLOSE"
        << QByteArray("[ShortCutKeys]\nALT|f4=\"Disable\"\n");
    QTest::newRow("a system row given a new key switches its old key off")
        << QByteArray("[ShortCutKeys]\n") << "key|ZEMWM_CLOSE|Alt+F9"
        << QByteArray("[ShortCutKeys]\nAlt|F9=ZEMWM_CLOSE\nALT|f4=\"Disable\"\n");
    QTest::newRow("a freed key keeps the system binding it hid switched off")
        << QByteArray("[ShortCutKeys]\nAlt|F4=ZEMWM_LOCK\n") << "clear|ZEMWM_LOCK"
        << QByteArray("[ShortCutKeys]\nAlt|F4=\"Disable\"\n");
    QTest::newRow("reassign: the key moves with its spelling, the old holder is left without one")
        << QByteArray("[ShortCutKeys]\nAlt|F5=ZEMWM_LOCK\n") << "reassign|ZEMWM_CLOSE|ZEMWM_LOCK"
        << QByteArray("[ShortCutKeys]\nALT|f4=ZEMWM_LOCK\n");
    QTest::newRow("revert: the system's rows, their keys no longer disabled")
        << QByteArray("[ShortCutKeys]\nAlt|F9=ZEMWM_CLOSE\nAlt|F4=Disable\n") << "revert|ZEMWM_CLOSE"
        << QByteArray("[ShortCutKeys]\n");
    QTest::newRow("reassign, then revert: the key goes back to the row it was taken from")
        << QByteArray("[ShortCutKeys]\n") << "reassign|cmd:xterm|ZEMWM_CLOSE;revert|ZEMWM_CLOSE"
        << QByteArray("[ShortCutKeys]\n");
    QTest::newRow("revert a command row: the system's key, the user's switched back on")
        << QByteArray("[ShortCutKeys]\nCtrl|Alt|x=\"xterm\"\nCtrl|Alt|t=\"Disable\"\n") << "revert|cmd:xterm"
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
    // The system file binds Alt+F4 in its own spelling, and Ctrl+Alt+T to a command.
    QVERIFY(model.loadBytes(file, "[ShortCutKeys]\nALT|f4=ZEMWM_CLOSE\nCtrl|Alt|t=\"xterm\"\n", true));
    // Edits one after the other, separated by ";".
    for (const QString& step : edit.split(QLatin1Char(';'))) {
        const QStringList words = step.split(QLatin1Char('|'));
        const BindingId id =
            words.first() == QLatin1String("add") ? model.addCommand(words.at(2)) : rowOf(model, words.at(1));
        QVERIFY2(id, "no such row");
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
            QCOMPARE(model.revert(id), QStringList());
    }

    QByteArray bytes;
    QString reason;
    QVERIFY2(model.toBytes(true, &bytes, &reason), qPrintable(reason));
    QCOMPARE(bytes, written);
}

void TestHotkeysModel::holder_data()
{
    QTest::addColumn<QByteArray>("file");
    QTest::addColumn<QString>("key");
    QTest::addColumn<QString>("holder");

    QTest::newRow("the same file key read in another form")
        << QByteArray("Alt|XF86Calculator=\"calc-a\"\n") << "Alt+Calculator"
        << "cmd:calc-a";
    QTest::newRow("the keypad's = is not the other =")
        << QByteArray("Ctrl|KP_Equal=ZEMWM_CLOSE\n") << "Ctrl+="
        << "";
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
