// The command dialog and the desktop-menu chooser behind it.
#include "modalanswerer.h"
#include "selectcommanddialog.h"

#include "testenvironment.h"
#include "zemmenudialog.h"
#include <QDialogButtonBox>
#include <QPushButton>

#include <QToolButton>
#include <QtTest>

using Answers = QList<QMessageBox::StandardButton>;
Q_DECLARE_METATYPE(Answers)

class TestDialogs : public QObject
{
    Q_OBJECT

private slots:
    void typedCommand_data();
    void typedCommand();
    void executableLoop_data();
    void executableLoop();
    void desktopEntries();

private:
    QTemporaryDir scratch;
};

void TestDialogs::typedCommand_data()
{
    QTest::addColumn<QString>("typed");
    QTest::addColumn<QString>("command"); // what OK gives; empty: refused, the dialog stays open
    QTest::newRow("blanks are simplified") << "  xterm   -e top "
                                           << "xterm -e top";
    QTest::newRow("empty") << "   "
                           << "";
    QTest::newRow("a tab is refused, not folded into a blank") << "xterm\t-e top"
                                                               << "";
}

void TestDialogs::typedCommand()
{
    QFETCH(QString, typed);
    QFETCH(QString, command);
    SelectCommandDialog dialog(nullptr);
    dialog.setCommand(typed);
    dialog.show();
    ModalAnswerer answerer({QMessageBox::Ok});
    QMetaObject::invokeMethod(dialog.findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok), "click");
    QCOMPARE(dialog.result() == QDialog::Accepted, !command.isEmpty());
    QCOMPARE(answerer.titles(), command.isEmpty() ? QStringList{"Attention"} : QStringList());
    QCOMPARE(dialog.command(), command.isEmpty() ? typed : command);
}

void TestDialogs::executableLoop_data()
{
    QTest::addColumn<QStringList>("choices"); // files chosen in turn, below the scratch dir
    QTest::addColumn<Answers>("answers");
    QTest::addColumn<QStringList>("boxes");
    QTest::addColumn<QString>("command"); // below the scratch dir; empty: unchanged

    QTest::newRow("a directory is no program")
        << QStringList{"bin"} << Answers{QMessageBox::Cancel} << QStringList{"File isn't executable"} << "";
    QTest::newRow("missing, then another choice")
        << QStringList{"no-such-program", "bin/tool"} << Answers{QMessageBox::Yes}
        << QStringList{"File doesn't exist"} << "bin/tool";
    QTest::newRow("a link is resolved")
        << QStringList{"links/tool link"} << Answers{} << QStringList() << "bin/tool";
}

void TestDialogs::executableLoop()
{
    QFETCH(QStringList, choices);
    QFETCH(Answers, answers);
    QFETCH(QStringList, boxes);
    QFETCH(QString, command);

    const QDir dir(scratch.path());
    QVERIFY(writeFile(dir.filePath("bin/tool"), "#!/bin/sh\n"));
    QVERIFY(QFile::setPermissions(dir.filePath("bin/tool"), QFileDevice::ReadOwner | QFileDevice::ExeOwner));
    QDir().mkpath(dir.filePath("links"));
    QFile::link(dir.filePath("bin/tool"), dir.filePath("links/tool link"));
    for (QString& choice : choices)
        choice = dir.filePath(choice);

    SelectCommandDialog dialog(nullptr);
    dialog.setCommand(QStringLiteral("before"));
    ModalAnswerer answerer(answers, choices);
    QMetaObject::invokeMethod(dialog.findChild<QToolButton*>("selectCommandFileButton"), "click");
    QCOMPARE(answerer.titles(), boxes);
    QCOMPARE(dialog.command(), command.isEmpty() ? QStringLiteral("before")
                                                 : QFileInfo(dir.filePath(command)).canonicalFilePath());
}

void TestDialogs::desktopEntries()
{
    const QString home = scratch.filePath(QStringLiteral("home"));
    const QString first = scratch.filePath(QStringLiteral("usr local"));
    const QString second = scratch.filePath(QStringLiteral("usr"));
    qputenv("XDG_DATA_HOME", QFile::encodeName(home));
    qputenv("XDG_DATA_DIRS", QFile::encodeName(first + QLatin1Char(':') + second));
    const QByteArray app = "[Desktop Entry]\nType=Application\n";
    const QList<std::pair<QString, QByteArray>> entries = {
        {second + "/applications/editor.desktop",
         app + "Name=Text Editor\nExec=edit %F\nCategories=Utility;\n"},
        {second + "/applications/hidden.desktop", app + "Name=Hidden\nExec=hidden\nHidden=true\n"},
        {second + "/applications/nodisplay.desktop", app + "Name=No Display\nExec=x\nNoDisplay=true\n"},
        {second + "/applications/link.desktop", "[Desktop Entry]\nType=Link\nName=A Link\n"},
        {second + "/applications/dup.desktop", app + "Name=System Duplicate\nExec=dup\n"},
        {home + "/applications/dup.desktop", app + "Name=Home Duplicate\nExec=dup\n"},
        {first + "/applications/gone.desktop", app + "Name=Gone\nExec=gone\nHidden=true\n"},
        {second + "/applications/gone.desktop", app + "Name=Should Stay Gone\nExec=gone\n"},
        {second + "/applications/binary.desktop", app + "Name=Bin" + QByteArray(1, '\0') + "ary\nExec=b\n"},
        {second + "/applications/huge.desktop",
         app + "Name=Huge\nExec=h\nComment=" + QByteArray(400 * 1024, 'x') + "\n"},
        {second + "/applications/vendor/tool.desktop", app + "Name=Vendor Tool\nExec=tool\n"},
    };
    for (const auto& [path, body] : entries)
        QVERIFY(writeFile(path, body));

    QStringList shown;
    for (const DesktopApplication& application : installedApplications())
        shown << application.id + QLatin1Char('=') + application.name;
    QCOMPARE(shown, (QStringList{"dup.desktop=Home Duplicate", "editor.desktop=Text Editor",
                                 "vendor-tool.desktop=Vendor Tool"}));
}

ZEM_TEST_MAIN(TestDialogs)
#include "tst_dialogs.moc"
