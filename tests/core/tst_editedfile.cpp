// The edited file: no write ever replaces what another program wrote since the file was read,
// unless the user agreed to; the backup never writes through what stands under its name.
#include "editedfile.h"
#include "hotkeysfile.h"
#include "testfiles.h"

#include <QProcess>
#include <QSignalSpy>
#include <QTemporaryDir>
#include <QtTest>

class TestEditedFile : public QObject
{
    Q_OBJECT

private slots:
    void init();
    void changedOnDisk_data();
    void changedOnDisk();
    void saveWhileCommandLineWrites();
    void backupReplacesWhatStandsThere();

private:
    QTemporaryDir dir;
    QString user;
    QString system;
};

void TestEditedFile::init()
{
    qputenv("ZEM_USER_DIR", QFile::encodeName(dir.filePath(QStringLiteral("user"))));
    qputenv("ZEM_SYSTEM_DIR", QFile::encodeName(dir.filePath(QStringLiteral("system"))));
    user = userHotkeysFilePath();
    system = systemHotkeysFilePath();
    QVERIFY(QDir().mkpath(QFileInfo(system).path()));
    QVERIFY(writeFile(system, "[ShortCutKeys]\nAlt|F4=ZEMWM_CLOSE\n"));
    QVERIFY(writeFile(user, "[ShortCutKeys]\nAlt|F5=ZEMWM_LOCK\n"));
}

void TestEditedFile::changedOnDisk_data()
{
    QTest::addColumn<QString>("what"); // what another program does after the load
    QTest::addColumn<int>("change");   // EditedFile::Change seen and told
    QTest::newRow("nothing") << "" << int(EditedFile::Change::None);
    QTest::newRow("the user's file rewritten") << "user" << int(EditedFile::Change::EditedFile);
    QTest::newRow("the system file alone") << "system" << int(EditedFile::Change::SystemFile);
    QTest::newRow("the file removed: written anew, no question")
        << "remove" << int(EditedFile::Change::Vanished);
}

void TestEditedFile::changedOnDisk()
{
    QFETCH(QString, what);
    QFETCH(int, change);
    EditedFile file;
    QSignalSpy told(&file, &EditedFile::changedOnDisk);
    QVERIFY(file.load(user) && file.isMerged());
    const QByteArray theirs = "[ShortCutKeys]\nAlt|F6=ZEMWM_LOCK\n";
    if (what == QLatin1String("user") || what == QLatin1String("system"))
        QVERIFY(writeFile(what == QLatin1String("user") ? user : system, theirs));
    else if (what == QLatin1String("remove"))
        QVERIFY(QFile::remove(user));
    QCOMPARE(int(file.change()), change);
    if (change != int(EditedFile::Change::None))
        QTRY_COMPARE(told.size(), 1);

    // A save that would replace another program's change writes nothing until it is accepted.
    file.model().setKey(file.model().rowsOf(0).first().id, QStringLiteral("Ctrl+Alt+B"));
    const bool asks =
        change == int(EditedFile::Change::EditedFile) || change == int(EditedFile::Change::SystemFile);
    const QByteArray before = readFile(user);
    QCOMPARE(file.save() == EditedFile::SaveResult::Changed, asks);
    if (asks) {
        QCOMPARE(readFile(user), before);
        QCOMPARE(file.save(file.diskState()), EditedFile::SaveResult::Saved);
    }
    QVERIFY(readFile(user).contains("Ctrl|Alt|b=ZEMWM_"));
    QCOMPARE(file.change(), EditedFile::Change::None);
}

void TestEditedFile::saveWhileCommandLineWrites()
{
    // The editor's save and a zem-hotkeys set at the same moment: the command line's change is
    // always in the file, and the editor's too unless its save found the file changed.
    for (int round = 1; round <= 12; ++round) {
        QVERIFY(writeFile(user, "[ShortCutKeys]\nAlt|F5=ZEMWM_LOCK\n"));
        EditedFile file;
        QVERIFY(file.load(user));
        file.model().setKey(file.model().rowsOf(0).first().id, QStringLiteral("Ctrl+Shift+F%1").arg(round));
        QProcess writer;
        writer.start(
            QStringLiteral(ZEM_CLI_BINARY),
            {QStringLiteral("set"), QStringLiteral("Ctrl+Alt+F%1").arg(round), QStringLiteral("xclock")});
        QVERIFY(writer.waitForStarted());
        // Before, while and after the command line reads and writes.
        QThread::msleep(ulong(round % 4) * 12);
        const EditedFile::SaveResult saved = file.save();
        QVERIFY(writer.waitForFinished(10000));
        QVERIFY2(writer.exitCode() == 0, writer.readAllStandardError());
        const QByteArray bytes = readFile(user);
        QVERIFY2(bytes.contains(QStringLiteral("Ctrl|Alt|F%1=\"xclock\"").arg(round).toLatin1()), bytes);
        QCOMPARE(bytes.contains(QStringLiteral("Ctrl|Shift|F%1=ZEMWM_").arg(round).toLatin1()),
                 saved == EditedFile::SaveResult::Saved);
        QVERIFY(saved != EditedFile::SaveResult::Failed);
    }
}

void TestEditedFile::backupReplacesWhatStandsThere()
{
    // Another account's link under the backup's name is replaced, never written through, and
    // the backup is as private as the file it keeps.
    const QString victim = dir.filePath(QStringLiteral("victim"));
    QVERIFY(writeFile(victim, "theirs") && QFile::link(victim, user + QLatin1Char('~')));
    QVERIFY(QFile::setPermissions(user, QFile::ReadOwner | QFile::WriteOwner));
    EditedFile file;
    QVERIFY2(file.keepBackup(user), qPrintable(file.error()));
    QCOMPARE(readFile(user + QLatin1Char('~')), readFile(user));
    QVERIFY(!QFileInfo(user + QLatin1Char('~')).isSymLink());
    QCOMPARE(QFile::permissions(user + QLatin1Char('~')) & 0x0077, QFile::Permissions());
    QCOMPARE(readFile(victim), QByteArray("theirs"));
}

QTEST_GUILESS_MAIN(TestEditedFile)
#include "tst_editedfile.moc"
